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

constexpr bool IsSpace(char c) {
  return c == ' ' || (c >= '\t' && c <= '\r');
}

constexpr uint64_t Magnitude(int64_t value) {
  return value < 0 ? 0 - static_cast<uint64_t>(value) : static_cast<uint64_t>(value);
}

// Writes the leading digits first, four at a time.
char* WritePlain(char* at, uint64_t value) {
  if (value < 10000) return WriteShort(at, static_cast<uint32_t>(value));
  at = WritePlain(at, value / 10000);
  return WriteDigits<4>(at, static_cast<uint32_t>(value % 10000));
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
  const char* const safe = static_cast<size_t>(end - at) > kSafeDigits ? at + kSafeDigits : end;
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

char* WriteShort(char* at, uint32_t value) {
  if (value < 100) return value < 10 ? WriteDigits<1>(at, value) : WriteDigits<2>(at, value);
  return value < 1000 ? WriteDigits<3>(at, value) : WriteDigits<4>(at, value);
}

char* WriteDecimal(char* at, int64_t value, size_t width) {
  size_t zeros = width == 0 ? 0 : DecimalSize(value, width) - DecimalSize(value, 0);
  if (value < 0) *at++ = '-';
  for (; zeros > 0; --zeros) *at++ = '0';
  return WritePlain(at, Magnitude(value));
}
