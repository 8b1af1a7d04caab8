#include "jni/modified_utf8.h"

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace {

constexpr uint64_t kTopBits = 0x8080808080808080U;

template <class Word>
Word WordAt(const char* at) {
  Word word;
  memcpy(&word, at, sizeof word);
  return word;
}

// The next byte above ASCII, or the end. A byte at a time an order takes twice the instructions of
// the library and a list a fifth more; a word at a time an order still takes 13 % more.
char* SkipAscii(char* at, const char* end) {
  constexpr ptrdiff_t kWord = sizeof(uint64_t);
  const auto word = [&at](ptrdiff_t i) { return WordAt<uint64_t>(at + i * kWord); };
  for (; end - at >= 8 * kWord; at += 8 * kWord) {
    const uint64_t all =
        word(0) | word(1) | word(2) | word(3) | word(4) | word(5) | word(6) | word(7);
    if ((all & kTopBits) != 0) break;
  }
  while (end - at >= kWord) {
    const uint64_t high = word(0) & kTopBits;
    if (high != 0) return at + __builtin_ctzll(high) / 8;
    at += kWord;
  }
  while (at != end && static_cast<uint8_t>(*at) < 0x80) ++at;
  return at;
}

// The usual case, a Chinese character, at one look: without it lists that show Chinese take 7 to
// 24 % more instructions.
bool IsOfThree(const char* at, const char* end) {
  return end - at >= 4 && (WordAt<uint32_t>(at) & 0xC0C0F0U) == 0x8080E0U;
}

// Bytes of the sequence above ASCII that begins at `at`, 0 where none does. A terminator continues
// none.
size_t SequenceSize(const char* at) {
  const auto lead = static_cast<uint8_t>(*at);
  if (lead < 0xC0 || lead >= 0xF8) return 0;
  const size_t size = lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
  for (size_t i = 1; i < size; ++i) {
    if ((static_cast<uint8_t>(at[i]) & 0xC0) != 0x80) return 0;
  }
  return size;
}

}  // namespace

void MendModifiedUtf8(char* text) {
  const char* const end = text + strlen(text);
  while ((text = SkipAscii(text, end)) != end) {
    if (IsOfThree(text, end)) {
      do text += 3;
      while (IsOfThree(text, end));
    } else if (const size_t size = SequenceSize(text); size > 0) {
      text += size;
    } else {
      *text++ = '?';
    }
  }
}
