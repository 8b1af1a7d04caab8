// The orders of a day.
//
//   record   |46=number|36=reference|27=kind|28=trade type|32=side|29=code|70=ordered|41=, 37=
//            cancelled|47=filled|39=state|K1=text|N6=|31=price|M8=price kind|22=time|21=, 44= date
//            |JV=may be changed
//   result   count ! ( 46 @ 36 @ type code @ 29 @ ordered @ state @ filled @ cancelled @ price @
//            time @ 21 @ 44 @ N6 @ change flag ! )*
//
// An order whose type has no code fails the whole list.
#include <algorithm>

#include "gateway/core/conversions.h"
#include "gateway/core/log.h"
#include "gateway/orders/order_state.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/messages.h"
#include "gateway/stock/order_type_codes.h"
#include "gateway/stock/stock_list.h"
#include "gateway/stock/stock_order.h"

namespace {

enum Field {
  kGatewayNumber = kOwnFields,
  kOrderNumber,
  kOrderKind,
  kTradeType,
  kSide,
  kStockCode,
  kOrderedQuantity,
  kCancelled41,
  kReduced37,
  kFilledQuantity,
  kOrderState,
  kGatewayText,
  kHandlingFlag,
  kPrice,
  kPriceKind,
  kEntryTime,
  kEntryDate,
  kOrderDate,
  kChangeable
};

constexpr TagRow kRows[] = {
    {kSequence, "67", 20},        {kResultCode, "68", 20},  {kMessage, "M2", kRecord},
    {kGatewayNumber, "46", 50},   {kOrderNumber, "36", 50}, {kOrderKind, "27", 50},
    {kTradeType, "28", 50},       {kSide, "32", 50},        {kStockCode, "29", 50},
    {kOrderedQuantity, "70", 50}, {kCancelled41, "41", 50}, {kReduced37, "37", 50},
    {kFilledQuantity, "47", 50},  {kOrderState, "39", 50},  {kGatewayText, "K1", 200},
    {kHandlingFlag, "N6", 50},    {kPrice, "31", 50},       {kPriceKind, "M8", 50},
    {kEntryTime, "22", 50},       {kEntryDate, "21", 50},   {kOrderDate, "44", 50},
    {kChangeable, "JV", 50}};
constexpr CListTable kTags(kRows, kStockList);

// What the text of a failed order says while it waits, on the market that shows it.
constexpr std::string_view kWaitingText = "WAIT ";
constexpr int kWaitingMarket = 8;

// Kinds that the order book alone knows.
constexpr OrderTypeRow kBookRows[] = {
    {SetOf(6), kEveryNumber, 30, 30},
    {SetOf(7), kEveryNumber, 31, 31},
};

int TypeCodeOf(const CRecord& record) {
  return FindOrderType(record.Number(kOrderKind), record.Number(kTradeType),
                       record.Text(kSide) == "B", kOrderTypeRows, kLiveOrderTypeRows, kBookRows);
}

constexpr size_t kTextSize = kRows[kGatewayText].bound;

// The gateway's text with no '!' that would end the record.
std::string_view WithoutMarks(std::string_view text, char (&scratch)[kTextSize]) {
  const size_t length = text.copy(scratch, kTextSize);
  std::replace(scratch, scratch + length, '!', ' ');
  return {scratch, length};
}

void AppendFailure(CResultText& list, std::string_view text, int market) {
  if (market == kWaitingMarket && text == kWaitingText) return list.AppendText(kWaitingState);
  if (!text.empty()) list.Append(WIRE("%s&%s"), kFailedState, text);
}

void AppendPrice(CResultText& list, const CRecord& record) {
  const int price = ScalePrice(record.Text(kPrice), 2);
  switch (record.Number(kPriceKind)) {
    case kLimitDown:
      return list.AppendText(kLimitDownPrice);
    case kFlat:
      return list.AppendText(kFlatPrice);
    case kLimitUp:
      return list.AppendText(kLimitUpPrice);
    default:
      if (price == 0) return list.AppendText(kMarketPrice);
      return list.Append(WIRE("%d"), price);
  }
}

void AppendOrder(CResultText& list, const CRecord& record, int typeCode, int market) {
  const OrderState order = {record.Number(kOrderedQuantity),
                            WrapAdd(record.Number(kReduced37), record.Number(kCancelled41)),
                            record.Number(kFilledQuantity),
                            '\0',
                            record.Text(kOrderState),
                            record.Text(kHandlingFlag),
                            record.Text(kGatewayText),
                            market};
  const bool failed = IsFailed(order.state);
  char scratch[kTextSize];
  const std::string_view message =
      failed ? WithoutMarks(order.gatewayText, scratch) : std::string_view();
  list.Append(WIRE("%s@%s@%d@%s@%d@"), record.Text(kGatewayNumber), record.Text(kOrderNumber),
              typeCode, record.Text(kStockCode), order.quantity);
  if (failed) {
    AppendFailure(list, message, market);
  } else {
    list.AppendText(OrderStateText(order));
  }
  list.Append(WIRE("@%d@%d@"), order.filled, order.cancelled);
  AppendPrice(list, record);
  list.Append(WIRE("@%s@%s@%s@%s@%s!"), FirstSix(record.Text(kEntryTime)),
              CTransDate(record.Text(kEntryDate)).Text(),
              CTransDate(record.Text(kOrderDate)).Text(), order.handlingFlag,
              ChangeFlag(record.Text(kChangeable), !message.empty()));
}

}  // namespace

char* CGatewayStk::QueryOrderEncode(const char* branch, const char* identity, const char* password,
                                    const char* date, int tradeType, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  if (AsText(date).empty()) return Fail(line, status, kDateError);
  line.Append(WIRE("|FUNC=2|SDATE=%s|EDATE=%s|28=%d|01=\n"), date, date, tradeType);
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayStk::QueryOrderDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  LogReply("QueryOrderDecode", text);
  if (TransportFailed(text, status)) return m_szBuffer;
  CReplyList orders(text, kTags);
  if (char* const answer = AnswerWithoutData(orders, "0!", status)) return answer;
  CResultText list(DataText(), text.size());
  int count = 0;
  for (; orders.NextData(); ++count) {
    const int typeCode = TypeCodeOf(orders.Record());
    if (typeCode == kNoOrderType) return Fail(kOrderKindError, status);
    AppendOrder(list, orders.Record(), typeCode, m_nMarket);
  }
  return FinishList(list, count, status);
}
