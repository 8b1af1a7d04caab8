// Stock orders as they are sent: new, cancelled, changed.

#include <climits>
#include <cstdarg>
#include <cstdio>
#include <functional>
#include <set>

#include "gateway/stock/gateway_stk.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

const std::string kKindError = "[CLIENT] 委託種類錯誤";
const std::string kPriceError = "[CLIENT] 委託價格錯誤";
const std::string kTradeError = "[CLIENT] 委託交易錯誤";
const std::string kCodeError = "[CLIENT] 股票代號最多六碼";
const std::string kAmountError = "[CLIENT] 委託數量不可小於0";
const std::string kTooLong = "[CLIENT]傳入的參數錯誤";
const std::string kNoAddress = "[CLIENT] 無法取得IP，請確認網路連線是否正常！";
const std::string kLengths = "[CLIENT] 帳號或身份證字號輸入錯誤";

struct Order {
  std::string branch = "9A00";
  std::string identity = "A123456789&1234567";
  std::string password = "pw";
  std::string code = "2330";
  std::string date = "1130115";
  std::string reference = "W0001&G0002";
  int quantity = 2;
  int unit = 1000;
  int price = 1005;
  char side = 'B';
  char flag13 = '7';
  int kind = 0;
  int priceKind = 0;
  int tradeType = 0;
  int n6 = 1;

  template <class Value>
  Order With(Value Order::*member, Value value) const {
    Order changed = *this;
    changed.*member = value;
    return changed;
  }
};

enum Form { kNew, kNew1, kCancel, kCancel1, kChange, kChange1 };
constexpr Form kForms[] = {kNew, kNew1, kCancel, kCancel1, kChange, kChange1};

bool IsNew(Form form) {
  return form == kNew || form == kNew1;
}
bool IsTagged(Form form) {
  return form == kNew1 || form == kCancel1 || form == kChange1;
}
char FunctionOf(Form form) {
  return IsNew(form) ? 'I' : form == kCancel || form == kCancel1 ? 'D' : 'C';
}

std::string HeadOf(Form form, const Order& order = {}) {
  std::string head =
      "F=1|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=SN0001|65=0013452107|14=";
  head += FunctionOf(form);
  head += "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw|21=20240115|22=134521|23=13452107|24=5|V4=";
  return IsTagged(form) || order.date.empty() ? head : head + "|44=20240115";
}

std::string KeyOf(Form form) {
  const std::string key = IsTagged(form) ? "SN0001,10.0.0.1,20240115,9A00-1234567,A123456789,"
                                         : "9A00_1234567_A123456789_";
  return key + FunctionOf(form);
}

class StockOrders : public CSessionTest {
 protected:
  void SetUp() override {
    CSessionTest::SetUp();
    m_gateway.m_nSeqNo = 7;
    m_gateway.setSerialNumber("SN0001");
    m_gateway.setLocalIP("10.0.0.1");
  }

  std::string Send(Form form, const Order& o) {
    m_nStatus = 77;
    const auto byte = [](int value) { return static_cast<char>(value); };
    const char* result = nullptr;
    if (IsNew(form)) {
      const auto method =
          form == kNew ? &CGatewayStk::SubmitOrderEncode : &CGatewayStk::SubmitOrderEncode1;
      result =
          std::invoke(method, m_gateway, o.branch.c_str(), o.identity.c_str(), o.password.c_str(),
                      o.code.c_str(), o.date.c_str(), o.quantity, o.unit, o.price, o.side, o.flag13,
                      byte(o.kind), byte(o.priceKind), byte(o.tradeType), byte(o.n6), &m_nStatus);
    } else {
      using Method = decltype(&CGatewayStk::CancelOrderEncode);
      constexpr Method kMethods[] = {
          &CGatewayStk::CancelOrderEncode, &CGatewayStk::CancelOrderEncode1,
          &CGatewayStk::ChangeOrderEncode, &CGatewayStk::ChangeOrderEncode1};
      result =
          std::invoke(kMethods[form - kCancel], m_gateway, o.branch.c_str(), o.identity.c_str(),
                      o.password.c_str(), o.code.c_str(), o.date.c_str(), o.reference.c_str(),
                      o.quantity, o.unit, o.price, o.side, o.flag13, byte(o.kind),
                      byte(o.priceKind), byte(o.tradeType), byte(o.n6), &m_nStatus);
    }
    EXPECT_EQ(result, m_gateway.m_szBuffer);
    return result;
  }

  void ExpectSent(Form form, const Order& order, const std::string& behindHead,
                  const std::string& label) {
    EXPECT_EQ(Send(form, order), HeadOf(form, order) + behindHead) << label;
    EXPECT_EQ(m_nStatus, 1) << label;
  }

  void ExpectRefused(Form form, const Order& order, const std::string& message,
                     const std::string& label = "") {
    EXPECT_EQ(Send(form, order), message) << label;
    EXPECT_EQ(m_nStatus, -1) << label;
  }

  CGatewayStk m_gateway;
  int m_nStatus = 0;
};

// One piece, printed by the C library: a NUL character ends it.
__attribute__((format(printf, 1, 2))) std::string Piece(const char* format, ...) {
  char text[512];
  va_list values;
  va_start(values, format);
  vsnprintf(text, sizeof text, format, values);
  va_end(values);
  return text;
}

int WrappedProduct(int a, int b) {
  return static_cast<int>(static_cast<unsigned>(a) * static_cast<unsigned>(b));
}

// What a good order must send behind its header, piece by piece.
std::string NewOrderBehindHead(Form form, const Order& o) {
  const int sent = o.tradeType == 2 ? o.quantity : WrappedProduct(o.quantity, o.unit);
  const char* key = form == kNew ? "9A00_1234567_A123456789_I"
                                 : "SN0001,10.0.0.1,20240115,9A00-1234567,A123456789,I";
  const char* code = o.code.c_str();
  const bool limit = o.tradeType != 3 && o.priceKind == 0;
  std::string text = Piece("|27=%d|28=%d|29=%s|30=%d|UT=%d|13=%c|N6=%d", o.kind, o.tradeType, code,
                           sent, o.unit, o.flag13, o.n6);
  text += o.tradeType == 3 ? Piece("|31=|M8=|32=%c|33=", o.side)
          : limit ? Piece("|31=%d.%02d|M8=0|32=%c|33=", o.price / 100, o.price % 100, o.side)
                  : Piece("|31=0|M8=%d|32=%c|33=", o.priceKind, o.side);
  if (form == kNew) {
    return text + (limit ? Piece("!!%s_%c_%s_%d_%d.%02d", key, o.side, code, sent, o.price / 100,
                                 o.price % 100)
                         : Piece("!!%s_%c_%s_%d_%d", key, o.side, code, sent,
                                 o.tradeType == 3 ? 3 : o.priceKind));
  }
  return text + (limit ? Piece("|PL=S!!%s,%c,%s,%d,%d,%d,%d,%d.%02d,", key, o.side, code, o.kind,
                               o.tradeType, o.priceKind, sent, o.price / 100, o.price % 100)
                       : Piece("|PL=S!!%s,%c,%s,%d,%d,%d,%d,%d,", key, o.side, code, o.kind,
                               o.tradeType, o.priceKind, sent, 0));
}

std::string AmendmentBehindHead(Form form, const Order& o) {
  const int sent = o.tradeType == 2 ? o.quantity : WrappedProduct(o.quantity, o.unit);
  const int price = o.tradeType == 3 ? 0 : o.price;
  const std::string keyText = KeyOf(form);
  const char* key = keyText.c_str();
  const char* code = o.code.c_str();
  switch (form) {
    case kCancel:
      return Piece("|10=%08d|36=%s|46=%s|28=%d|29=%s|31=%d|32=%c|N6=%d|27=%d|UT=1000|13=%c",
                   20240115, "W0001", "G0002", o.tradeType, code, price, o.side, o.n6, o.kind,
                   o.flag13) +
             Piece("!!%s_%s_%c_%s_%s_%s", key, "W0001", o.side, code, "", "");
    case kChange:
      return Piece("|10=%08d|36=%s|46=%s|28=%d|29=%s|31=%d|32=%c|37=%d|N6=%d|27=%d|UT=%d|13=%c",
                   20240115, "W0001", "G0002", o.tradeType, code, price, o.side, sent, o.n6, o.kind,
                   o.unit, o.flag13) +
             Piece("!!%s_%s_%c_%s_%d_%s", key, "W0001", o.side, code, sent, "");
    default:
      break;
  }
  const std::string body =
      Piece("|10=%08d|36=%s|46=%s|28=%d|29=%s|31=%d|32=%c|37=%d|N6=%d|27=%d|UT=%d", 20240115,
            "W0001", "G0002", o.tradeType, code, price, o.side, sent, o.n6, o.kind, o.unit);
  return body + (form == kCancel1
                     ? Piece("|PL=S!!%s,%c,%s,,%d,,,,%s", key, o.side, code, o.tradeType, "W0001")
                     : Piece("|PL=S!!%s,%c,%s,,%d,,%d,,%s", key, o.side, code, o.tradeType, sent,
                             "W0001"));
}

std::string BehindHead(Form form, const Order& o) {
  return IsNew(form) ? NewOrderBehindHead(form, o) : AmendmentBehindHead(form, o);
}

// What keeps an order from being sent, empty for nothing.
std::string FaultOf(Form form, const Order& o) {
  static const std::set<int> kKinds = {0, 1, 2, 3, 4, 5, 8};
  const bool anyKindTo8 = form == kCancel1 || form == kChange1;
  if (anyKindTo8 ? o.kind > 8 : kKinds.count(o.kind) == 0) return kKindError;
  if (IsNew(form) && std::set<int>{0, 1, 5, 9}.count(o.priceKind) == 0) return kPriceError;
  if (std::set<int>{0, 2, 3}.count(o.tradeType) == 0) return kTradeError;
  if (o.code.size() > 6) return kCodeError;
  if (IsNew(form) && o.quantity <= 0) return kAmountError;
  return "";
}

struct Example {
  const char* label;
  Form form;
  Order order;
  std::string behindHead;
};

TEST_F(StockOrders, ExamplesOfNewOrders) {
  const Order lots;
  const Order fixed = lots.With(&Order::tradeType, 3);
  const Order odd = lots.With(&Order::tradeType, 2).With(&Order::quantity, 37);
  const std::string bare = "!!9A00_1234567_A123456789_I_B_2330_";
  const std::string tagged = "|PL=S!!SN0001,10.0.0.1,20240115,9A00-1234567,A123456789,I,B,2330,";
  const Example rows[] = {
      {"two lots at a limit", kNew, lots,
       "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1|31=10.05|M8=0|32=B|33=" + bare + "2000_10.05"},
      {"two lots at a limit, tagged", kNew1, lots,
       "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1|31=10.05|M8=0|32=B|33=" + tagged +
           "0,0,0,2000,10.05,"},
      {"odd lot", kNew, odd,
       "|27=0|28=2|29=2330|30=37|UT=1000|13=7|N6=1|31=10.05|M8=0|32=B|33=" + bare + "37_10.05"},
      {"odd lot, tagged", kNew1, odd,
       "|27=0|28=2|29=2330|30=37|UT=1000|13=7|N6=1|31=10.05|M8=0|32=B|33=" + tagged +
           "0,2,0,37,10.05,"},
      {"fixed price with a price kind", kNew, fixed.With(&Order::priceKind, 5),
       "|27=0|28=3|29=2330|30=2000|UT=1000|13=7|N6=1|31=|M8=|32=B|33=" + bare + "2000_3"},
      {"fixed price with a price kind, tagged", kNew1, fixed.With(&Order::priceKind, 5),
       "|27=0|28=3|29=2330|30=2000|UT=1000|13=7|N6=1|31=|M8=|32=B|33=" + tagged + "0,3,5,2000,0,"},
      {"fixed price", kNew, fixed,
       "|27=0|28=3|29=2330|30=2000|UT=1000|13=7|N6=1|31=|M8=|32=B|33=" + bare + "2000_3"},
      {"fixed price, tagged", kNew1, fixed,
       "|27=0|28=3|29=2330|30=2000|UT=1000|13=7|N6=1|31=|M8=|32=B|33=" + tagged + "0,3,0,2000,0,"},
      {"limit-up price", kNew, lots.With(&Order::priceKind, 9),
       "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1|31=0|M8=9|32=B|33=" + bare + "2000_9"},
      {"limit-up price, tagged", kNew1, lots.With(&Order::priceKind, 9),
       "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1|31=0|M8=9|32=B|33=" + tagged +
           "0,0,9,2000,0,"},
  };
  for (const Example& row : rows) ExpectSent(row.form, row.order, row.behindHead, row.label);
}

TEST_F(StockOrders, ExamplesOfCancellationsAndChanges) {
  const Order lots;
  const std::string body = "|10=20240115|36=W0001|46=G0002|28=0|29=2330|31=1005|32=B";
  const std::string bare = "!!9A00_1234567_A123456789_";
  const std::string tagged = "|PL=S!!SN0001,10.0.0.1,20240115,9A00-1234567,A123456789,";
  const Example rows[] = {
      {"cancel", kCancel, lots.With(&Order::unit, 500),
       body + "|N6=1|27=0|UT=1000|13=7" + bare + "D_W0001_B_2330__"},
      {"cancel, tagged", kCancel1, lots,
       body + "|37=2000|N6=1|27=0|UT=1000" + tagged + "D,B,2330,,0,,,,W0001"},
      {"change", kChange, lots,
       body + "|37=2000|N6=1|27=0|UT=1000|13=7" + bare + "C_W0001_B_2330_2000_"},
      {"change, tagged", kChange1, lots,
       body + "|37=2000|N6=1|27=0|UT=1000" + tagged + "C,B,2330,,0,,2000,,W0001"},
  };
  for (const Example& row : rows) ExpectSent(row.form, row.order, row.behindHead, row.label);
}

TEST_F(StockOrders, FirstBrokenRuleIsTold) {
  Order order;
  order.kind = 9;
  order.priceKind = 2;
  order.tradeType = 1;
  order.code = "1234567";
  order.quantity = 0;
  for (Form form : kForms) ExpectRefused(form, order, kKindError);
  order.kind = 8;
  for (Form form : kForms) ExpectRefused(form, order, IsNew(form) ? kPriceError : kTradeError);
  order.priceKind = 9;
  for (Form form : kForms) ExpectRefused(form, order, kTradeError);
  order.tradeType = 3;
  for (Form form : kForms) ExpectRefused(form, order, kCodeError);
  order.code = "123456";
  for (Form form : kForms) {
    if (IsNew(form)) {
      ExpectRefused(form, order, kAmountError);
    } else {
      ExpectSent(form, order, BehindHead(form, order), "quantity 0 is no fault of an amendment");
    }
  }
}

TEST_F(StockOrders, KindsSixAndSevenPassInTaggedAmendmentsAlone) {
  for (int kind : {6, 7}) {
    const Order order = Order().With(&Order::kind, kind);
    for (Form form : {kNew, kNew1, kCancel, kChange}) ExpectRefused(form, order, kKindError);
    for (Form form : {kCancel1, kChange1}) {
      ExpectSent(form, order, BehindHead(form, order), std::to_string(kind));
    }
  }
}

TEST_F(StockOrders, StockCodeHasAtMostSixCharacters) {
  for (Form form : kForms) {
    for (const char* code : {"", "0050", "006208", "00625K"}) {
      const Order order = Order().With<std::string>(&Order::code, code);
      ExpectSent(form, order, BehindHead(form, order), code);
    }
    ExpectRefused(form, Order().With<std::string>(&Order::code, "0062081"), kCodeError);
    ExpectRefused(form, Order().With(&Order::code, std::string(5000, '1')), kCodeError);
  }
}

// Every value of every byte argument, in every form: sent or refused as the rules say.
TEST_F(StockOrders, EveryByteOfEveryByteArgument) {
  for (Form form : kForms) {
    for (int tradeType : {0, 2, 3}) {
      for (int byte = 0; byte < 256; ++byte) {
        const Order base = Order().With(&Order::tradeType, tradeType);
        const char character = static_cast<char>(byte);
        for (const Order& order :
             {base.With(&Order::side, character), base.With(&Order::flag13, character),
              base.With(&Order::kind, byte), base.With(&Order::priceKind, byte),
              base.With(&Order::tradeType, byte), base.With(&Order::n6, byte)}) {
          const std::string label = Piece("form %d, trade type %d, byte %d", form, tradeType, byte);
          const std::string fault = FaultOf(form, order);
          if (fault.empty()) {
            ExpectSent(form, order, BehindHead(form, order), label);
          } else {
            ExpectRefused(form, order, fault, label);
          }
        }
      }
    }
  }
}

TEST_F(StockOrders, NulSideLosesTheRestOfItsOwnPiecesAlone) {
  const Order order = Order().With(&Order::side, '\0');
  ExpectSent(kNew, order,
             "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1|31=10.05|M8=0|32="
             "!!9A00_1234567_A123456789_I_",
             "new");
  ExpectSent(kChange, order,
             "|10=20240115|36=W0001|46=G0002|28=0|29=2330|31=1005|32="
             "!!9A00_1234567_A123456789_C_W0001_",
             "change");
}

TEST_F(StockOrders, NulFlagLosesTheRestOfTheBody) {
  ExpectSent(kNew, Order().With(&Order::flag13, '\0'),
             "|27=0|28=0|29=2330|30=2000|UT=1000|13=|31=10.05|M8=0|32=B|33="
             "!!9A00_1234567_A123456789_I_B_2330_2000_10.05",
             "new");
}

TEST_F(StockOrders, EdgesOfQuantityUnitAndPriceInEveryPriceForm) {
  constexpr int kEdges[] = {INT_MIN, -150, -100, -99, -1, 0, 1, 5, 99, 100, 1234, INT_MAX};
  for (Form form : kForms) {
    for (int tradeType : {0, 2, 3}) {
      for (int priceKind : {0, 1, 5, 9}) {
        for (int edge : kEdges) {
          const Order base =
              Order().With(&Order::tradeType, tradeType).With(&Order::priceKind, priceKind);
          for (int Order::*member : {&Order::quantity, &Order::unit, &Order::price}) {
            const Order order = base.With(member, edge);
            const std::string fault = FaultOf(form, order);
            const std::string label = Piece("form %d, edge %d", form, edge);
            if (fault.empty()) {
              ExpectSent(form, order, BehindHead(form, order), label);
            } else {
              ExpectRefused(form, order, fault, label);
            }
          }
        }
      }
    }
  }
}

struct PriceText {
  int price;
  const char* text;
};

TEST_F(StockOrders, LimitIsDividedTowardZero) {
  constexpr PriceText kRows[] = {{1234, "12.34"},
                                 {5, "0.05"},
                                 {100, "1.00"},
                                 {0, "0.00"},
                                 {99, "0.99"},
                                 {1005, "10.05"},
                                 {-150, "-1.-50"},
                                 {-7, "0.-7"},
                                 {-1, "0.-1"},
                                 {INT_MAX, "21474836.47"},
                                 {INT_MIN, "-21474836.-48"}};
  for (const PriceText& row : kRows) {
    const std::string text = row.text;
    ExpectSent(kNew, Order().With(&Order::price, row.price),
               "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1|31=" + text +
                   "|M8=0|32=B|33=!!9A00_1234567_A123456789_I_B_2330_2000_" + text,
               text);
  }
}

struct ReferenceCase {
  std::string reference, first, second;
};

TEST_F(StockOrders, ReferenceIsSplitIntoPiecesOfUpTo39Characters) {
  const std::string fits(39, 'a'), tooLong(40, 'b');
  const ReferenceCase rows[] = {{"", "", ""},
                                {"&", "", ""},
                                {"W1", "W1", ""},
                                {"W1&", "W1", ""},
                                {"&G2", "", "G2"},
                                {"W1&G2", "W1", "G2"},
                                {"W1&G2&X3", "W1", "G2"},
                                {"W1&&X3", "W1", ""},
                                {fits + "&" + fits, fits, fits},
                                {tooLong + "&G2", "", "G2"},
                                {"W1&" + tooLong, "W1", ""},
                                {"A|1&B=2", "A|1", "B=2"}};
  for (const ReferenceCase& row : rows) {
    ExpectSent(kChange1, Order().With(&Order::reference, row.reference),
               "|10=20240115|36=" + row.first + "|46=" + row.second +
                   "|28=0|29=2330|31=1005|32=B|37=2000|N6=1|27=0|UT=1000|PL=S!!SN0001,10.0.0.1,"
                   "20240115,9A00-1234567,A123456789,C,B,2330,,0,,2000,," +
                   row.first,
               row.reference);
  }
}

TEST_F(StockOrders, AmendmentsSendTheDateEvenWhenItIsEmpty) {
  const Order order = Order().With<std::string>(&Order::date, "");
  for (Form form : {kCancel, kCancel1, kChange, kChange1}) {
    const std::string text = Send(form, order);
    EXPECT_NE(text.find("|V4=|10=00000000|36="), std::string::npos) << text;
  }
  for (Form form : {kNew, kNew1}) {
    const std::string text = Send(form, order);
    EXPECT_NE(text.find("|V4=|27="), std::string::npos) << text;
  }
}

TEST_F(StockOrders, HeaderFailureComesFirstAndStandsAlone) {
  const Order broken = Order().With(&Order::kind, 9);
  for (Form form : kForms) {
    ExpectRefused(form, broken.With<std::string>(&Order::identity, "1"), kLengths);
  }
  m_gateway.setLocalIP("");
  for (Form form : kForms) ExpectRefused(form, broken, kNoAddress);
}

TEST_F(StockOrders, RequestFillsItsBufferAndNoMore) {
  for (Form form : kForms) {
    const size_t rest = Send(form, Order()).size();
    const size_t fits = CGatewayPub::kBufferSize - 1 - rest + 2;
    const std::string longest = Send(form, Order().With(&Order::password, std::string(fits, 'p')));
    EXPECT_EQ(longest.size(), CGatewayPub::kBufferSize - 1);
    EXPECT_EQ(m_nStatus, 1);
    ExpectRefused(form, Order().With(&Order::password, std::string(fits + 1, 'p')), kTooLong);
    ExpectRefused(form, Order().With(&Order::branch, std::string(5000, '9')), kTooLong);
  }
}

TEST_F(StockOrders, NullTextsReadAsEmptyOnes) {
  int status = 0;
  EXPECT_STREQ(m_gateway.CancelOrderEncode1(nullptr, "1234567", nullptr, nullptr, nullptr, nullptr,
                                            1, 1, 1, 'S', '0', 0, 0, 0, 0, &status),
               "F=1|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=SN0001|65=0013452107|"
               "14=D|15=0|IDNO=1234567|ACNO=1234567|PWD=|21=20240115|22=134521|23=13452107|24=5|V4="
               "|10=00000000|36=|46=|28=0|29=|31=1|32=S|37=1|N6=0|27=0|UT=1"
               "|PL=S!!SN0001,10.0.0.1,20240115,-1234567,1234567,D,S,,,0,,,,");
  EXPECT_EQ(status, 1);
}

TEST_F(StockOrders, HeaderIsLoggedAndNothingElse) {
  m_log.Take();
  for (Form form : kForms) {
    Send(form, Order());
    EXPECT_EQ(m_log.Take(), Lines{HeadOf(form)});
  }
}

const std::string kBriefHead =
    "F=1|KIND=S|CB=1|BHNO=9A00|VER=24369|SN=SN0001|11=NO DEFINE|65=0013452107|14=";

using BriefOrder = StockOrders;

TEST_F(BriefOrder, CarriesTheTradeTypeOfAnyValue) {
  for (int byte = 0; byte < 256; ++byte) {
    EXPECT_EQ(m_gateway.SubmitOrderEncode2("9A00", "A123456789&1234567", "pw", 'I',
                                           static_cast<char>(byte)),
              kBriefHead + "I|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw|28=" + std::to_string(byte));
  }
}

TEST_F(BriefOrder, CarriesAnyFunction) {
  for (int byte = 1; byte < 256; ++byte) {
    const char function = static_cast<char>(byte);
    EXPECT_EQ(m_gateway.SubmitOrderEncode2("9A00", "A123456789", "pw", function, 0),
              kBriefHead + function + "|15=1|IDNO=A123456789|PWD=pw||28=0");
  }
  EXPECT_EQ(m_gateway.SubmitOrderEncode2("9A00", "A123456789", "pw", '\0', 0),
            kBriefHead + "|15=1|IDNO=A123456789|PWD=pw||28=0");
}

TEST_F(BriefOrder, FollowsAFailedHeaderToo) {
  EXPECT_EQ(m_gateway.SubmitOrderEncode2("9A00", "1", "pw", 'I', 2), kLengths + "|28=2");
}

TEST_F(BriefOrder, NeedsNoAddress) {
  m_gateway.setLocalIP(nullptr);
  EXPECT_EQ(m_gateway.SubmitOrderEncode2("9A00", "1234567", "pw", 'D', 3),
            kBriefHead + "D|15=0|IDNO=1234567|ACNO=1234567|PWD=pw|28=3");
}

TEST_F(BriefOrder, IsNeverCut) {
  EXPECT_EQ(m_gateway.SubmitOrderEncode2("9A00", "1234567", std::string(5000, 'p').c_str(), 'I', 0),
            kTooLong);
}

TEST_F(StockOrders, ObjectLogsBothNamesWhenItGoes) {
  m_log.Take();
  { const CGatewayStk gateway; }
  EXPECT_EQ(m_log.Take(), (Lines{"~CGatewayStk", "~CGatewayPub"}));
}

}  // namespace
}  // namespace gateway_tests
