// A target for the test of the driver: the input "dies" ends the process, "hangs" holds it, any
// other does nothing. The mutator leaves inputs as they are.

#include <unistd.h>

#include <cstdlib>
#include <cstring>
#include <string_view>

#include "tests/fuzz/fuzz_call.h"

namespace gateway_fuzz {

Rows FuzzRows() {
  static constexpr gateway_tests::Export kSample = {"Sample", "", "", nullptr, 0};
  return {&kSample, 1};
}

}  // namespace gateway_fuzz

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  const std::string_view input(reinterpret_cast<const char*>(data), size);
  if (input == "dies") std::abort();
  while (input == "hangs") pause();
  return 0;
}

extern "C" size_t LLVMFuzzerCustomMutator(uint8_t*, size_t size, size_t, unsigned) {
  return size;
}

extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t* data1, size_t size1, const uint8_t*,
                                            size_t, uint8_t* out, size_t maxSize, unsigned) {
  if (size1 > maxSize) return 0;
  std::memcpy(out, data1, size1);
  return size1;
}
