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

constexpr bool IsDigit(char c) {
  return c >= '0' && c <= '9';
}

}  // namespace

int64_t ReadInt64(std::string_view text) {
  const char* at = text.data();
  const char* const end = at + text.size();
  while (at != end && IsSpace(*at)) ++at;
  const bool negative = at != end && *at == '-';
  if (at != end && (*at == '-' || *at == '+')) ++at;

  const uint64_t limit = static_cast<uint64_t>(INT64_MAX) + (negative ? 1 : 0);
  uint64_t magnitude = 0;
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

int32_t ReadInt32(std::string_view text) {
  return static_cast<int32_t>(static_cast<uint32_t>(static_cast<uint64_t>(ReadInt64(text))));
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
