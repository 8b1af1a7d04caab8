// Decimal numbers in wire texts, read and written alike on every ABI (`long` and `char` differ).
#ifndef QUORVANE_GATEWAY_CORE_DECIMAL_H_
#define QUORVANE_GATEWAY_CORE_DECIMAL_H_

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <type_traits>

// Reads a number as C's `atoll` does: blanks, a sign, digits up to the first other character.
// Saturates at the 64-bit limits; a text without digits is 0.
int64_t ReadInt64(std::string_view text);

// As ReadInt64, then narrowed to 32 bits by wrapping: what `atoi` gives where `long` has 64 bits.
inline int32_t ReadInt32(std::string_view text) {
  constexpr size_t kSafeDigits = 9;
  if (text.size() <= kSafeDigits) {
    uint32_t value = 0;
    const char* at = text.data();
    const char* const end = at + text.size();
    for (; at != end; ++at) {
      const uint32_t digit = static_cast<unsigned char>(*at) - uint32_t{'0'};
      if (digit > 9) break;
      value = value * 10 + digit;
    }
    if (at == end || at != text.data()) return static_cast<int32_t>(value);
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

// "00" to "99", so that digits are written two at a time.
inline constexpr char kDigitPairs[] =
    "0001020304050607080910111213141516171819202122232425262728293031323334353637383940414243444546"
    "4748495051525354555657585960616263646566676869707172737475767778798081828384858687888990919293"
    "949596979899";

inline void WriteDigitPair(char* at, uint32_t value) {
  memcpy(at, kDigitPairs + size_t{2} * value, 2);
}

// Writes the eight digits of a value below 10^8 in one store: halves, pairs and digits are parted
// side by side in one word, the first digit in its lowest byte (every ABI is little-endian).
inline void WriteEightDigits(char* at, uint32_t value) {
  const uint64_t halves = value / 10000 | uint64_t{value % 10000} << 32;
  const uint64_t hundreds = (halves * 10486 >> 20) & 0x0000007f0000007f;  // halves / 100
  const uint64_t pairs = hundreds | (halves - 100 * hundreds) << 16;
  const uint64_t tens = (pairs * 103 >> 10) & 0x000f000f000f000f;  // pairs / 10
  const uint64_t digits = tens | (pairs - 10 * tens) << 8 | 0x3030303030303030;
  memcpy(at, &digits, sizeof digits);
}

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

// Writes a plain number at `at`; returns the place behind. The short ones, which are most of the
// wire's, cost least.
__attribute__((noinline)) char* WriteNumber(char* at, int64_t value);

// Writes that many characters at `at`; returns the place behind them.
__attribute__((noinline)) char* WriteDecimal(char* at, int64_t value, size_t width);

#endif  // QUORVANE_GATEWAY_CORE_DECIMAL_H_
