// Futures exports: every byte and a sample of characters, the market, what is logged.

#include <gtest/gtest.h>

#include <climits>
#include <string>

#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

// Places among the Java arguments of an order.
enum { kN6 = 18, kKind, kPriceType, kFunction, kW3, kTimeInForce, kUnused, kSide1, kSide2 };

Arguments Session(int32_t market) {
  return {Argument::Int(market),      Argument::Int(0),           Argument::Int(7),
          Argument::Text("SN0001"),   Argument::Text("10.0.0.1"), Argument::Text("F008"),
          Argument::Text("1234567&"), Argument::Text("pw")};
}

// An option combination.
Arguments Order() {
  Arguments arguments = Session(1);
  for (const char* text :
       {"A001&B002", "", "TXO", "TXO", "202401", "202402", "17500", "17600", "C", "P"}) {
    arguments.push_back(Argument::Text(text));
  }
  for (const int number : {0, 3, 2}) arguments.push_back(Argument::Byte(number));
  for (const char letter : {'I', '0', 'R', 'x', 'B', 'S'}) {
    arguments.push_back(Argument::Char(letter));
  }
  for (const int number : {3, 99, 175000000}) arguments.push_back(Argument::Int(number));
  return arguments;
}

std::string ValueOf(const std::string& text, const std::string& tag) {
  const size_t at = text.find("|" + tag + "=");
  if (at == std::string::npos) return "(absent)";
  const size_t from = at + tag.size() + 2;
  return text.substr(from, text.find('|', from) - from);
}

class FuturesExports : public testing::TestWithParam<const char*> {
 protected:
  void SetUp() override { ASSERT_TRUE(SetClock("2024-01-15 13:45:21")); }

  std::string Submit(const Arguments& arguments) {
    m_outcome = m_host.Call(*FindExport(GetParam()), arguments);
    EXPECT_TRUE(m_outcome.IsSound()) << testing::PrintToString(m_outcome.violations);
    return m_outcome.result.value();
  }

  CRecordingHost m_host{Placement::kBeforeUnreadable};
  Outcome m_outcome;
};

INSTANTIATE_TEST_SUITE_P(Orders, FuturesExports,
                         testing::Values("FutSubmitOrderEncode", "FutSubmitOrderEncode1"));

TEST_P(FuturesExports, EveryByteIsUnsigned) {
  for (int value = -128; value <= 127; ++value) {
    const std::string printed = std::to_string(value & 0xff);
    Arguments arguments = Order();
    arguments[kN6] = Argument::Byte(value);
    EXPECT_EQ(ValueOf(Submit(arguments), "N6").substr(0, printed.size()), printed);
    EXPECT_EQ(m_outcome.status, 1);

    arguments = Order();
    arguments[kPriceType] = Argument::Byte(value);
    const std::string request = Submit(arguments);
    EXPECT_EQ(ValueOf(request, "27"), printed);
    EXPECT_EQ(ValueOf(request, "31"), value == 1 || value == 3 ? "00000000.000000" : "17500.0000");

    arguments = Order();
    arguments[kKind] = Argument::Byte(value);
    const std::string combination = ValueOf(Submit(arguments), "V6");
    const bool known = value >= 1 && value <= 4;
    EXPECT_EQ(m_outcome.status, known ? 1 : -1) << value;
    EXPECT_EQ(combination, value == 3 ? "5" : value == 4 ? "7" : known ? "" : "(absent)");
  }
}

// The low byte of a character alone reaches the request.
TEST_P(FuturesExports, CharactersAreTheirLowByte) {
  for (const int place : {kFunction, kW3, kTimeInForce, kUnused, kSide1, kSide2}) {
    const auto submit = [&](int character) {
      Arguments arguments = Order();
      arguments[static_cast<size_t>(place)] = Argument::Char(character);
      return Submit(arguments);
    };
    const std::string plain = submit('B');
    EXPECT_EQ(submit(0x142), plain);
    EXPECT_EQ(submit(0xff42), plain);
    EXPECT_EQ(submit(0x100), submit(0));
    EXPECT_EQ(submit(0xffff), submit(0xff));
    EXPECT_EQ(submit(0x149), submit('I'));
  }
  Arguments arguments = Order();
  arguments[kUnused] = Argument::Char(0);
  EXPECT_EQ(Submit(arguments), Submit(Order()));
}

TEST_P(FuturesExports, NulCharactersEndNoMoreThanTheirPiece) {
  const struct {
    int place;
    const char* tag;
    const char* nextTag;
  } rows[] = {
      {kFunction, "14", "15"}, {kW3, "W3", "N6"}, {kSide1, "32", "O4"}, {kSide2, "EL", "W3"}};
  for (const auto& row : rows) {
    Arguments arguments = Order();
    arguments[static_cast<size_t>(row.place)] = Argument::Char(0);
    const std::string request = Submit(arguments);
    const std::string next =
        std::string("|") + row.tag + "=|" + (row.place == kFunction ? "15=" : row.nextTag);
    EXPECT_NE(request.find(next), std::string::npos) << request;
    EXPECT_EQ(m_outcome.status, 1);
  }
}

TEST_P(FuturesExports, MarketIsMovedToFuturesAndWraps) {
  const struct {
    int32_t market;
    const char* kind;
  } rows[] = {{0, "S"},   {1, "F"}, {-1, "S"},      {-100, "S"},   {-101, "F"},
              {100, "F"}, {3, "F"}, {INT_MAX, "F"}, {INT_MIN, "F"}};
  for (const auto& row : rows) {
    Arguments arguments = Order();
    arguments[0] = Argument::Int(row.market);
    EXPECT_EQ(ValueOf(Submit(arguments), "KIND"), row.kind) << row.market;
    for (const char* query : {"FutQueryInventoryEncode", "QueryFinanceEncode"}) {
      Arguments session = Session(row.market);
      if (query[0] == 'Q') session.push_back(Argument::Int(1));
      const Outcome outcome = m_host.Call(*FindExport(query), session);
      EXPECT_EQ(ValueOf(outcome.result.value(), "KIND"), row.kind) << query << row.market;
    }
  }
}

TEST(FuturesLog, OrderBookIsTheOneResultThatIsNotLogged) {
  const std::string reply = "|68=5001|00=1|68=5001|01=";
  CRecordingHost host;
  for (const char* decoder : {"FutSubmitOrderDecode", "FutQueryReplyDecode",
                              "FutQueryInventoryDecode", "QueryFinanceDecode"}) {
    const Outcome outcome = host.Call(*FindExport(decoder), {Argument::Text(reply)});
    EXPECT_EQ(outcome.logLines, (std::vector<std::string>{outcome.result.value(), "~CGatewayPub"}));
  }
  const Outcome book = host.Call(*FindExport("FutQueryOrderDecode"), {Argument::Text(reply)});
  EXPECT_EQ(book.result, "0!");
  EXPECT_EQ(book.logLines, std::vector<std::string>{"~CGatewayPub"});
}

}  // namespace
}  // namespace gateway_tests
