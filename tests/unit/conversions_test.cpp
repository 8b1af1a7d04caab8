// Dates, prices and the replacement of characters.

#include "gateway/core/conversions.h"

#include <climits>
#include <cmath>
#include <cstdio>
#include <cstring>

#include "gateway/core/gateway_pub.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

class Conversions : public CSessionTest {
 protected:
  std::string TransDate(const std::string& date) {
    char text[20];
    snprintf(text, sizeof text, "%s", date.c_str());
    m_gateway.TransDate(text);
    EXPECT_EQ(CTransDate(date).Text(), text) << date;
    return text;
  }

  std::string PriceText(int value, int decimals) {
    const CRoomAtPageEnd out(32);
    m_gateway.SetPriceString(value, decimals, out, 32);
    return static_cast<char*>(out);
  }

  CGatewayPub m_gateway;
};

struct TextCase {
  const char* given;
  const char* expected;
};

constexpr TextCase kDateCases[] = {{"1130115", "20240115"},
                                   {"20240115", "1130115"},
                                   {"19990101", "880101"},
                                   {"990101", "20100101"},
                                   {"20101231", "991231"},
                                   {"20110101", "1000101"},
                                   {"0010101", "19120101"},
                                   {"010101", "19120101"},
                                   {"000101", "19110101"},
                                   {"9991231", "29101231"},
                                   {"19120101", "10101"},
                                   {"19110101", "00101"},
                                   {"99991231", "80881231"},
                                   {"19100101", "-10101"},
                                   {"00000101", "-19110101"},
                                   // Unchanged: no date, or one of another length.
                                   {"0000000", "0000000"},
                                   {"000000", "000000"},
                                   {"00000000", "00000000"},
                                   {"", ""},
                                   {"13011", "13011"},
                                   {"202401150", "202401150"},
                                   {"1", "1"},
                                   {"2024011501", "2024011501"},
                                   {"abcdefg", "abcdefg"},
                                   {"       ", "       "},
                                   {"0abcdef", "0abcdef"},
                                   // Digits are not asked for behind the year.
                                   {"113abcd", "2024abcd"},
                                   {"2024abcd", "113abcd"},
                                   {"1a0115", "19120115"},
                                   {"1 30115", "19120115"},
                                   {"-010115", "19100115"},
                                   {"-100115", "19010115"}};

TEST_F(Conversions, TransDateMovesADateToTheOtherCalendarByItsLength) {
  for (const TextCase& row : kDateCases) EXPECT_EQ(TransDate(row.given), row.expected) << row.given;
}

TEST_F(Conversions, TransDateTakesNull) {
  m_gateway.TransDate(nullptr);
  EXPECT_EQ(CTransDate({}).Text(), "");
}

TEST_F(Conversions, TransDateNeedsRoomForEightCharactersAlone) {
  for (const char* date : {"1130115", "990101", "20240115"}) {
    const CRoomAtPageEnd room(9, '\0');
    memcpy(room, date, strlen(date));
    m_gateway.TransDate(room);
    EXPECT_EQ(TransDate(date), static_cast<char*>(room));
  }
}

TEST_F(Conversions, TransDateGoesBackAndForth) {
  for (int year = 1912; year <= 2910; ++year) {
    const std::string western = std::to_string(year) + "0229";
    std::string roc = TransDate(western);
    EXPECT_EQ(roc, std::to_string(year - 1911) + "0229");
    if (roc.size() == 5) roc = "0" + roc;
    EXPECT_EQ(TransDate(roc), western) << roc;
  }
}

// Every year of four digits, of three and of two, by the arithmetic of plain numbers.
TEST_F(Conversions, TransDateMovesEveryYear) {
  for (int year = 0; year <= 9999; ++year) {
    char date[20], expected[20];
    snprintf(date, sizeof date, "%04d0115", year);
    snprintf(expected, sizeof expected, "%d0115", year - 1911);
    EXPECT_EQ(CTransDate(date).Text(), expected);
    if (year > 999) continue;
    snprintf(expected, sizeof expected, "%04d0115", year + 1911);
    snprintf(date, sizeof date, "%03d0115", year);
    EXPECT_EQ(CTransDate(date).Text(), expected);
    if (year > 99) continue;
    snprintf(date, sizeof date, "%02d0115", year);
    EXPECT_EQ(CTransDate(date).Text(), expected);
  }
}

// What ScalePrice says of a text that begins with no sign, digit by digit.
int32_t PlainPrice(const std::string& text, int decimals) {
  const auto power = [](int exponent) {
    return exponent < 0   ? int64_t{0}
           : exponent > 9 ? INT32_MAX
                          : static_cast<int64_t>(pow(10, exponent));
  };
  const size_t point = text.find('.');
  const auto whole = static_cast<int32_t>(atoll(text.substr(0, point).c_str()));
  auto price = static_cast<uint32_t>(whole * power(decimals));
  if (point != std::string::npos) {
    const std::string digits = text.substr(point + 1);
    const auto fraction = static_cast<int32_t>(atoll(digits.c_str()));
    const int missing = decimals - static_cast<int>(digits.size());
    price += static_cast<uint32_t>(missing >= 0 ? fraction * power(missing)
                                                : fraction / power(-missing));
  }
  return static_cast<int32_t>(price);
}

TEST_F(Conversions, PricesOfEveryShapeAreReadDigitByDigit) {
  const std::string digits = "9876543210";
  for (int decimals = -2; decimals <= 11; ++decimals) {
    for (size_t size = 0; size <= digits.size(); ++size) {
      const std::string whole = digits.substr(0, size);
      EXPECT_EQ(ScalePrice(whole, decimals), PlainPrice(whole, decimals))
          << whole << ", " << decimals;
      for (size_t at = 0; at < size; ++at) {
        for (const char* letters : {".", "-", "x", " ", "\xff"}) {
          std::string text = whole;
          text[at] = letters[0];
          if (text[0] == '-') continue;
          EXPECT_EQ(ScalePrice(text, decimals), PlainPrice(text, decimals))
              << text << ", " << decimals;
          text[size / 2] = '.';
          EXPECT_EQ(ScalePrice(text, decimals), PlainPrice(text, decimals))
              << text << ", " << decimals;
        }
      }
    }
  }
}

TEST_F(Conversions, RocDateToStandardDateAddsTheYears) {
  const struct {
    int given, expected;
  } rows[] = {{0, 0},
              {990101, 20100101},
              {1130115, 20240115},
              {1, 19110001},
              {-1, 19109999},
              {-19110000, 0},
              {INT_MAX - 19110000, INT_MAX},
              {INT_MAX - 19109999, INT_MIN},
              {INT_MAX, INT_MIN + 19109999},
              {INT_MIN, INT_MIN + 19110000}};
  for (const auto& row : rows) {
    EXPECT_EQ(m_gateway.RocDateToStandardDate(row.given), row.expected) << row.given;
  }
}

TEST_F(Conversions, RocDateToStandardDateReadsTextsAsNumbers) {
  const struct {
    const char* given;
    int expected;
  } rows[] = {{"1130115", 20240115},
              {"990101", 20100101},
              {"0", 0},
              {"", 0},
              {nullptr, 0},
              {"abc", 0},
              {" 990101x", 20100101},
              {"0990101", 20100101},
              {"4294967296", 0},
              {"4294967297", 19110001},
              {"-1", 19109999}};
  for (const auto& row : rows) {
    EXPECT_EQ(m_gateway.RocDateToStandardDate(row.given), row.expected);
  }
}

struct PriceTextCase {
  int value, decimals;
  const char* text;
};

constexpr PriceTextCase kPriceTextCases[] = {
    {12345, 2, "123.45"},
    {5, 2, "0.05"},
    {-150, 2, "-1.-50"},
    {-50, 2, "0.-50"},
    {123, 0, "123.0"},
    {-7, 2, "0.-7"},
    {0, 2, "0.00"},
    {0, 0, "0.0"},
    {-5, 0, "-5.0"},
    {1, 2, "0.01"},
    {99, 2, "0.99"},
    {100, 2, "1.00"},
    {-100, 2, "-1.00"},
    {-101, 2, "-1.-1"},
    {-7, 3, "0.-07"},
    {7, 3, "0.007"},
    {1234567, 4, "123.4567"},
    {5, 1, "0.5"},
    {-5, 1, "0.-5"},
    {INT_MAX, 2, "21474836.47"},
    {INT_MIN, 2, "-21474836.-48"},
    {INT_MAX, 0, "2147483647.0"},
    {INT_MIN, 0, "-2147483648.0"},
    {INT_MAX, 9, "2.147483647"},
    {INT_MIN, 9, "-2.-147483648"},
    // Powers of ten above 32 bits stay at the largest number.
    {INT_MAX, 10, "1.0000000000"},
    {5, 10, "0.0000000005"},
    {INT_MIN, 10, "-1.-000000001"},
    {7, 12, "0.000000000007"}};

TEST_F(Conversions, SetPriceStringPutsThePoint) {
  for (const PriceTextCase& row : kPriceTextCases) {
    EXPECT_EQ(PriceText(row.value, row.decimals), row.text) << row.value << ", " << row.decimals;
  }
}

TEST_F(Conversions, SetPriceStringPrintsAsTheFormatItStandsFor) {
  for (int decimals = 0; decimals <= 9; ++decimals) {
    const int unit = static_cast<int>(std::pow(10.0, decimals));
    for (int64_t wide = INT_MIN; wide <= INT_MAX; wide += 104729 * 997) {
      const int value = static_cast<int>(wide);
      char expected[40];
      snprintf(expected, sizeof expected, "%d.%0*d", value / unit, decimals, value % unit);
      ASSERT_EQ(PriceText(value, decimals), expected);
    }
  }
}

TEST_F(Conversions, SetPriceStringTakesNegativeDecimalsAsNone) {
  for (int decimals : {-1, -2, INT_MIN}) {
    EXPECT_EQ(PriceText(12345, decimals), PriceText(12345, 0)) << decimals;
  }
}

TEST_F(Conversions, SetPriceStringClearsItsBufferAndStaysInIt) {
  const struct {
    size_t size;
    const char* text;
  } rows[] = {{1, ""}, {6, ""}, {7, "123.45"}, {8, "123.45"}, {20, "123.45"}};
  for (const auto& row : rows) {
    const CRoomAtPageEnd out(row.size);
    m_gateway.SetPriceString(12345, 2, out, static_cast<int>(row.size));
    EXPECT_STREQ(out, row.text) << row.size;
    if (row.size != 6) {
      std::string bytes = row.text;
      bytes.resize(row.size);
      EXPECT_EQ(out.Bytes(), bytes) << row.size;
    }
  }
  m_gateway.SetPriceString(1, 2, nullptr, 10);
  char out[4] = "###";
  m_gateway.SetPriceString(1, 2, out, 0);
  m_gateway.SetPriceString(1, 2, out, -1);
  EXPECT_STREQ(out, "###");
}

struct PriceCase {
  const char* text;
  int decimals;
  int32_t value;
};

constexpr PriceCase kPriceCases[] = {
    {"12.5", 2, 1250},
    {"-12.345", 2, -1234},
    {"7", 3, 7000},
    {"0.999", 2, 99},
    {".5", 1, 5},
    {"3.", 2, 300},
    {"", 2, 0},
    {"-", 2, 0},
    {".", 2, 0},
    {"-.", 2, 0},
    {"-.5", 1, -5},
    {"-7", 2, -700},
    {"0", 2, 0},
    {"abc", 2, 0},
    {"12.5", 0, 12},
    {"12.5", 1, 125},
    {"12.05", 2, 1205},
    {"12.05", 4, 120500},
    {"1.2.3", 2, 100},  // three characters behind the point that read as 2
    {"1.2.3", 4, 10020},
    {"12.5x", 2, 1205},
    {"1.-5", 2, 95},
    {"+7", 2, 700},
    {" 7", 2, 700},
    {" -7", 2, -700},
    {"--7", 2, 700},
    {"12.129", 2, 1212},
    {"-0.999", 2, -99},
    {"12,345.00", 2, 1200},
    {"21474836.47", 2, INT32_MAX},
    {"-21474836.48", 2, INT32_MIN},
    {"21474836.48", 2, INT32_MIN},
    {"4294967296", 0, 0},
    {"4294967297", 2, 100},
    {"42949673", 2, 4},
    // Only 20 characters behind a sign are read.
    {"-0000000000000000000123", 0, -1},
    {"-00000000000000000001.5", 1, -10},
    {"00000000000000000000123", 0, 123},
    // Powers of ten above 32 bits stay at the largest number.
    {"1", 10, INT32_MAX},
    {"2", 10, -2},
    {"0.00000000001", 0, 0},
    {"0.9999999999", 0, 0},
    {"0.99999999999999999999", 1, 0}};

TEST_F(Conversions, GetPriceStringReadsAScaledNumber) {
  for (const PriceCase& row : kPriceCases) {
    const CTextAtPageEnd text(row.text);
    EXPECT_EQ(m_gateway.GetPriceString(text, row.decimals), row.value)
        << row.text << ", " << row.decimals;
    EXPECT_EQ(ScalePrice(row.text, row.decimals), row.value) << row.text << ", " << row.decimals;
    EXPECT_STREQ(text, row.text);
  }
  EXPECT_EQ(m_gateway.GetPriceString(nullptr, 2), 0);
}

TEST_F(Conversions, GetPriceStringUndoesSetPriceString) {
  for (int value : {0, 1, 5, 99, 100, 101, 12345, 99999999, INT_MAX}) {
    for (int decimals : {1, 2, 4}) {
      EXPECT_EQ(ScalePrice(PriceText(value, decimals), decimals), value) << value;
    }
  }
}

struct AmountCase {
  const char* text;
  int decimals;
  int64_t value;
};

constexpr AmountCase kAmountCases[] = {{"12.5", 2, 1250},
                                       {"-12.50", 2, -1150},
                                       {"-12.5", 2, -1150},
                                       {"-7", 2, -700},
                                       {"-0.50", 2, 50},
                                       {"7", 3, 7000},
                                       {"0.999", 2, 99},
                                       {".5", 1, 5},
                                       {"3.", 2, 300},
                                       {"", 2, 0},
                                       {"abc", 2, 0},
                                       {"2147483648", 0, 2147483648},
                                       {"123456789012.34", 2, 12345678901234},
                                       {"123456789012.349", 2, 12345678901234},
                                       {"92233720368547758.07", 2, INT64_MAX},
                                       {"92233720368547758.08", 2, INT64_MIN},
                                       {"9223372036854775807", 0, INT64_MAX},
                                       {"99999999999999999999", 0, INT64_MAX},
                                       {"-99999999999999999999", 0, INT64_MIN},
                                       {"1", 18, 1000000000000000000},
                                       {"1", 19, INT64_MAX},
                                       {"0.000000000000000000001", 2, 0}};

TEST_F(Conversions, GetPriceString2ReadsAnAmountOf64Bits) {
  for (const AmountCase& row : kAmountCases) {
    const CTextAtPageEnd text(row.text);
    EXPECT_EQ(m_gateway.GetPriceString2(text, row.decimals), row.value)
        << row.text << ", " << row.decimals;
    EXPECT_EQ(ScaleAmount(row.text, row.decimals), row.value) << row.text << ", " << row.decimals;
    EXPECT_STREQ(text, row.text);
  }
  EXPECT_EQ(m_gateway.GetPriceString2(nullptr, 2), 0);
}

// What is cut is divided by a power of ten that stays at the largest number from 10 digits on (19
// for an amount): this fraction leaves 1 however many are cut, and 0 where there is none to spare.
TEST_F(Conversions, PricesAreCutByAnyNumberOfDecimals) {
  for (size_t excess = 10; excess <= 700; ++excess) {
    const std::string zeros(excess - 10 + 2, '0');
    EXPECT_EQ(ScalePrice("3." + zeros + "2147483647", 2), 301) << excess;
    EXPECT_EQ(ScalePrice("3." + zeros + "2147483646", 2), 300) << excess;
    EXPECT_EQ(ScaleAmount("3." + zeros + "9223372036854775807", 2), 301) << excess;
    EXPECT_EQ(ScaleAmount("3." + zeros + "9223372036854775806", 2), 300) << excess;
  }
}

TEST_F(Conversions, PricesTakeAnyNumberOfDecimals) {
  const std::string digits(300, '9');
  for (int decimals : {INT_MIN, -300, -1, 0, 1, 300, INT_MAX}) {
    for (const std::string& text :
         {digits, "." + digits, digits + "." + digits, std::string("-1.5")}) {
      EXPECT_EQ(m_gateway.GetPriceString(text.c_str(), decimals), ScalePrice(text, decimals));
      EXPECT_EQ(m_gateway.GetPriceString2(text.c_str(), decimals), ScaleAmount(text, decimals));
    }
    char out[8];
    m_gateway.SetPriceString(12345, decimals, out, sizeof out);
    EXPECT_LT(strlen(out), sizeof out);
  }
}

constexpr TextCase kBlankCases[] = {
    {"a b", "a%20b"},   {" ", "%20"},         {"  ", "%20%20"},
    {" a ", "%20a%20"}, {"abc", "abc"},       {"a\tb\n", "a\tb\n"},
    {"%20", "%20"},     {"密 碼", "密%20碼"}, {"100% a", "100%%20a"}};

TEST_F(Conversions, FctRepEscapesBlanks) {
  for (const TextCase& row : kBlankCases) {
    const CTextAtPageEnd source(row.given);
    const CRoomAtPageEnd out(strlen(row.expected) + 1, '\0');
    m_gateway.fctRep(source, out);
    EXPECT_STREQ(out, row.expected);
    EXPECT_STREQ(source, row.given);
  }
}

TEST_F(Conversions, FctRepOfNothingLeavesTheBufferAlone) {
  char out[8] = "###";
  m_gateway.fctRep(nullptr, out);
  m_gateway.fctRep("", out);
  EXPECT_STREQ(out, "###");
  m_gateway.fctRep("a", nullptr);
}

TEST_F(Conversions, FctRepTakesALongText) {
  const std::string blanks(65536, ' ');
  std::string out(3 * blanks.size() + 1, '\0');
  m_gateway.fctRep(blanks.c_str(), out.data());
  EXPECT_EQ(strlen(out.c_str()), 3 * blanks.size());
  EXPECT_EQ(out.find_first_not_of("%20"), out.size() - 1);
}

struct ReplaceCase {
  const char* text;
  int from, to;
  const char* expected;
};

constexpr ReplaceCase kReplaceCases[] = {{"a,b,c", ',', '.', "a.b.c"},
                                         {",,,", ',', '.', "..."},
                                         {"abc", ',', '.', "abc"},
                                         {"", ',', '.', ""},
                                         {"a,b,c", ',', '\0', "a"},
                                         {",a", ',', '\0', ""},
                                         {"abc", ',', '\0', "abc"},
                                         {"a\xE5z", 0xE5, 'b', "abz"},
                                         {"a\xE5z", -27, 'b', "abz"},
                                         {"a.b", '.', '.', "a.b"},
                                         {"a.b", '\0', 'x', "a.b"},
                                         {"a,b", ',', 0xE5,
                                          "a\xE5"
                                          "b"}};

TEST_F(Conversions, StringReplaceAllReplacesEveryOccurrence) {
  for (const ReplaceCase& row : kReplaceCases) {
    const CTextAtPageEnd text(row.text);
    m_gateway.StringReplaceAll(text, row.from, row.to);
    EXPECT_STREQ(text, row.expected) << row.text;
  }
  m_gateway.StringReplaceAll(nullptr, 'a', 'b');
}

TEST_F(Conversions, StringReplaceAllCutsOnlyAtTheFirstOccurrence) {
  char text[] = "a,b,c";
  m_gateway.StringReplaceAll(text, ',', '\0');
  EXPECT_EQ(std::string(text, 5), std::string("a\0b,c", 5));
}

TEST_F(Conversions, FirstSixCharactersOfATime) {
  EXPECT_EQ(FirstSix("134521999"), "134521");
  EXPECT_EQ(FirstSix("134521"), "134521");
  EXPECT_EQ(FirstSix("13452"), "13452");
  EXPECT_EQ(FirstSix(""), "");
}

}  // namespace
}  // namespace gateway_tests
