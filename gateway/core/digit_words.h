// Digits handled several at a time: read and written as the bytes of one word, the first character
// in the lowest byte (every ABI is little-endian). What they mean is in decimal.h; the tests hold
// them against the C library.
#ifndef QUORVANE_GATEWAY_CORE_DIGIT_WORDS_H_
#define QUORVANE_GATEWAY_CORE_DIGIT_WORDS_H_

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

inline constexpr uint32_t kFourZeros = 0x30303030;
inline constexpr uint64_t kEightZeros = 0x3030303030303030;

// Four to eight characters: two moves meet or overlap, and join to the same.
inline uint64_t LoadWord(std::string_view text) {
  uint32_t head, tail;
  memcpy(&head, text.data(), 4);
  memcpy(&tail, text.data() + text.size() - 4, 4);
  return head | uint64_t{tail} << 8 * (text.size() - 4);
}

// Moves the `count` >= 1 characters of a word to its end, behind zeros.
constexpr uint64_t AlignRight(uint64_t word, size_t count) {
  const size_t missing = 8 * (8 - count);
  return word << missing | (((uint64_t{1} << missing) - 1) & kEightZeros);
}

// The top bit of each byte that is `c`.
constexpr uint64_t BytesEqual(uint64_t word, char c) {
  constexpr uint64_t kOnes = 0x0101010101010101;
  constexpr uint64_t kLowBits = 0x7f * kOnes;
  word ^= static_cast<unsigned char>(c) * kOnes;
  return ~(((word & kLowBits) + kLowBits) | word | kLowBits);
}

// Whether all eight characters are digits, and the number that they read as then.
constexpr bool AreEightDigits(uint64_t word) {
  constexpr uint64_t kHigh = 0xf0f0f0f0f0f0f0f0;
  return ((word & kHigh) | ((word + 0x0606060606060606) & kHigh) >> 4) == 0x3333333333333333;
}
constexpr uint32_t ValueOfEightDigits(uint64_t word) {
  word -= kEightZeros;
  word = word * 10 + (word >> 8);
  return static_cast<uint32_t>(((word & 0x000000ff000000ff) * 0x000f424000000064 +
                                (word >> 16 & 0x000000ff000000ff) * 0x0000271000000001) >>
                               32);
}

// The same for words of four characters.
constexpr uint32_t AlignRight(uint32_t word, size_t count) {
  const size_t missing = 8 * (4 - count);
  return word << missing | (((uint32_t{1} << missing) - 1) & kFourZeros);
}
constexpr bool AreFourDigits(uint32_t word) {
  constexpr uint32_t kHigh = 0xf0f0f0f0;
  return ((word & kHigh) | ((word + 0x06060606) & kHigh) >> 4) == 0x33333333;
}
constexpr uint32_t ValueOfFourDigits(uint32_t word) {
  word -= kFourZeros;
  word = word * 10 + (word >> 8);
  return (word & 0xff) * 100 + (word >> 16 & 0xff);
}

// "00" to "99", so that digits are written two at a time.
inline constexpr char kDigitPairs[] =
    "0001020304050607080910111213141516171819202122232425262728293031323334353637383940414243444546"
    "4748495051525354555657585960616263646566676869707172737475767778798081828384858687888990919293"
    "949596979899";

inline void WriteDigitPair(char* at, uint32_t value) {
  memcpy(at, kDigitPairs + size_t{2} * value, 2);
}

// The eight digits of a value below 10^8: halves, pairs and digits are parted side by side.
constexpr uint64_t EightDigits(uint32_t value) {
  const uint64_t halves = value / 10000 | uint64_t{value % 10000} << 32;
  const uint64_t hundreds = (halves * 10486 >> 20) & 0x0000007f0000007f;  // halves / 100
  const uint64_t pairs = hundreds | (halves - 100 * hundreds) << 16;
  const uint64_t tens = (pairs * 103 >> 10) & 0x000f000f000f000f;  // pairs / 10
  return tens | (pairs - 10 * tens) << 8 | kEightZeros;
}
inline void WriteEightDigits(char* at, uint32_t value) {
  const uint64_t digits = EightDigits(value);
  memcpy(at, &digits, sizeof digits);
}

inline constexpr uint32_t kShortNumberEnd = 10000;

// The digits of a number below kShortNumberEnd with no zeros before them, made without a branch
// that would depend on their count.
struct ShortDigits {
  explicit ShortDigits(uint32_t value) {
    const uint32_t hundreds = value * 5243 >> 19;  // value / 100
    uint16_t head, tail;
    memcpy(&head, kDigitPairs + size_t{2} * hundreds, 2);
    memcpy(&tail, kDigitPairs + size_t{2} * (value - 100 * hundreds), 2);
    const uint32_t digits = head | static_cast<uint32_t>(tail) << 16;
    const auto zeros = static_cast<unsigned>(__builtin_ctz((digits ^ kFourZeros) | 1U << 24)) & 24;
    chars = digits >> zeros;
    count = 4 - zeros / 8;
  }

  // Touches four bytes; returns the place behind the digits.
  char* WriteTo(char* at) const {
    memcpy(at, &chars, sizeof chars);
    return at + count;
  }

  uint32_t chars;  // the first in the lowest byte
  uint32_t count;
};

#endif  // QUORVANE_GATEWAY_CORE_DIGIT_WORDS_H_
