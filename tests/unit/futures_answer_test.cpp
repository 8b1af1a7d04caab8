// The gateway's answers to futures and options orders.

#include "gateway/futures/gateway_fut.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

class FuturesAnswer : public CSessionTest {
 protected:
  std::string Decode(const std::string& reply) {
    m_nStatus = 0;
    return m_gateway.SubmitOrderDecode(CTextAtPageEnd(reply), &m_nStatus);
  }

  CGatewayFut m_gateway;
  int m_nStatus = 0;
};

struct Answer {
  const char* name;
  std::string reply, result;
  int status;
};

TEST_F(FuturesAnswer, EveryKind) {
  const std::string good = "F=1|39= |19=S|46=A0001|44=1130115";
  const Answer rows[] = {
      {"empty reply", "", "委託單傳送中!!", 1},
      {"gateway down", "[GATEWAY]error", "[GATEWAY]主機連線失敗", -1},
      {"broker down", good + "|[BROKER]timeout", "[BROKER]主機連線失敗", -1},
      {"S", good, "A0001@20240115@@1@@!", 1},
      {"T", "|39= |19=T|46=A|44=", "A@@@1@@!", 1},
      {"Y", "|39= |19=Y|46=A|44=20240115", "A@1130115@@1@@!", 1},
      {"X is not accepted", "|39= |19=X|46=A|44=1130115|MT=1", "A@20240115@@0@1@!", 1},
      {"first character of 19 judges", "|39= |19=XS|46=A", "A@@@0@@!", 1},
      {"first character of 19 judges, accepted", "|39= |19=SX|46=A", "A@@@1@@!", 1},
      {"first character of MT", good + "|MT=0x", "A0001@20240115@@1@0@!", 1},
      {"other MT", good + "|MT=2", "A0001@20240115@@1@@!", 1},
      {"lower case is no such code", "|39= |19=s|K1=no", "no", -1},
      {"empty 19", "|39= |19=|K1=no", "no", -1},
      {"no 19", "|39= |K1=no", "no", -1},
      {"19 takes the first K1 as it is", "|39= |19=N|K1= |K1=no", " ", -1},
      {"no 39", "|19=S|46=A|K1=no", "no", -1},
      {"39 of two blanks", "|39=  |19=S|46=A|K1=no", "no", -1},
      {"empty 39", "|39=|19=S|46=A|K1=no", "no", -1},
      {"39 passes over blank K1", "|39=E|K1=|K1= |K1=no", "no", -1},
      {"39 without K1", "|39=E", "", -1},
      {"39 at the very start is not found", "39= |19=S|46=A|K1=no", "no", -1},
      {"K1 of 127", "|39=E|K1=" + std::string(127, 'k'), std::string(127, 'k'), -1},
      {"K1 of 128 is dropped", "|39=E|K1=" + std::string(128, 'k'), "", -1},
      {"K1 of 127 beside 19", "|39= |19=N|K1=" + std::string(127, 'k'), std::string(127, 'k'), -1},
      {"K1 of 128 beside 19 is dropped", "|39= |19=N|K1=" + std::string(128, 'k'), "", -1},
      {"46 of 127", "|39= |19=S|46=" + std::string(127, 'n'), std::string(127, 'n') + "@@@1@@!", 1},
      {"46 of 128 is dropped", "|39= |19=S|46=" + std::string(128, 'n'), "@@@1@@!", 1},
      {"44 of 15", "|39= |19=S|44=123456789012345", "@123456789012345@@1@@!", 1},
      {"44 of 16 is dropped", "|39= |19=S|44=1234567890123456", "@@@1@@!", 1},
      {"19 of 127", "|39= |19=S" + std::string(126, 'x'), "@@@1@@!", 1},
      {"19 of 128 is dropped", "|39= |19=S" + std::string(127, 'x') + "|K1=no", "no", -1},
  };
  for (const Answer& row : rows) {
    EXPECT_EQ(Decode(row.reply), row.result) << row.name;
    EXPECT_EQ(m_nStatus, row.status) << row.name;
  }
  EXPECT_STREQ(m_gateway.SubmitOrderDecode(nullptr, &m_nStatus), "委託單傳送中!!");
  EXPECT_EQ(m_log.Take(), Lines{});
}

}  // namespace
}  // namespace gateway_tests
