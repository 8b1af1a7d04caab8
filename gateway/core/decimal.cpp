#include "gateway/core/decimal.h"

#include <iterator>

namespace {

constexpr int64_t kPowersOfTen[] = {1,
                                    10,
                                    100,
                                    1000,
                                    10000,
                                    100000,
                                    1000000,
                                    10000000,
                                    100000000,
                                    1000000000,
                                    10000000000,
                                    100000000000,
                                    1000000000000,
                                    10000000000000,
                                    100000000000000,
                                    1000000000000000,
                                    10000000000000000,
                                    100000000000000000,
                                    1000000000000000000};

constexpr ptrdiff_t kSafeDigits = 18;

constexpr bool IsSpace(char c) {
  return c == ' ' || (c >= '\t' && c <= '\r');
}

constexpr bool IsDigit(char c) {
  return c >= '0' && c <= '9';
}

constexpr uint64_t Magnitude(int64_t value) {
  return value < 0 ? 0 - static_cast<uint64_t>(value) : static_cast<uint64_t>(value);
}

// Writes the leading digits first, two at a time.
char* WritePlain(char* at, uint64_t value) {
  if (value >= 100) at = WritePlain(at, value / 100);
  if (value < 10) {
    *at = static_cast<char>('0' + value);
    return at + 1;
  }
  WriteDigitPair(at, static_cast<uint32_t>(value % 100));
  return at + 2;
}

}  // namespace

int64_t ReadInt64(std::string_view text) {
  const char* at = text.data();
  const char* const end = at + text.size();
  bool negative = false;
  if (at != end && !IsDigit(*at)) {
    while (at != end && IsSpace(*at)) ++at;
    negative = at != end && *at == '-';
    if (at != end && (*at == '-' || *at == '+')) ++at;
  }
  // So many digits fit 64 bits without a look.
  const char* const safe = end - at > kSafeDigits ? at + kSafeDigits : end;
  uint64_t magnitude = 0;
  for (; at != safe && IsDigit(*at); ++at) {
    magnitude = magnitude * 10 + static_cast<uint64_t>(*at - '0');
  }
  const uint64_t limit = static_cast<uint64_t>(INT64_MAX) + (negative ? 1 : 0);
  for (; at != end && IsDigit(*at); ++at) {
    const auto digit = static_cast<uint64_t>(*at - '0');
    if (magnitude > (limit - digit) / 10) {
      magnitude = limit;
      break;
    }
    magnitude = magnitude * 10 + digit;
  }
  return static_cast<int64_t>(negative ? 0 - magnitude : magnitude);
}

int32_t PowerOfTen32(int exponent) {
  const int64_t power = PowerOfTen64(exponent);
  return power > INT32_MAX ? INT32_MAX : static_cast<int32_t>(power);
}

int64_t PowerOfTen64(int exponent) {
  if (exponent < 0) return 0;
  const auto row = static_cast<size_t>(exponent);
  return row < std::size(kPowersOfTen) ? kPowersOfTen[row] : INT64_MAX;
}

size_t DecimalSize(int64_t value, size_t width) {
  const uint64_t magnitude = Magnitude(value);
  size_t size = 1;
  for (uint64_t bound = 10; magnitude >= bound; bound *= 10) ++size;  // ends at 10^19 at the latest
  if (value < 0) ++size;
  return size < width ? width : size;
}

char* WriteDecimal(char* at, int64_t value, size_t width) {
  size_t zeros = width == 0 ? 0 : DecimalSize(value, width) - DecimalSize(value, 0);
  if (value < 0) *at++ = '-';
  for (; zeros > 0; --zeros) *at++ = '0';
  return WritePlain(at, Magnitude(value));
}
