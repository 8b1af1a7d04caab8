// The requests of futures queries.

#include <climits>

#include "gateway/futures/gateway_fut.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

class FuturesRequest : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.m_nMarket = 101;
    m_gateway.m_nSeqNo = 7;
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }

  std::string Orders(const char* date, int selection = 1) {
    return m_gateway.QueryOrderEncode(m_branch.c_str(), m_identity.c_str(), "pw", date, selection,
                                      &m_nStatus);
  }
  std::string FillsFrom(const char* start, const char* end) {
    return m_gateway.QueryReplyEncode(m_branch.c_str(), m_identity.c_str(), "pw", start, end,
                                      &m_nStatus);
  }
  std::string Inventory() {
    return m_gateway.QueryInventoryEncode(m_branch.c_str(), m_identity.c_str(), "pw", &m_nStatus);
  }
  std::string Finance(int type) {
    return m_gateway.QueryFinanceEncode(m_branch.c_str(), m_identity.c_str(), "pw", type,
                                        &m_nStatus);
  }

  CGatewayFut m_gateway;
  std::string m_branch = "F008", m_identity = "1234567&";
  int m_nStatus = 0;
};

// The header, plain and as it travels where blanks are escaped.
const std::string kHead =
    "F=7|KIND=F|BHNO=F008|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=SN0001|15=0|"
    "ACNO=1234567|PWD=pw|";
const std::string kEscapedHead =
    "F=7|KIND=F|BHNO=F008|CB=1|IP=10.0.0.1|11=NO%20DEFINE|VER=24369|65=0013452107|SN=SN0001|15=0|"
    "ACNO=1234567|PWD=pw|";

TEST_F(FuturesRequest, OrderBookRequest) {
  EXPECT_EQ(Orders("1130115"),
            kEscapedHead + "FUNC=x|FUNC1=0|SDATE=20240115||EDATE=20240115|28=1|01=");
  EXPECT_EQ(m_nStatus, 1);
  EXPECT_EQ(Orders("20240115", INT_MIN),
            kEscapedHead + "FUNC=x|FUNC1=0|SDATE=1130115||EDATE=1130115|28=-2147483648|01=");
  EXPECT_EQ(Orders("a b", 0), kEscapedHead + "FUNC=x|FUNC1=0|SDATE=a%20b||EDATE=a%20b|28=0|01=");
  const std::string odd(300, '1');
  EXPECT_EQ(Orders(odd.c_str(), 0),
            kEscapedHead + "FUNC=x|FUNC1=0|SDATE=" + odd + "||EDATE=" + odd + "|28=0|01=");
}

TEST_F(FuturesRequest, OrderBookRequestWithoutADateFailsBehindItsHeader) {
  m_log.Take();
  EXPECT_EQ(Orders(""), "[CLIENT]日期輸入錯誤");
  EXPECT_EQ(m_nStatus, -1);
  EXPECT_EQ(m_log.Take(), (Lines{"1234567", "", kHead}));
  EXPECT_EQ(Orders(nullptr), "[CLIENT]日期輸入錯誤");
  m_identity = "1234567";
  EXPECT_EQ(Orders(""), "[CLIENT] 身分證字號及帳號有誤！");
}

TEST_F(FuturesRequest, FillRequest) {
  EXPECT_EQ(FillsFrom("1130101", "1130115"),
            kEscapedHead + "FUNC=x|FUNC1=1|SDATE=20240101|EDATE=20240115|01=\n");
  EXPECT_EQ(m_nStatus, 1);
  EXPECT_EQ(FillsFrom("990101", "1x"),
            kEscapedHead + "FUNC=x|FUNC1=1|SDATE=20100101|EDATE=19110001|01=\n");
}

TEST_F(FuturesRequest, FillRequestNamesAllAndHasBothDates) {
  m_log.Take();
  for (const char* bad : {"0", "0000000", "x", " ", "-19110000"}) {
    EXPECT_EQ(FillsFrom(bad, "1130115"), "[CLIENT]起訖日期錯誤") << bad;
    EXPECT_EQ(m_nStatus, -1);
    EXPECT_EQ(FillsFrom("1130115", bad), "[CLIENT]起訖日期錯誤") << bad;
    EXPECT_EQ(m_nStatus, -1);
  }
  for (const char* missing : {"", static_cast<const char*>(nullptr)}) {
    const char* texts[] = {"F008", "1234567&", "pw", "1130101", "1130115"};
    for (const char*& text : texts) {
      const char* const kept = text;
      text = missing;
      EXPECT_STREQ(
          m_gateway.QueryReplyEncode(texts[0], texts[1], texts[2], texts[3], texts[4], &m_nStatus),
          "[CLIENT]傳入的參數錯誤");
      EXPECT_EQ(m_nStatus, -1);
      text = kept;
    }
  }
  EXPECT_EQ(m_log.Take(), Lines{}) << "no header was begun";
}

TEST_F(FuturesRequest, PositionRequestIsNotEscaped) {
  EXPECT_EQ(Inventory(), kHead + "FUNC=O|01=");
  EXPECT_EQ(m_nStatus, 1);
  for (const char* missing : {"", static_cast<const char*>(nullptr)}) {
    const char* texts[] = {"F008", "1234567&", "pw"};
    for (const char*& text : texts) {
      const char* const kept = text;
      text = missing;
      EXPECT_STREQ(m_gateway.QueryInventoryEncode(texts[0], texts[1], texts[2], &m_nStatus),
                   "傳入的參數錯誤");
      EXPECT_EQ(m_nStatus, -1);
      text = kept;
    }
  }
}

TEST_F(FuturesRequest, MarginRequestMapsItsQueryType) {
  const struct {
    int type;
    const char* sent;
  } rows[] = {{0, "3"},
              {1, "1"},
              {2, "2"},
              {3, "5"},
              {4, "5"},
              {5, "5"},
              {6, "6"},
              {-1, "-1"},
              {-3, "-3"},
              {100, "100"},
              {99, "99"},
              {INT_MAX, "2147483647"},
              {INT_MIN, "-2147483648"}};
  for (const auto& row : rows) {
    EXPECT_EQ(Finance(row.type), kEscapedHead + "FUNC=P|28=" + row.sent + "|01=") << row.type;
    EXPECT_EQ(m_nStatus, 1);
  }
  EXPECT_STREQ(m_gateway.QueryFinanceEncode("", "", "", 1, &m_nStatus),
               "F=7|KIND=F|BHNO=|CB=1|IP=10.0.0.1|11=NO%20DEFINE|VER=24369|65=0013452107|SN=SN0001|"
               "FUNC=P|28=1|01=");
}

TEST_F(FuturesRequest, RequestsWithAFailedHeaderAreItsMessageUnescaped) {
  const auto all = [this](const std::string& message) {
    for (const std::string& request :
         {Orders("1130115"), FillsFrom("1130101", "1130115"), Inventory(), Finance(1)}) {
      EXPECT_EQ(request, message);
      EXPECT_EQ(m_nStatus, -1);
    }
  };
  m_identity = "1&2";
  all("[CLIENT] 帳號或身份證字號輸入錯誤");
  m_identity = "1234567";
  all("[CLIENT] 身分證字號及帳號有誤！");
  m_identity = "1234567&";
  m_branch.assign(4096, 'b');
  all("[CLIENT]傳入的參數錯誤");
  m_branch = "F008";
  m_gateway.setLocalIP("");
  all("[CLIENT] 無法取得IP，請確認網路連線是否正常！");
}

TEST_F(FuturesRequest, RequestThatGrowsPastItsBufferByItsEscapesIsAParameterError) {
  const size_t bare = Finance(1).size() - 4;
  m_branch.assign((CGatewayPub::kBufferSize - 1 - bare) / 3, ' ');
  EXPECT_EQ(Finance(1).size(), bare + 3 * m_branch.size());
  EXPECT_EQ(m_nStatus, 1);
  m_branch += ' ';
  EXPECT_EQ(Finance(1), "[CLIENT]傳入的參數錯誤");
  EXPECT_EQ(m_nStatus, -1);
}

}  // namespace
}  // namespace gateway_tests
