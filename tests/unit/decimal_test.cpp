// Decimal numbers, read and written as the C library does it.

#include "gateway/core/decimal.h"

#include <cinttypes>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <random>
#include <string>

#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const char* const kNumberTexts[] = {"",
                                    "0",
                                    "-0",
                                    "+0",
                                    "7",
                                    "-7",
                                    "+7",
                                    "007",
                                    "-007",
                                    " 7",
                                    "\t\n\v\f\r 7",
                                    " \t-7",
                                    "7 8",
                                    "7x",
                                    "x7",
                                    "--7",
                                    "+-7",
                                    "-+7",
                                    "- 7",
                                    "+ 7",
                                    "-",
                                    "+",
                                    " ",
                                    ".5",
                                    "1.5",
                                    "1e5",
                                    "0x10",
                                    "\x1f"
                                    "7",
                                    "\xa0"
                                    "7",
                                    "７",
                                    "/",
                                    ":",
                                    "9:",
                                    "2147483647",
                                    "2147483648",
                                    "-2147483648",
                                    "-2147483649",
                                    "4294967295",
                                    "4294967296",
                                    "9223372036854775806",
                                    "9223372036854775807",
                                    "9223372036854775808",
                                    "9223372036854775809",
                                    "9223372036854775810",
                                    "-9223372036854775807",
                                    "-9223372036854775808",
                                    "-9223372036854775809",
                                    "-9223372036854775810",
                                    "18446744073709551615",
                                    "18446744073709551616",
                                    "99999999999999999999",
                                    "-99999999999999999999",
                                    "0000000000000000000000000000000000000042",
                                    "99999999999999999999x",
                                    "900000",
                                    "900001"};

void ExpectReadAsC(const std::string& text) {
  const int64_t expected = strtoll(text.c_str(), nullptr, 10);
  EXPECT_EQ(ReadInt64(text), expected) << text;
  EXPECT_EQ(ReadInt32(text), static_cast<int32_t>(expected)) << text;
}

TEST(Decimal, NumbersAreReadAsTheCLibraryReadsThem) {
  for (const char* text : kNumberTexts) ExpectReadAsC(text);
}

TEST(Decimal, GeneratedTextsAreReadAsTheCLibraryReadsThem) {
  const std::string letters = "0123456789012345678901234567899  -+.x\t";
  std::mt19937 random(20240115);
  for (int round = 0; round < 50000; ++round) {
    std::string text(random() % 26, '0');
    for (char& c : text) c = letters[random() % letters.size()];
    ExpectReadAsC(text);
  }
}

// Each short text of digits, and with any other character in any of its places.
TEST(Decimal, ShortTextsAreReadAsTheCLibraryReadsThem) {
  const std::string digits = "1839204756";
  for (size_t size = 0; size <= digits.size(); ++size) {
    const std::string text = digits.substr(0, size);
    ExpectReadAsC(text);
    for (size_t at = 0; at < size; ++at) {
      for (int c = 1; c < 256; ++c) {
        std::string changed = text;
        changed[at] = static_cast<char>(c);
        ExpectReadAsC(changed);
      }
    }
  }
  for (int number = 0; number <= 99999; ++number) ExpectReadAsC(std::to_string(number));
}

TEST(Decimal, ReadingTouchesNothingOutsideTheSlice) {
  const std::string digits = "1234567890";
  for (const Placement placement : {Placement::kBeforeUnreadable, Placement::kAfterUnreadable}) {
    for (size_t size = 1; size <= digits.size(); ++size) {
      const CGuardedBlock block(placement, digits.data(), size);
      EXPECT_EQ(ReadInt32({block.Data(), size}), std::stoi(digits.substr(0, size)));
    }
  }
}

TEST(Decimal, ReadingStopsAtTheEndOfTheSlice) {
  EXPECT_EQ(ReadInt64(std::string_view("12345", 3)), 123);
  EXPECT_EQ(ReadInt64(std::string_view("-5", 1)), 0);
  EXPECT_EQ(ReadInt64(std::string_view("  5", 2)), 0);
  EXPECT_EQ(ReadInt64(std::string_view()), 0);
  for (const char* text : {"12", "-", " ", "99999999999999999999"}) {
    const size_t size = std::string_view(text).size();
    const CGuardedBlock block(Placement::kBeforeUnreadable, text, size);
    EXPECT_EQ(ReadInt64({block.Data(), size}), strtoll(text, nullptr, 10)) << text;
  }
}

void ExpectPrintedAsC(int64_t value, int width) {
  char expected[80];
  if (width == 0) {
    snprintf(expected, sizeof expected, "%" PRId64, value);
  } else {
    snprintf(expected, sizeof expected, "%0*" PRId64, width, value);
  }
  const size_t size = DecimalSize(value, static_cast<size_t>(width));
  ASSERT_EQ(size, std::string_view(expected).size()) << value << ", " << width;
  const CRoomAtPageEnd room(size);
  ASSERT_EQ(WriteDecimal(room, value, static_cast<size_t>(width)), room + size);
  ASSERT_EQ(room.Bytes(), expected) << value << ", " << width;
  if (width == 0) {
    const CRoomAtPageEnd plain(size);
    ASSERT_EQ(WriteNumber<0>(plain, value), plain + size);
    ASSERT_EQ(plain.Bytes(), expected) << value;
  }
}

TEST(Decimal, NumbersArePrintedAsTheCLibraryPrintsThem) {
  std::vector<int64_t> values = {0, INT32_MAX, INT32_MIN, UINT32_MAX, INT64_MAX, INT64_MIN};
  for (int64_t power = 1; power <= INT64_MAX / 10; power *= 10) {
    for (int64_t value : {power - 1, power, power + 1, power * 9}) {
      values.push_back(value);
      values.push_back(-value);
    }
  }
  for (int64_t near : {int64_t{UINT32_MAX}, int64_t{INT32_MAX}}) {
    for (int64_t step : {-1, 1, 2}) values.push_back(near + step);
  }
  values.push_back(INT64_MIN + 1);
  values.push_back(INT64_MAX - 1);
  for (int64_t value : values) {
    for (int width : {0, 1, 2, 4, 7, 8, 10, 19, 20, 21, 30}) ExpectPrintedAsC(value, width);
  }
}

TEST(Decimal, GeneratedNumbersArePrintedAsTheCLibraryPrintsThem) {
  std::mt19937_64 random(20240115);
  for (int round = 0; round < 3000; ++round) {
    const auto value = static_cast<int64_t>(random() >> (random() % 64));
    ExpectPrintedAsC(value, static_cast<int>(random() % 12));
    ExpectPrintedAsC(-value, static_cast<int>(random() % 12));
  }
}

TEST(Decimal, PowersOfTenSaturate) {
  int64_t power = 1;
  for (int exponent = 0; exponent <= 18; ++exponent, power = exponent <= 18 ? power * 10 : power) {
    EXPECT_EQ(PowerOfTen64(exponent), power) << exponent;
    EXPECT_EQ(PowerOfTen32(exponent), exponent <= 9 ? power : INT32_MAX) << exponent;
  }
  for (int exponent : {19, 20, 127, 1000, INT_MAX}) {
    EXPECT_EQ(PowerOfTen64(exponent), INT64_MAX);
    EXPECT_EQ(PowerOfTen32(exponent), INT32_MAX);
  }
  for (int exponent : {-1, -2, INT_MIN}) {
    EXPECT_EQ(PowerOfTen64(exponent), 0);
    EXPECT_EQ(PowerOfTen32(exponent), 0);
  }
}

TEST(Decimal, ArithmeticWraps) {
  EXPECT_EQ(WrapAdd(INT32_MAX, 1), INT32_MIN);
  EXPECT_EQ(WrapAdd(INT32_MIN, -1), INT32_MAX);
  EXPECT_EQ(WrapAdd(2, 3), 5);
  EXPECT_EQ(WrapSubtract(INT32_MIN, 1), INT32_MAX);
  EXPECT_EQ(WrapSubtract(0, INT32_MIN), INT32_MIN);
  EXPECT_EQ(WrapSubtract(2, 3), -1);
  EXPECT_EQ(WrapMultiply(INT32_MAX, 2), -2);
  EXPECT_EQ(WrapMultiply(INT32_MIN, -1), INT32_MIN);
  EXPECT_EQ(WrapMultiply(65536, 65536), 0);
  EXPECT_EQ(WrapMultiply(-4, 5), -20);
  EXPECT_EQ(WrapAdd(int64_t{INT64_MAX}, int64_t{1}), INT64_MIN);
  EXPECT_EQ(WrapMultiply(int64_t{INT64_MAX}, int64_t{2}), -2);
  EXPECT_EQ(WrapMultiply(int64_t{INT64_MIN}, int64_t{-1}), INT64_MIN);
}

}  // namespace
}  // namespace gateway_tests
