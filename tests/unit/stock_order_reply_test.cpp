// What the gateway answers to stock orders.

#include <functional>

#include "gateway/stock/gateway_stk.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kInTransit = "委託單傳送中!!";
const std::string kGatewayDown = "[GATEWAY]主機連線失敗";
const std::string kBrokerDown = "[BROKER]主機連線失敗";

struct Answer {
  std::string text;
  int status;
};

bool operator==(const Answer& a, const Answer& b) {
  return a.text == b.text && a.status == b.status;
}

void PrintTo(const Answer& answer, std::ostream* out) {
  *out << answer.text << " / " << answer.status;
}

class StockOrderReplies : public CSessionTest {
 protected:
  using Method = decltype(&CGatewayStk::SubmitOrderDecode);

  Answer Read(Method method, const std::string& reply) {
    CGatewayStk gateway;
    int status = 77;
    m_log.Take();
    const char* const text = std::invoke(method, gateway, CTextAtPageEnd(reply), &status);
    EXPECT_EQ(m_log.Take(), Lines{});
    return {text, status};
  }

  Answer ReadNew(const std::string& reply) { return Read(&CGatewayStk::SubmitOrderDecode, reply); }
  Answer ReadAmended(const std::string& reply) {
    return Read(&CGatewayStk::CancelChangeOrderDecode, reply);
  }
};

struct Refusal {
  const char* label;
  std::string reply, text;
};

TEST_F(StockOrderReplies, RefusalsReadAlikeInBothDecoders) {
  const Refusal rows[] = {
      {"empty reply, before the transport is asked", "", kInTransit},
      {"gateway error", "[GATEWAY]error|39= |19=S", kGatewayDown},
      {"broker time-out", "|39= |19=S|K1=[BROKER]timeout", kBrokerDown},
      {"no field 39", "|19=S|K1=refused", "refused"},
      {"field 39 empty", "|39=|19=S|K1=refused", "refused"},
      {"field 39 of two blanks", "|39=  |19=S|K1=refused", "refused"},
      {"field 39 with another character", "|39=E|19=S|K1=refused", "refused"},
      {"field 39 of 20 characters", "|39= 1234567890123456789|19=S|K1=refused", "refused"},
      {"the first field 39 counts", "|39=E|39= |19=S|K1=refused", "refused"},
      {"field 39 without a bar before it", "39= |19=S|K1=refused", "refused"},
      {"no field 19", "|39= |K1=refused", "refused"},
      {"field 19 empty", "|39= |19=|K1=refused", "refused"},
      {"field 19 with another letter", "|39= |19=R|K1=refused", "refused"},
      {"field 19 in lower case", "|39= |19=s|K1=refused", "refused"},
      {"field 19 that begins with a blank", "|39= |19= S|K1=refused", "refused"},
      {"field 19 too long for its buffer", "|39= |19=S1234567890123456789|K1=refused", "refused"},
      {"no text", "|39=E", ""},
      {"text of the longest size", "|39=E|K1=" + std::string(199, 'k'), std::string(199, 'k')},
      {"text too long for its buffer", "|39=E|K1=" + std::string(200, 'k'), ""},
      {"text without a source stays as it is", "|39=E|K1=餘額不足(E12)", "餘額不足(E12)"},
  };
  for (const Refusal& row : rows) {
    EXPECT_EQ(ReadNew(row.reply), (Answer{row.text, -1})) << row.label;
    EXPECT_EQ(ReadAmended(row.reply), (Answer{row.text, -1})) << row.label;
  }
}

TEST_F(StockOrderReplies, NullReplyReadsAsAnEmptyOne) {
  CGatewayStk gateway;
  int status = 0;
  EXPECT_EQ(gateway.SubmitOrderDecode(nullptr, &status), kInTransit);
  EXPECT_EQ(status, -1);
}

TEST_F(StockOrderReplies, FirstCharacterOfField19Decides) {
  for (int byte = 1; byte < 256; ++byte) {
    const char c = static_cast<char>(byte);
    if (c == '|') continue;
    const std::string reply = std::string("|39= |19=") + c + "9|K1=no|46=G1";
    const bool taken = std::string("STXY").find(c) != std::string::npos;
    EXPECT_EQ(ReadNew(reply),
              taken ? (Answer{c == 'X' ? "G1@@@0!" : "G1@@@1!", 1}) : (Answer{"no", -1}))
        << byte;
    EXPECT_EQ(ReadAmended(reply), taken ? (Answer{"", 1}) : (Answer{"no", -1})) << byte;
  }
}

struct Accepted {
  const char* label;
  std::string fields, text;
};

TEST_F(StockOrderReplies, AcceptedOrderShowsNumberAndDate) {
  const std::string number(1999, 'n');
  const Accepted rows[] = {
      {"a western date", "|46=G0002|44=20240115", "G0002@1130115@@1!"},
      {"a date of this calendar", "|46=G0002|44=1130115", "G0002@20240115@@1!"},
      {"a short year", "|46=G0002|44=990101", "G0002@20100101@@1!"},
      {"no date", "|46=G0002", "G0002@@@1!"},
      {"a date of zeros", "|46=G0002|44=00000000", "G0002@00000000@@1!"},
      {"no number", "|44=20240115", "@1130115@@1!"},
      {"long values", "|46=" + number + "|44=" + number, number + "@" + number + "@@1!"},
  };
  for (const Accepted& row : rows) {
    EXPECT_EQ(ReadNew("|39= |19=S" + row.fields), (Answer{row.text, 1})) << row.label;
    EXPECT_EQ(ReadAmended("|39= |19=S" + row.fields), (Answer{"", 1})) << row.label;
  }
}

TEST_F(StockOrderReplies, AcceptedCancellationSaysNothingOfAnEarlierRefusal) {
  CGatewayStk gateway;
  int status = 77;
  EXPECT_STREQ(gateway.CancelChangeOrderDecode("|39=E|K1=closed", &status), "closed");
  EXPECT_EQ(status, -1);
  status = 1;
  EXPECT_STREQ(gateway.CancelChangeOrderDecode("|39= |19=S", &status), "");
  EXPECT_EQ(status, 1);
}

}  // namespace
}  // namespace gateway_tests
