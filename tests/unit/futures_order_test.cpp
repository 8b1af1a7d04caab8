// Futures and options orders: the body, the signature payload, the request.

#include <algorithm>
#include <climits>

#include "gateway/futures/gateway_fut.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kParameterError = "[CLIENT]傳入的參數錯誤";
const std::string kAnyPrice = "17500.0000";

struct Order {
  const char* reference = "";
  const char* date = "";
  const char* commodity1 = "TXO";
  const char* commodity2 = "TXO";
  const char* month1 = "202401";
  const char* month2 = "202402";
  const char* strike1 = "17500";
  const char* strike2 = "17600";
  const char* callPut1 = "C";
  const char* callPut2 = "P";
  int n6 = 0;
  int kind = 1;
  int priceType = 2;
  char function = 'I';
  char w3 = '0';
  char timeInForce = 'R';
  char side1 = 'B';
  char side2 = 'S';
  int quantity = 3;
  int price = 175000000;
};

Order OfKind(int kind, char function = 'I') {
  Order order;
  order.kind = kind;
  order.function = function;
  order.reference = "A0001&B0002&C";
  return order;
}

class FuturesOrder : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.m_nMarket = 101;
    m_gateway.m_nSeqNo = 7;
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }

  // The body or, when the order is refused, the message; the payload goes to m_payload.
  std::string Record(const Order& o, bool inPlaces = false, const std::string& key = "KEY") {
    const CRoomAtPageEnd body(CGatewayFut::kBodySize, '\0');
    const CRoomAtPageEnd signature(CGatewayPub::kBufferSize, '\0');
    key.copy(signature, key.size());
    const auto method =
        inPlaces ? &CGatewayFut::EncodeSubmitOrderRecord1 : &CGatewayFut::EncodeSubmitOrderRecord;
    m_nReturned = (m_gateway.*method)(
        o.reference, o.date, o.commodity1, o.commodity2, o.month1, o.month2, o.strike1, o.strike2,
        o.callPut1, o.callPut2, static_cast<char>(o.n6), static_cast<char>(o.kind),
        static_cast<char>(o.priceType), o.function, o.w3, o.timeInForce, 'x', o.side1, o.side2,
        o.quantity, 99, o.price, body, signature);
    m_payload = std::string(signature);
    return std::string(body);
  }

  std::string Request(const Order& o, bool signedHead = false) {
    const auto method =
        signedHead ? &CGatewayFut::SubmitOrderEncode1 : &CGatewayFut::SubmitOrderEncode;
    m_nStatus = 0;
    return (m_gateway.*method)(
        m_branch.c_str(), m_identity.c_str(), "pw", o.reference, o.date, o.commodity1, o.commodity2,
        o.month1, o.month2, o.strike1, o.strike2, o.callPut1, o.callPut2, static_cast<char>(o.n6),
        static_cast<char>(o.kind), static_cast<char>(o.priceType), o.function, o.w3, o.timeInForce,
        'x', o.side1, o.side2, o.quantity, 99, o.price, &m_nStatus);
  }

  CGatewayFut m_gateway;
  std::string m_branch = "F008", m_identity = "A123456789&1234567";
  std::string m_payload;
  int m_nReturned = -1;
  int m_nStatus = 0;
};

std::string ValueOf(const std::string& text, const std::string& tag) {
  const size_t at = text.find("|" + tag + "=");
  if (at == std::string::npos) return "(absent)";
  const size_t from = at + tag.size() + 2;
  return text.substr(from, text.find('|', from) - from);
}

TEST_F(FuturesOrder, ObjectStartsWithoutPositionsAndLogsAsItsBaseAlone) {
  alignas(CGatewayFut) char memory[sizeof(CGatewayFut)];
  memset(memory, 0x5a, sizeof memory);
  auto* gateway = new (memory) CGatewayFut;
  EXPECT_EQ(gateway->m_nFutDataSize, 0);
  EXPECT_EQ(gateway->m_nFutDataLen, 0);
  EXPECT_EQ(gateway->m_pFutData, nullptr);
  EXPECT_EQ(gateway->m_nOptDataSize, 0);
  EXPECT_EQ(gateway->m_nOptDataLen, 0);
  EXPECT_EQ(gateway->m_pOptData, nullptr);
  EXPECT_EQ(sizeof gateway->m_szSignature, 4096U);
  EXPECT_TRUE(std::has_virtual_destructor_v<CGatewayFut>);
  gateway->AppendFutData("futures", 7, false);
  gateway->AppendOptData("options", 7, false);
  gateway->~CGatewayFut();
  EXPECT_EQ(m_log.Take(), Lines{"~CGatewayPub"});
}

TEST_F(FuturesOrder, BodiesOfNewOrders) {
  const std::string head =
      "|27=2|28=0|29=202401|30=3|31=17500.0000|M8=|32=B|33=TXO|34=17500|O4=0|V5=0";
  const std::string leg2 = "|EL=S|V9=TXO|W0=202402|W1=P|W2=17600|EM=3";
  const std::string expected[] = {head + "|V6=|V8=C|W3=0", head + "|V6=|V8=C|W3=0",
                                  head + "|V6=5|V8=C" + leg2 + "|W3=0",
                                  head + "|V6=7|V8=C" + leg2 + "|W3=0"};
  for (const bool inPlaces : {false, true}) {
    for (int kind = 1; kind <= 4; ++kind) {
      EXPECT_EQ(Record(OfKind(kind), inPlaces), expected[kind - 1]) << kind;
      EXPECT_EQ(m_nReturned, 1);
    }
  }
}

TEST_F(FuturesOrder, BodiesOfChangesAndCancelsNameTheOrder) {
  const std::string head =
      "|27=2|28=0|29=202401|30=3|31=17500.0000|M8=|32=B|33=TXO|34=17500|O4=0|V5=0";
  const std::string leg2 = "|EL=S|V9=TXO|W0=202402|W1=P|W2=17600";
  const std::string tail = "|36=A0001|46=B0002|37=3";
  for (const char function : {'C', 'A', 'D', 'x', '\0', 'i'}) {
    for (const bool inPlaces : {false, true}) {
      EXPECT_EQ(Record(OfKind(1, function), inPlaces), head + "|V6=|V8=C" + tail);
      EXPECT_EQ(Record(OfKind(3, function), inPlaces), head + "|V6=5|V8=C" + leg2 + tail);
      EXPECT_EQ(Record(OfKind(4, function), inPlaces), head + "|V6=7|V8=C" + leg2 + tail);
    }
  }
}

TEST_F(FuturesOrder, PayloadOfEveryCase) {
  const std::string one = "_R_B_TXO_202401_17500_C";
  const std::string two = "_S_TXO_202402_17600_P";
  const std::string one1 = ",R,0,2,B,TXO,202401,17500,C";
  const std::string two1 = ",S,TXO,202402,17600,P";
  const struct {
    int kind;
    char function;
    std::string plain, inPlaces;
  } rows[] = {
      {1, 'I', one + "_3_17500.0000", one1 + ",,,,,,3,17500.0000,"},
      {2, 'I', one + "_3_17500.0000", one1 + ",,,,,,3,17500.0000,"},
      {3, 'I', one + two + "_3_17500.0000", one1 + two1 + ",3,17500.0000,"},
      {4, 'I', one + two + "_3_17500.0000", one1 + two1 + ",3,17500.0000,"},
      {1, 'A', "_A0001", ",R,,,,,,,,,,,,,3,17500.0000,A0001"},
      {3, 'A', "_A0001", ",R,,,,,,,,,,,,,3,17500.0000,A0001"},
      {1, 'C', "_A0001_3", ",,,,,,,,,,,,,,3,,A0001"},
      {4, 'C', "_A0001_3", ",,,,,,,,,,,,,,3,,A0001"},
      {1, 'D', "_A0001", ",,,,,,,,,,,,,,0,,A0001"},
      {2, '\0', "_A0001", ",,,,,,,,,,,,,,0,,A0001"},
  };
  for (const auto& row : rows) {
    Record(OfKind(row.kind, row.function));
    EXPECT_EQ(m_payload, "!!KEY" + row.plain) << row.kind << row.function;
    Record(OfKind(row.kind, row.function), true);
    EXPECT_EQ(m_payload, "|PL=S!!KEY" + row.inPlaces) << row.kind << row.function;
    EXPECT_EQ(std::count(m_payload.begin(), m_payload.end(), ','), 16) << m_payload;
  }
}

TEST_F(FuturesOrder, EveryKindNamesWhatItNeeds) {
  using Text = const char* Order::*;
  const struct {
    const char* name;
    Text text;
    bool neededBy[5];
  } rows[] = {
      {"commodity 1", &Order::commodity1, {false, true, true, true, true}},
      {"month 1", &Order::month1, {false, true, true, true, true}},
      {"strike 1", &Order::strike1, {false, false, true, true, false}},
      {"call/put 1", &Order::callPut1, {false, false, true, true, false}},
      {"commodity 2", &Order::commodity2, {false, false, false, true, true}},
      {"month 2", &Order::month2, {false, false, false, true, true}},
      {"strike 2", &Order::strike2, {false, false, false, true, false}},
      {"call/put 2", &Order::callPut2, {false, false, false, true, false}},
  };
  for (const auto& row : rows) {
    for (int kind = 1; kind <= 4; ++kind) {
      for (const char* missing : {"", static_cast<const char*>(nullptr)}) {
        for (const char function : {'I', 'D'}) {
          Order order = OfKind(kind, function);
          order.*row.text = missing;
          const std::string body = Record(order);
          EXPECT_EQ(m_nReturned, row.neededBy[kind] ? 0 : 1) << row.name << ", kind " << kind;
          EXPECT_EQ(body == kParameterError, row.neededBy[kind]) << row.name << ", kind " << kind;
          EXPECT_EQ(m_payload == "KEY", row.neededBy[kind]);
        }
      }
    }
  }
}

TEST_F(FuturesOrder, KindOneWithEmptyStrikeAndCallPutPassesAndKindTwoDoesNot) {
  Order order = OfKind(1);
  order.strike1 = order.callPut1 = "";
  EXPECT_EQ(ValueOf(Record(order), "V6"), "");
  EXPECT_EQ(m_payload, "!!KEY_R_B_TXO_202401___3_17500.0000");
  Record(order, true);
  EXPECT_EQ(m_payload, "|PL=S!!KEY,R,0,2,B,TXO,202401,,,,,,,,3,17500.0000,");
  order = OfKind(2);
  order.callPut1 = "";
  EXPECT_EQ(Record(order), kParameterError);
}

// What a NUL character cuts off does not count against the room, however long it is.
TEST_F(FuturesOrder, PieceThatANulEndsNeedsRoomForItsBeginningAlone) {
  const std::string huge(CGatewayPub::kBufferSize, 'h');
  for (const int kind : {2, 4}) {
    for (const char timeInForce : {'R', '\0'}) {
      Order order = OfKind(kind);
      order.commodity1 = order.strike1 = huge.c_str();
      order.side1 = '\0';
      order.timeInForce = timeInForce;
      const std::string body = Record(order);
      EXPECT_EQ(m_nReturned, 1) << kind;
      EXPECT_NE(body.find("|32=|O4="), std::string::npos) << kind;
      EXPECT_EQ(m_payload, timeInForce == 'R' ? "!!KEY_R_" : "!!KEY_");
    }
  }
  Order order = OfKind(4);
  order.commodity2 = huge.c_str();
  order.side2 = '\0';
  const std::string body = Record(order);
  EXPECT_EQ(m_nReturned, 1);
  EXPECT_NE(body.find("|EL=|W3="), std::string::npos);
}

TEST_F(FuturesOrder, KindsBesidesTheFourAreRefused) {
  for (int kind = -128; kind <= 127; ++kind) {
    Record(OfKind(kind));
    EXPECT_EQ(m_nReturned, kind >= 1 && kind <= 4 ? 1 : 0) << kind;
  }
}

TEST_F(FuturesOrder, PriceTypesOneAndThreeAreAtTheMarketAndAllAreSentUnsigned) {
  for (int type = -128; type <= 127; ++type) {
    Order order = OfKind(1);
    order.priceType = type;
    const std::string body = Record(order, true);
    const bool market = type == 1 || type == 3;
    EXPECT_EQ(ValueOf(body, "31"), market ? "00000000.000000" : kAnyPrice) << type;
    const std::string printed = std::to_string(type & 0xff);
    EXPECT_EQ(ValueOf(body, "27"), printed);
    EXPECT_NE(m_payload.find(",R,0," + printed + ",B,"), std::string::npos) << m_payload;
  }
}

TEST_F(FuturesOrder, PricesAndQuantitiesAtTheirEnds) {
  const struct {
    int price;
    const char* text;
  } prices[] = {{INT_MIN, "-214748.-3648"},
                {-1, "0.-001"},
                {0, "0.0000"},
                {1, "0.0001"},
                {99, "0.0099"},
                {100, "0.0100"},
                {9999, "0.9999"},
                {10000, "1.0000"},
                {INT_MAX, "214748.3647"}};
  for (const auto& row : prices) {
    Order order = OfKind(1);
    order.price = row.price;
    EXPECT_EQ(ValueOf(Record(order), "31"), row.text);
    EXPECT_EQ(m_payload, std::string("!!KEY_R_B_TXO_202401_17500_C_3_") + row.text);
  }
  for (const int quantity : {INT_MIN, -1, 0, 1, 99, 100, INT_MAX}) {
    const std::string printed = std::to_string(quantity);
    Order order = OfKind(3);
    order.quantity = quantity;
    const std::string body = Record(order);
    EXPECT_EQ(ValueOf(body, "30"), printed);
    EXPECT_EQ(ValueOf(body, "EM"), printed);
    order.function = 'C';
    EXPECT_EQ(ValueOf(Record(order), "37"), printed);
    EXPECT_EQ(m_payload, "!!KEY_A0001_" + printed);
  }
}

TEST_F(FuturesOrder, TimeInForceSetsOneFlagAtMost) {
  for (int letter = 0; letter <= 255; ++letter) {
    Order order = OfKind(1);
    order.timeInForce = static_cast<char>(letter);
    const std::string body = Record(order);
    EXPECT_EQ(ValueOf(body, "O4"), letter == 'F' ? "1" : "0") << letter;
    EXPECT_EQ(ValueOf(body, "V5"), letter == 'I' ? "1" : "0") << letter;
  }
}

TEST_F(FuturesOrder, CombinationCodes) {
  const std::string sixteen(16, 'c');
  const std::string eight(8, 'p');
  const struct {
    const char* name;
    char side1, side2;
    std::string commodity1, commodity2, month1, month2, callPut1, callPut2;
    const char* code;
  } rows[] = {
      {"equal sides, equal commodities", 'B', 'B', "TXO", "TXO", "1", "2", "C", "P", "3"},
      {"equal sides, other commodities", 'B', 'B', "TXO", "TEO", "1", "1", "C", "C", "4"},
      {"sides are compared as they are", 'x', 'x', "TXO", "TXO", "1", "1", "C", "C", "3"},
      {"equal in 16 characters", 'S', 'S', sixteen + "1", sixteen + "2", "1", "1", "C", "C", "3"},
      {"other in the 16th", 'S', 'S', sixteen.substr(1) + "1", sixteen.substr(1) + "2", "1", "1",
       "C", "C", "4"},
      {"one is a start of the other", 'S', 'S', "TXO", "TXO1", "1", "1", "C", "C", "4"},
      {"other call/put", 'B', 'S', "TXO", "TXO", "1", "1", "C", "P", "5"},
      {"call/put other in the 8th", 'B', 'S', "TXO", "TXO", "1", "1", eight.substr(1) + "1",
       eight.substr(1) + "2", "5"},
      {"call/put equal in 8", 'B', 'S', "TXO", "TXO", "1", "1", eight + "1", eight + "2", "1"},
      {"equal months", 'B', 'S', "TXO", "TXO", "202401", "202401", "C", "C", "1"},
      {"commodities do not matter then", 'S', 'B', "TXO", "TEO", "202401", "202401", "P", "P", "1"},
      {"other months", 'B', 'S', "TXO", "TXO", "202401", "202402", "C", "C", "2"},
      {"months equal in 16", 'B', 'S', "TXO", "TXO", sixteen + "1", sixteen + "2", "C", "C", "1"},
  };
  for (const auto& row : rows) {
    Order order = OfKind(3);
    order.side1 = row.side1;
    order.side2 = row.side2;
    order.commodity1 = row.commodity1.c_str();
    order.commodity2 = row.commodity2.c_str();
    order.month1 = row.month1.c_str();
    order.month2 = row.month2.c_str();
    order.callPut1 = row.callPut1.c_str();
    order.callPut2 = row.callPut2.c_str();
    EXPECT_EQ(ValueOf(Record(order), "V6"), row.code) << row.name;
    order.kind = 4;
    EXPECT_EQ(ValueOf(Record(order), "V6"), "7") << row.name;
    order.kind = 2;
    EXPECT_EQ(ValueOf(Record(order), "V6"), "") << row.name;
  }
}

TEST_F(FuturesOrder, NulCharacterEndsItsOwnPieceAlone) {
  Order order = OfKind(3);
  order.side1 = '\0';
  EXPECT_EQ(Record(order),
            "|27=2|28=0|29=202401|30=3|31=17500.0000|M8=|32=|O4=0|V5=0|V6=5|V8=C"
            "|EL=S|V9=TXO|W0=202402|W1=P|W2=17600|EM=3|W3=0");
  EXPECT_EQ(m_payload, "!!KEY_R_");
  Record(order, true);
  EXPECT_EQ(m_payload, "|PL=S!!KEY,R,0,2,");

  order = OfKind(4);
  order.side2 = '\0';
  EXPECT_EQ(Record(order),
            "|27=2|28=0|29=202401|30=3|31=17500.0000|M8=|32=B|33=TXO|34=17500|O4=0|V5=0|V6=7|V8=C"
            "|EL=|W3=0");
  EXPECT_EQ(m_payload, "!!KEY_R_B_TXO_202401_17500_C_");

  order = OfKind(1);
  order.w3 = '\0';
  EXPECT_EQ(ValueOf(Record(order, true), "W3"), "");
  EXPECT_EQ(m_payload, "|PL=S!!KEY,R,");
  Record(order);
  EXPECT_EQ(m_payload, "!!KEY_R_B_TXO_202401_17500_C_3_17500.0000");

  order = OfKind(1, 'A');
  order.timeInForce = '\0';
  Record(order, true);
  EXPECT_EQ(m_payload, "|PL=S!!KEY,");
  order.function = 'I';
  Record(order);
  EXPECT_EQ(m_payload, "!!KEY_");
}

TEST_F(FuturesOrder, ReferenceValuesOfOneTo47Characters) {
  const std::string fits(47, 'r');
  const std::string tooLong(48, 'r');
  const struct {
    std::string reference, first, second;
  } rows[] = {
      {"", "", ""},
      {"A", "A", ""},
      {"A&", "A", ""},
      {"&B", "", "B"},
      {"A&B", "A", "B"},
      {"A&B&C", "A", "B"},
      {"A&&C", "A", ""},
      {"&", "", ""},
      {fits + "&" + fits, fits, fits},
      {tooLong + "&B", "", "B"},
      {"A&" + tooLong, "A", ""},
      {std::string(5000, 'x') + "&B", "", "B"},
      {tooLong, "", ""},
  };
  for (const auto& row : rows) {
    Order order = OfKind(1, 'D');
    order.reference = row.reference.c_str();
    const std::string body = Record(order);
    EXPECT_EQ(ValueOf(body, "36"), row.first);
    EXPECT_EQ(ValueOf(body, "46"), row.second);
    EXPECT_EQ(m_payload, "!!KEY_" + row.first);
  }
}

TEST_F(FuturesOrder, RecordGoesBehindWhatTheBodyHeldAndFailsAlone) {
  const CRoomAtPageEnd body(CGatewayFut::kBodySize, '\0');
  const CRoomAtPageEnd signature(CGatewayPub::kBufferSize, '\0');
  const auto encode = [&](char kind, const char* commodity) {
    return m_gateway.EncodeSubmitOrderRecord("", "", commodity, "", "1", "", "", "", "", "", 0,
                                             kind, 1, 'I', 'w', 'R', 0, 'B', 0, 1, 0, 0, body,
                                             signature);
  };
  strcpy(body, "before");
  EXPECT_EQ(encode(1, "T"), 1);
  EXPECT_STREQ(body,
               "before|27=1|28=0|29=1|30=1|31=00000000.000000|M8=|32=B|33=T|34=|O4=0|V5=0|V6=|V8="
               "|W3=w");
  EXPECT_EQ(encode(9, "T"), 0);
  EXPECT_EQ(std::string(body), kParameterError);
  const std::string huge(5000, 'T');
  EXPECT_EQ(encode(1, huge.c_str()), 0);
  EXPECT_EQ(std::string(body), kParameterError);
}

TEST_F(FuturesOrder, BodyThatFillsItsBufferIsWholeAndOneCharacterMoreFails) {
  for (bool inPlaces : {false, true}) {
    for (char function : {'I', 'C'}) {
      Order order = OfKind(1, function);
      order.commodity1 = "T";
      const size_t rest = Record(order, inPlaces).size() - 1;
      const std::string longest(CGatewayFut::kBodySize - 1 - rest, 'T');
      order.commodity1 = longest.c_str();
      EXPECT_EQ(Record(order, inPlaces).size(), CGatewayFut::kBodySize - 1);
      EXPECT_EQ(m_nReturned, 1);
      const std::string over = longest + "T";
      order.commodity1 = over.c_str();
      EXPECT_EQ(Record(order, inPlaces), kParameterError);
      EXPECT_EQ(m_nReturned, 0);
    }
  }
}

TEST_F(FuturesOrder, PayloadThatDoesNotFitIsAParameterError) {
  EXPECT_EQ(Record(OfKind(1), false, std::string(4000, 'k')).substr(0, 4), "|27=");
  EXPECT_EQ(m_payload.size(), 2 + 4000 + strlen("_R_B_TXO_202401_17500_C_3_17500.0000"));
  EXPECT_EQ(Record(OfKind(1), false, std::string(4095, 'k')), kParameterError);
  EXPECT_EQ(m_nReturned, 0);
}

const std::string kHead =
    "F=1|KIND=F|BHNO=F008|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=SN0001|65=0013452107|14=I"
    "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw|21=20240115|22=134521|23=13452107|24=5|V4=";
const std::string kBody =
    "|27=2|28=0|29=202401|30=3|31=17500.0000|M8=|32=B|33=TXO|34=17500|O4=0|V5=0|V6=|V8=C|W3=0";

TEST_F(FuturesOrder, RequestIsHeaderBodyN6AndPayload) {
  Order order = OfKind(2);
  order.date = "1130116";
  order.n6 = -1;
  EXPECT_EQ(Request(order), kHead + "|44=20240116" + kBody +
                                "|N6=255!!F008_1234567_A123456789_I_R_B_TXO_202401_17500_C_3_"
                                "17500.0000");
  EXPECT_EQ(m_nStatus, 1);
  EXPECT_STREQ(m_gateway.m_szSignature,
               "!!F008_1234567_A123456789_I_R_B_TXO_202401_17500_C_3_17500.0000");
  EXPECT_EQ(m_log.Take(), Lines{kHead + "|44=20240116"});
  EXPECT_EQ(Request(order, true),
            kHead + kBody +
                "|N6=255|PL=S!!SN0001,10.0.0.1,20240115,F008-1234567,A123456789,I,R,0,2,B,TXO,"
                "202401,17500,C,,,,,,3,17500.0000,");
  EXPECT_EQ(m_nStatus, 1);
  EXPECT_EQ(m_log.Take(), Lines{kHead});
}

TEST_F(FuturesOrder, N6IsSentUnsigned) {
  for (int n6 = -128; n6 <= 127; ++n6) {
    Order order = OfKind(1);
    order.n6 = n6;
    const std::string request = Request(order, true);
    EXPECT_EQ(ValueOf(request, "N6"), std::to_string(n6 & 0xff));
  }
}

TEST_F(FuturesOrder, RefusedBodyStandsBehindItsHeader) {
  for (const bool signedHead : {false, true}) {
    EXPECT_EQ(Request(OfKind(5), signedHead), kHead + kParameterError);
    EXPECT_EQ(m_nStatus, -1);
  }
}

TEST_F(FuturesOrder, RefusedHeaderIsItsMessageAlone) {
  for (const bool signedHead : {false, true}) {
    m_identity = "1";
    EXPECT_EQ(Request(OfKind(1), signedHead), "[CLIENT] 帳號或身份證字號輸入錯誤");
    EXPECT_EQ(m_nStatus, -1);
    m_identity = "1234567";
    m_gateway.setLocalIP("");
    EXPECT_EQ(Request(OfKind(1), signedHead), "[CLIENT] 無法取得IP，請確認網路連線是否正常！");
    EXPECT_EQ(m_nStatus, -1);
    m_gateway.setLocalIP("10.0.0.1");
  }
}

TEST_F(FuturesOrder, RequestOfTheBuffersSizeIsWholeAndALongerOneAParameterError) {
  for (const bool signedHead : {false, true}) {
    Order order = OfKind(1);
    const std::string bare = Request(order, signedHead);
    // The commodity stands in the request twice.
    const size_t room = (CGatewayPub::kBufferSize - 1 - bare.size()) / 2;
    std::string commodity = "TXO" + std::string(room, 'X');
    order.commodity1 = commodity.c_str();
    const std::string longest = Request(order, signedHead);
    EXPECT_EQ(longest.size(), bare.size() + 2 * room);
    EXPECT_EQ(m_nStatus, 1);
    commodity += "X";
    order.commodity1 = commodity.c_str();
    EXPECT_EQ(Request(order, signedHead), kParameterError);
    EXPECT_EQ(m_nStatus, -1);
    for (const size_t size : {4096U, 65536U}) {
      m_branch.assign(size, 'b');
      EXPECT_EQ(Request(OfKind(1), signedHead), kParameterError);
      EXPECT_EQ(Request(OfKind(0), signedHead), kParameterError);
      EXPECT_EQ(m_nStatus, -1);
      m_branch = "F008";
    }
  }
}

}  // namespace
}  // namespace gateway_tests
