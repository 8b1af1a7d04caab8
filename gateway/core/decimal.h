// Decimal numbers in wire texts, read and written alike on every ABI (`long` and `char` differ).
#ifndef QUORVANE_GATEWAY_CORE_DECIMAL_H_
#define QUORVANE_GATEWAY_CORE_DECIMAL_H_

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <type_traits>

#include "gateway/core/branch_hints.h"
#include "gateway/core/digit_words.h"

// Reads a number as C's `atoll` does: blanks, a sign, digits up to the first other character.
// Saturates at the 64-bit limits; a text without digits is 0.
int64_t ReadInt64(std::string_view text);

// As ReadInt64, then narrowed to 32 bits by wrapping: what `atoi` gives where `long` has 64 bits.
// Up to eight digits are read without a branch that would depend on their values, and none but a
// few on their count.
inline int32_t ReadInt32(std::string_view text) {
  const size_t size = text.size();
  if (size - 4 <= 4) {
    const uint64_t word = AlignRight(LoadWord(text), size);
    if (Mostly(AreEightDigits(word))) return static_cast<int32_t>(ValueOfEightDigits(word));
  } else if (size - 1 < 3) {
    static constexpr uint8_t kWeights[][2] = {{0, 0}, {10, 0}, {100, 10}};
    const auto digit = [text](size_t i) {
      return static_cast<unsigned char>(text[i]) - uint32_t{'0'};
    };
    const uint32_t first = digit(0), middle = digit(size / 2), last = digit(size - 1);
    if (Mostly((first <= 9) & (middle <= 9) & (last <= 9))) {
      const uint8_t(&weights)[2] = kWeights[size - 1];
      return static_cast<int32_t>(first * weights[0] + middle * weights[1] + last);
    }
  }
  return static_cast<int32_t>(static_cast<uint32_t>(static_cast<uint64_t>(ReadInt64(text))));
}

constexpr uint64_t PowerOfTen(size_t exponent) {
  return exponent == 0 ? 1 : 10 * PowerOfTen(exponent - 1);
}

// 10 to the power `exponent`, saturated at the type's maximum; 0 for a negative exponent.
int32_t PowerOfTen32(int exponent);
int64_t PowerOfTen64(int exponent);

// Two's complement arithmetic that wraps instead of overflowing.
inline int32_t WrapAdd(int32_t a, int32_t b) {
  return static_cast<int32_t>(static_cast<uint32_t>(a) + static_cast<uint32_t>(b));
}
inline int32_t WrapSubtract(int32_t a, int32_t b) {
  return static_cast<int32_t>(static_cast<uint32_t>(a) - static_cast<uint32_t>(b));
}
inline int32_t WrapMultiply(int32_t a, int32_t b) {
  return static_cast<int32_t>(static_cast<uint32_t>(a) * static_cast<uint32_t>(b));
}
inline int64_t WrapAdd(int64_t a, int64_t b) {
  return static_cast<int64_t>(static_cast<uint64_t>(a) + static_cast<uint64_t>(b));
}
inline int64_t WrapMultiply(int64_t a, int64_t b) {
  return static_cast<int64_t>(static_cast<uint64_t>(a) * static_cast<uint64_t>(b));
}

// The longest number of its type, with a sign.
template <class Signed>
inline constexpr size_t kMaxDecimalSize = sizeof(Signed) == 4 ? 11 : 20;

// Writes the last `kCount` digits of `value`, zero-padded on the left; returns the place behind.
template <size_t kCount>
inline char* WriteDigits(char* at, uint32_t value) {
  if constexpr (kCount == 1) {
    *at = static_cast<char>('0' + value % 10);
  } else if constexpr (kCount >= 8) {
    WriteEightDigits(at + kCount - 8, value % 100000000);
    WriteDigits<kCount - 8>(at, value / 100000000);
  } else if constexpr (kCount >= 2) {
    WriteDigitPair(at + kCount - 2, value % 100);
    WriteDigits<kCount - 2>(at, value / 100);
  }
  return at + kCount;
}

// Number of characters of `value` as printf's "%0<width>d" prints it (width 0: plain "%d"): the
// sign counts as one character of the width and stands before the zeros.
__attribute__((noinline)) size_t DecimalSize(int64_t value, size_t width);

// Writes a plain number; touches at least eight bytes. Returns the place behind the number.
__attribute__((noinline)) char* WriteNumber(char* at, int64_t value);

// Writes that many characters at `at`; returns the place behind them.
__attribute__((noinline)) char* WriteDecimal(char* at, int64_t value, size_t width);

#endif  // QUORVANE_GATEWAY_CORE_DECIMAL_H_
