// Runs a fuzz target without a fuzzer:
//
//   REPLAY FILE-OR-FOLDER...                  each file once
//   REPLAY --mutate SECONDS SEED FOLDER...    each file once, then mutations of them for a while
//
// Ends with the number of executions of each row; fails when files were given and some row had
// none. Uses no more of the C++ library than its headers hold: the memory sanitizer sees only what
// was compiled for it, which the standard library and the fuzzer's own code were not.

#include <dirent.h>
#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <string>
#include <vector>

#include "tests/fuzz/execution_counts.h"

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv);
extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size);
extern "C" size_t LLVMFuzzerCustomMutator(uint8_t* data, size_t size, size_t maxSize,
                                          unsigned seed);
extern "C" size_t LLVMFuzzerCustomCrossOver(const uint8_t* data1, size_t size1,
                                            const uint8_t* data2, size_t size2, uint8_t* out,
                                            size_t maxSize, unsigned seed);

namespace {

using Bytes = std::vector<uint8_t>;

constexpr size_t kMaxSize = 6000;

uint32_t s_nRandom = 1;

size_t Below(size_t bound) {
  s_nRandom = s_nRandom * 1664525 + 1013904223;
  return (s_nRandom >> 8) % bound;
}

bool ReadFile(const std::string& path, std::vector<Bytes>& inputs) {
  FILE* const file = std::fopen(path.c_str(), "rb");
  if (file == nullptr) {
    std::perror(path.c_str());
    return false;
  }
  Bytes bytes(1 << 20);
  bytes.resize(std::fread(bytes.data(), 1, bytes.size(), file));
  bytes.shrink_to_fit();  // a read behind the input is seen
  std::fclose(file);
  inputs.push_back(bytes);
  return true;
}

bool ReadAll(const char* path, std::vector<Bytes>& inputs) {
  DIR* const folder = opendir(path);
  if (folder == nullptr) return ReadFile(path, inputs);
  bool good = true;
  while (const dirent* const entry = readdir(folder)) {
    if (entry->d_name[0] == '.') continue;
    good = ReadFile(std::string(path) + "/" + entry->d_name, inputs) && good;
  }
  closedir(folder);
  return good;
}

void Play(const Bytes& input) {
  LLVMFuzzerTestOneInput(input.data(), input.size());
}

// The file that always holds the input that is being played: where to find what broke.
class CLastInput {
 public:
  explicit CLastInput(const char* path)
      : m_nFile(path == nullptr ? -1 : open(path, O_WRONLY | O_CREAT | O_TRUNC, 0666)) {}

  void Keep(const Bytes& input) const {
    if (m_nFile < 0) return;
    if (pwrite(m_nFile, input.data(), input.size(), 0) < 0 ||
        ftruncate(m_nFile, static_cast<off_t>(input.size())) != 0) {
      std::perror("the last input");
    }
  }

 private:
  int m_nFile;
};

// The clock of the wall; `time` is stopped by the targets.
std::time_t Now() {
  std::timespec now{};
  clock_gettime(CLOCK_MONOTONIC, &now);
  return now.tv_sec;
}

void PlayMutations(std::vector<Bytes>& inputs, int seconds) {
  const CLastInput last(std::getenv("QUORVANE_FUZZ_INPUT"));
  const std::time_t end = Now() + seconds;
  while (Now() < end) {
    Bytes bytes(kMaxSize);
    const Bytes& parent = inputs[Below(inputs.size())];
    size_t size = std::min(parent.size(), kMaxSize);
    std::copy(parent.begin(), parent.begin() + static_cast<std::ptrdiff_t>(size), bytes.begin());
    if (Below(8) == 0) {
      const Bytes& other = inputs[Below(inputs.size())];
      Bytes child(kMaxSize);
      size = LLVMFuzzerCustomCrossOver(bytes.data(), size, other.data(), other.size(), child.data(),
                                       kMaxSize, s_nRandom);
      bytes.swap(child);
    }
    size = LLVMFuzzerCustomMutator(bytes.data(), size, kMaxSize, s_nRandom);
    bytes.resize(size);
    bytes.shrink_to_fit();
    last.Keep(bytes);
    Play(bytes);
    // What came out well is a parent too, in place of another.
    if (Below(16) == 0) inputs[Below(inputs.size())] = bytes;
  }
}

}  // namespace

// Stands in for the fuzzer's own mutations.
extern "C" size_t LLVMFuzzerMutate(uint8_t* data, size_t size, size_t maxSize) {
  const size_t at = Below(size + 1);
  if (Below(3) == 0 && size < maxSize) {
    std::memmove(data + at + 1, data + at, size - at);
    data[at] = static_cast<uint8_t>(Below(256));
    return size + 1;
  }
  if (at == size) return size;
  if (Below(2) == 0) {
    std::memmove(data + at, data + at + 1, size - at - 1);
    return size - 1;
  }
  data[at] = static_cast<uint8_t>(Below(256));
  return size;
}

int main(int argc, char** argv) {
  LLVMFuzzerInitialize(&argc, &argv);
  const bool mutates = argc > 4 && std::strcmp(argv[1], "--mutate") == 0;
  std::vector<Bytes> inputs;
  bool good = true;
  for (int i = mutates ? 4 : 1; i < argc; ++i) good = ReadAll(argv[i], inputs) && good;
  for (const Bytes& input : inputs) Play(input);
  if (mutates && !inputs.empty()) {
    s_nRandom = static_cast<uint32_t>(std::atoi(argv[3]));
    PlayMutations(inputs, std::atoi(argv[2]));
  }
  const bool all = gateway_fuzz::PrintCounts(gateway_fuzz::FuzzRows());
  if (!all && argc > 1) std::fputs("not all rows were executed\n", stderr);
  return good && (all || argc == 1) ? 0 : 1;
}
