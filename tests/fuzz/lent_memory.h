#ifndef TESTS_FUZZ_LENT_MEMORY_H_
#define TESTS_FUZZ_LENT_MEMORY_H_

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

// Memory that is lent to the library for a while, exact to the byte at both ends: what lies around
// it, and the memory itself once it was taken back, is poisoned for the sanitizers, until a ring of
// kLentRoom bytes has come round: some hundred calls later. A heap under the sanitizers does the
// same at ten times the cost.

namespace gateway_fuzz {

inline constexpr size_t kLentRoom = size_t{1} << 18;

// The longest input that a target takes. A host and its texts need a fraction of the ring then.
inline constexpr size_t kMaxInput = size_t{1} << 14;

// A block of the ring of `size` bytes, whose value is that of memory nobody wrote to.
char* Lend(size_t size);

// A block that holds `text` and its terminator.
char* LendText(std::string_view text);

// Takes a block back: nobody may touch its `size` bytes from now on.
void TakeBack(char* block, size_t size);

// Keeps `size` bytes, a multiple of 8, at `place` from being touched as long as the program runs.
void Forbid(void* place, size_t size);

// The eight bytes at `at`.
inline uint64_t WordAt(const char* at) {
  uint64_t word;
  std::memcpy(&word, at, sizeof word);
  return word;
}

// Whether two texts are equal. The fuzzer listens to every memcmp, which costs more than it tells.
inline bool SameText(std::string_view one, std::string_view other) {
  if (one.size() != other.size()) return false;
  size_t at = 0;
  for (; one.size() - at >= sizeof(uint64_t); at += sizeof(uint64_t)) {
    if (WordAt(one.data() + at) != WordAt(other.data() + at)) return false;
  }
  for (; at < one.size(); ++at) {
    if (one[at] != other[at]) return false;
  }
  return true;
}

// A lent block that is taken back at the end of its scope.
class CLent {
 public:
  // `size` bytes of no value, as a buffer that was used before holds them.
  explicit CLent(size_t size);
  // A copy of `text`, with its terminator or without.
  enum class End { kTerminated, kBare };
  explicit CLent(std::string_view text, End end = End::kTerminated);
  CLent(const CLent&) = delete;
  CLent& operator=(const CLent&) = delete;
  ~CLent() { TakeBack(m_pData, m_nSize); }

  char* get() const { return m_pData; }

 private:
  size_t m_nSize;
  char* m_pData;
};

}  // namespace gateway_fuzz

#endif  // TESTS_FUZZ_LENT_MEMORY_H_
