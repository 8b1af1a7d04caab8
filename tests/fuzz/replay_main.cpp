// Runs a fuzz target without a fuzzer:
//
//   REPLAY FILE-OR-FOLDER...   each file once
//
// Ends with the number of executions of each row; fails when files were given and some row had
// none. Uses no more of the C++ library than its headers hold: the memory sanitizer sees only what
// was compiled for it, which the standard library was not.

#include <cstdint>
#include <cstdio>

#include "tests/fuzz/execution_counts.h"
#include "tests/fuzz/input_files.h"

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv);
extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size);

int main(int argc, char** argv) {
  using namespace gateway_fuzz;
  LLVMFuzzerInitialize(&argc, &argv);
  std::vector<Bytes> inputs;
  bool good = true;
  for (int i = 1; i < argc; ++i) good = ReadInputs(argv[i], inputs) && good;
  for (const Bytes& input : inputs) LLVMFuzzerTestOneInput(input.data(), input.size());
  const bool all = PrintCounts(FuzzRows());
  if (!all && argc > 1) std::fputs("not all rows were executed\n", stderr);
  return good && (all || argc == 1) ? 0 : 1;
}
