// The futures order book.
//
//   reply    ( |00=...|68=code|67=sequence|46=number|... |01= )*
//   result   count ! record*
//   record   46 @ 36 @legs @TIMEX& letter & commodity & month & call/put & strike @ quantity
//            @ state [ & message ] @ filled @ cancelled [ @ price ] @ time @ 21 @ 44 @ N6
//            @ JV flag @ time in force @ MT !
//
// The gateway leaves out what did not change: quantities and the time in force stand until a later
// record brings others, and the product letter likewise.
#include "gateway/core/conversions.h"
#include "gateway/core/log.h"
#include "gateway/core/messages.h"
#include "gateway/futures/futures_list.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/futures/leg_code.h"
#include "gateway/futures/messages.h"
#include "gateway/orders/messages.h"
#include "gateway/orders/order_state.h"

namespace {

enum Field {
  kFillOrKill = kOwnFields,
  kImmediateOrCancel,
  kOrderedQuantity,
  kCancelled41,
  kReduced37,
  kFilledQuantity,
  kOrderState,
  kGatewayText,
  kHandlingFlag,
  kCallPut1,
  kFlagW3,
  kSide2,
  kSide1,
  kGatewayNumber,
  kOrderNumber,
  kCommodity1,
  kCommodity2,
  kMonth1,
  kMonth2,
  kCallPut2,
  kStrike1,
  kStrike2,
  kPriceType,
  kPrice,
  kEntryTime,
  kEntryDate,
  kOrderDate,
  kChangeable,
  kFlagMT
};

constexpr TagRow kRows[] = {{kSequence, "67", 16},
                            {kResultCode, "68", 128},
                            {kMessage, "M2", 512},
                            {kFillOrKill, "O4", kRecord},
                            {kImmediateOrCancel, "V5", kRecord},
                            {kOrderedQuantity, "70", kRecord},
                            {kCancelled41, "41", kRecord},
                            {kReduced37, "37", kRecord},
                            {kFilledQuantity, "47", kRecord},
                            {kOrderState, "39", kRecord},
                            {kGatewayText, "K1", 512},
                            {kHandlingFlag, "N6", kRecord},
                            {kCallPut1, "V8", 8},
                            {kFlagW3, "W3", 8},
                            {kSide2, "EL", kRecord},
                            {kSide1, "32", kRecord},
                            {kGatewayNumber, "46", kRecord},
                            {kOrderNumber, "36", kRecord},
                            {kCommodity1, "33", kRecord},
                            {kCommodity2, "V9", kRecord},
                            {kMonth1, "29", kRecord},
                            {kMonth2, "W0", kRecord},
                            {kCallPut2, "W1", kRecord},
                            {kStrike1, "34", kRecord},
                            {kStrike2, "W2", kRecord},
                            {kPriceType, "27", kRecord},
                            {kPrice, "31", kRecord},
                            {kEntryTime, "22", kRecord},
                            {kEntryDate, "21", kRecord},
                            {kOrderDate, "44", kRecord},
                            {kChangeable, "JV", kRecord},
                            {kFlagMT, "MT", kRecord}};
constexpr CListTable kTags(kRows, {kRecord});

// A number that stands until a record brings another.
class CStandingNumber {
 public:
  void Update(const CRecord& record, int field) {
    if (record.Has(field)) m_nValue = record.Number(field);
  }
  int32_t Value() const { return m_nValue; }

 private:
  int32_t m_nValue = 0;
};

// What goes from one record to the next.
struct Standing {
  CStandingNumber fillOrKill, immediateOrCancel;
  CStandingNumber quantity, cancelled, reduced, filled;
  char timeInForce = '\0';
  const char* product = "";
};

// A pair that means nothing leaves the letter as it was.
void UpdateTimeInForce(const CRecord& record, Standing& standing) {
  standing.fillOrKill.Update(record, kFillOrKill);
  standing.immediateOrCancel.Update(record, kImmediateOrCancel);
  const int32_t kill = standing.fillOrKill.Value();
  const int32_t cancel = standing.immediateOrCancel.Value();
  if (kill == 0 && cancel == 0) standing.timeInForce = 'R';
  if (kill == 0 && cancel == 1) standing.timeInForce = 'I';
  if (kill == 1 && cancel == 0) standing.timeInForce = 'F';
}

void UpdateQuantities(const CRecord& record, Standing& standing) {
  standing.quantity.Update(record, kOrderedQuantity);
  standing.cancelled.Update(record, kCancelled41);
  standing.reduced.Update(record, kReduced37);
  standing.filled.Update(record, kFilledQuantity);
}

// "@51" for one leg, "@51|52" for two; two legs with an unknown side have no code at all, and an
// unusual W3 a bare '@', with the product letter of the record before.
void AppendLegCodes(CResultText& list, const CRecord& record, bool option, Standing& standing) {
  const std::string_view w3 = record.Text(kFlagW3);
  const std::string_view side1 = record.Text(kSide1);
  const std::string_view side2 = record.Text(kSide2);
  const LegPair* const pair = IsBlank(w3) ? &kUsualLegPair : FindLegPair(w3);
  if (pair == nullptr || (option && !pair->forOptions)) {
    list.AppendChar('@');
    return;
  }
  const int first = SideOffset(side1);
  if (IsBlank(side2)) {
    standing.product = option ? "O" : "F";
    list.Append(WIRE("@%d"), pair->buying + (first == 0 ? 0 : 1));
    return;
  }
  standing.product = option ? "X" : "Y";
  const int second = SideOffset(side2);
  if (first == kNoSide || second == kNoSide) return;
  list.Append(WIRE("@%d|%d"), pair->buying + first, pair->buying + second);
}

// The second of two values stands behind a bar, if there is one.
void AppendPair(CResultText& list, std::string_view first, std::string_view second) {
  list.AppendText(first);
  if (!IsBlank(second)) list.Append(WIRE("|%s"), second);
  list.AppendChar('&');
}

// Strikes of these commodities come with a tenth more than is shown, in pairs alone.
bool StrikesInTenths(std::string_view commodity) {
  return commodity == "MSO" || commodity == "GTO" || commodity == "TEO";
}

void AppendStrikes(CResultText& list, const CRecord& record) {
  const int32_t strike1 = PriceOf(record, kStrike1);
  if (IsBlank(record.Text(kStrike2))) {
    list.Append(WIRE("%d"), strike1);
    return;
  }
  const int unit = StrikesInTenths(record.Text(kCommodity1)) ? 10 : 1;
  list.Append(WIRE("%ld|%ld"), strike1 / unit, PriceOf(record, kStrike2) / unit);
}

// Futures spreads show their first commodity alone.
void AppendContract(CResultText& list, const CRecord& record, const char* product) {
  list.Append(WIRE("@TIMEX&%s&%s"), product, record.Text(kCommodity1));
  if (*product == 'X') list.Append(WIRE("|%s"), record.Text(kCommodity2));
  list.AppendChar('&');
  AppendPair(list, record.Text(kMonth1), record.Text(kMonth2));
  AppendPair(list, record.Text(kCallPut1), record.Text(kCallPut2));
  AppendStrikes(list, record);
}

// A record without a price type lacks the field.
void AppendPrice(CResultText& list, const CRecord& record) {
  if (!record.Has(kPriceType)) return;
  const int32_t type = record.Number(kPriceType);
  if (type == 1) {
    list.Append(WIRE("@%s"), kMarketPrice);
  } else if (type == 3) {
    list.Append(WIRE("@%s"), kRangeMarketPrice);
  } else {
    list.Append(WIRE("@%d"), PriceOf(record, kPrice));
  }
}

// The order's state; only a failed order has a message, which keeps its '!' as the gateway sent it.
void AppendStateAndQuantities(CResultText& list, const CRecord& record, const Standing& standing,
                              std::string_view message, int32_t market) {
  const int32_t quantity = standing.quantity.Value();
  const int32_t filled = standing.filled.Value();
  const int32_t cancelled = WrapAdd(standing.cancelled.Value(), standing.reduced.Value());
  const OrderState state = {quantity,
                            cancelled,
                            filled,
                            standing.timeInForce,
                            record.Text(kOrderState),
                            record.Text(kHandlingFlag),
                            message,
                            market};
  list.Append(WIRE("@%d@%s"), quantity, OrderStateText(state));
  if (!message.empty()) list.Append(WIRE("&%s"), message);
  list.Append(WIRE("@%d@%d"), filled, cancelled);
}

// Appends the record; false when it is no kind of order.
bool AppendOrder(CResultText& list, const CRecord& record, int32_t market, Standing& standing) {
  const std::string_view callPut = record.Text(kCallPut1);
  const bool option = callPut == "C" || callPut == "P";
  if (!option && !IsBlank(callPut)) return false;
  const bool failed = IsFailed(record.Text(kOrderState));
  const std::string_view message = failed ? record.Text(kGatewayText) : std::string_view();

  list.Append(WIRE("%s@%s"), record.Text(kGatewayNumber), record.Text(kOrderNumber));
  AppendLegCodes(list, record, option, standing);
  AppendContract(list, record, standing.product);
  AppendStateAndQuantities(list, record, standing, message, market);
  AppendPrice(list, record);
  const CTransDate date(record.Text(kEntryDate));
  const CTransDate orderDate(record.Text(kOrderDate));
  list.Append(WIRE("@%s@%s@%s@%s"), FirstSix(record.Text(kEntryTime)), date.Text(),
              orderDate.Text(), record.Text(kHandlingFlag));
  const std::string_view mt = record.Text(kFlagMT);
  list.Append(WIRE("@%s@%c"), ChangeFlag(record.Text(kChangeable), !message.empty()),
              standing.timeInForce);
  list.Append(WIRE("@%s!"), mt.empty() ? " " : mt);
  return true;
}

}  // namespace

char* CGatewayFut::QueryOrderEncode(const char* branch, const char* identity, const char* password,
                                    const char* date, int selection, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  const CTransDate day(AsText(date));
  if (day.Text().empty()) return Fail(line, status, kBadOrderDate);
  line.Append(WIRE("FUNC=x|FUNC1=0|SDATE=%s"), day.Text());
  line.Append(WIRE("||EDATE=%s"), day.Text());  // one day; the doubled bar is the wire's
  line.Append(WIRE("|28=%d|01="), selection);
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayFut::QueryOrderDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (text.empty()) return Fail(kNoReply, status);
  CReplyList orders(text, kTags);
  if (orders.Code().empty()) return Fail("", status);
  if (char* const answer = AnswerWithoutData(orders, "0!", status)) return answer;

  CResultText list(DataText(), text.size());
  Standing standing;
  int count = 0;
  while (orders.Next()) {
    const CRecord& record = orders.Record();
    UpdateTimeInForce(record, standing);
    if (orders.Code() != kDoneCode) continue;
    UpdateQuantities(record, standing);
    LogLine(WIRE("%s"), record.Text(kGatewayNumber));
    if (!AppendOrder(list, record, m_nMarket, standing)) return Fail(kLegKindError, status);
    ++count;
  }
  return FinishList(list, count, status);
}
