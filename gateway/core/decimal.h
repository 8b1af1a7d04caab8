// Decimal numbers in wire texts, read and written alike on every ABI (`long` and `char` differ).
#ifndef QUORVANE_GATEWAY_CORE_DECIMAL_H_
#define QUORVANE_GATEWAY_CORE_DECIMAL_H_

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

#include "gateway/core/branch_hints.h"

constexpr bool IsDigit(char c) {
  return c >= '0' && c <= '9';
}

// So many digits fit 64 bits without a look.
inline constexpr size_t kSafeDigits = 18;

// Reads a number as C's `atoll` does: blanks, a sign, digits up to the first other character.
// Saturates at the 64-bit limits; a text without digits is 0.
int64_t ReadInt64(std::string_view text);

// As ReadInt64, then narrowed to 32 bits by wrapping: what `atoi` gives where `long` has 64 bits.
// Wrapping at each digit comes to the same in a text of digits that cannot saturate, which nearly
// every number is; read the long way a list takes 4 to 18 % more of the library's instructions.
inline int32_t ReadInt32(std::string_view text) {
  if (text.size() <= kSafeDigits) {
    uint32_t number = 0;
    size_t digits = 0;
    for (; digits < text.size() && IsDigit(text[digits]); ++digits) {
      number = number * 10 + static_cast<uint32_t>(text[digits] - '0');
    }
    if (digits > 0 || text.empty()) return static_cast<int32_t>(number);
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

// The longest number, with a sign.
inline constexpr size_t kMaxDecimalSize = 20;

// "00" to "99", so that digits are written two at a time.
inline constexpr char kDigitPairs[] =
    "0001020304050607080910111213141516171819202122232425262728293031323334353637383940414243444546"
    "4748495051525354555657585960616263646566676869707172737475767778798081828384858687888990919293"
    "949596979899";

inline void WriteDigitPair(char* at, uint32_t value) {
  memcpy(at, kDigitPairs + size_t{2} * value, 2);
}

// Writes the last `kCount` digits of `value`, zero-padded on the left; returns the place behind.
template <size_t kCount>
inline char* WriteDigits(char* at, uint32_t value) {
  if constexpr (kCount == 1) {
    *at = static_cast<char>('0' + value % 10);
  } else if constexpr (kCount >= 2) {
    WriteDigitPair(at + kCount - 2, value % 100);
    WriteDigits<kCount - 2>(at, value / 100);
  }
  return at + kCount;
}

// Number of characters of `value` as printf's "%0<width>d" prints it (width 0: plain "%d"): the
// sign counts as one character of the width and stands before the zeros.
size_t DecimalSize(int64_t value, size_t width);

// Writes that many characters at `at`; returns the place behind them.
char* WriteDecimal(char* at, int64_t value, size_t width);

// The same for a number below 10000 without a width.
char* WriteShort(char* at, uint32_t value);

// The same where the width is known and most numbers fill it, or are short where there is none.
// Without this way an order takes 28 % more of the library's instructions, a list up to 7 %.
template <size_t kWidth>
inline char* WriteNumber(char* at, int64_t value) {
  constexpr uint64_t kEnd = PowerOfTen(kWidth == 0 ? 4 : kWidth);
  if (Mostly(static_cast<uint64_t>(value) < kEnd)) {  // no negative number is, taken unsigned
    const auto digits = static_cast<uint32_t>(value);
    if constexpr (kWidth == 0) {
      return WriteShort(at, digits);
    } else {
      return WriteDigits<kWidth>(at, digits);
    }
  }
  return WriteDecimal(at, value, kWidth);
}

#endif  // QUORVANE_GATEWAY_CORE_DECIMAL_H_
