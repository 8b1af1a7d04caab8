// Decimal numbers in wire texts, read and written alike on every ABI (`long` and `char` differ).
#ifndef QUORVANE_GATEWAY_CORE_DECIMAL_H_
#define QUORVANE_GATEWAY_CORE_DECIMAL_H_

#include <cstddef>
#include <cstdint>
#include <string_view>

// Reads a number as C's `atoll` does: blanks, a sign, digits up to the first other character.
// Saturates at the 64-bit limits; a text without digits is 0.
int64_t ReadInt64(std::string_view text);

// As ReadInt64, then narrowed to 32 bits by wrapping: what `atoi` gives where `long` has 64 bits.
int32_t ReadInt32(std::string_view text);

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

// Number of decimal digits of `value`; 1 for 0.
inline size_t CountDigits(uint64_t value) {
  size_t count = 1;
  while (value >= 10000) {
    value /= 10000;
    count += 4;
  }
  if (value >= 1000) return count + 3;
  if (value >= 100) return count + 2;
  return value >= 10 ? count + 1 : count;
}

// Writes exactly `count` digits of `value` at `at`, zero-padded on the left.
inline void WriteDigits(char* at, uint64_t value, size_t count) {
  while (count > 0 && value > UINT32_MAX) {
    at[--count] = static_cast<char>('0' + value % 10);
    value /= 10;
  }
  auto narrow = static_cast<uint32_t>(value);  // 32-bit division is cheaper on every ABI
  while (count > 0) {
    at[--count] = static_cast<char>('0' + narrow % 10);
    narrow /= 10;
  }
}

// A number as printf's "%0<width>d" prints it (width 0: plain "%d"): the sign counts as one
// character of the width and stands before the zeros.
class CDecimal {
 public:
  CDecimal(int64_t value, size_t width)
      : m_nMagnitude(value < 0 ? 0 - static_cast<uint64_t>(value) : static_cast<uint64_t>(value)),
        m_nSign(value < 0 ? 1 : 0),
        m_nDigits(CountDigits(m_nMagnitude)) {
    if (width > m_nSign + m_nDigits) m_nDigits = width - m_nSign;
  }

  // Number of characters.
  size_t Size() const { return m_nSign + m_nDigits; }

  // Writes Size() characters at `at`, without a terminator.
  void WriteTo(char* at) const {
    if (m_nSign != 0) *at = '-';
    WriteDigits(at + m_nSign, m_nMagnitude, m_nDigits);
  }

 private:
  uint64_t m_nMagnitude;
  size_t m_nSign;
  size_t m_nDigits;
};

#endif  // QUORVANE_GATEWAY_CORE_DECIMAL_H_
