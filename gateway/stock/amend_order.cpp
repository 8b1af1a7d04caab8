// Cancellations and changes. Behind the header:
//
//   body      |10=|36=|46=|28=|29=|31=|32=  and by form 37, N6, 27, UT, 13
//   payload   !!key_reference_side_code_quantity_, or a tag PL with the columns of a new order's
//
// The price goes out as a plain number of hundredths, and neither it nor the quantity is checked.
#include "gateway/core/conversions.h"
#include "gateway/orders/order_reference.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/stock_order.h"

namespace {

// Buffer of one piece of a reference; a longer piece is dropped.
constexpr size_t kReferenceSize = 40;

// With the payload in tag PL the kinds 6 and 7 pass, too.
constexpr NumberSet kTaggedKinds = SetOf(0, 1, 2, 3, 4, 5, 6, 7, 8);

const char* FindFaultBehindKind(const StockOrder& order) {
  if (!kTradeTypes.Has(order.tradeType)) return kTradeTypeError;
  return IsStockCodeTooLong(order) ? kStockCodeTooLong : nullptr;
}

const char* FindFault(const StockOrder& order) {
  return kOrderKinds.Has(order.kind) ? FindFaultBehindKind(order) : kOrderKindError;
}

const char* FindFaultTagged(const StockOrder& order) {
  return kTaggedKinds.Has(order.kind) ? FindFaultBehindKind(order) : kOrderKindError;
}

OrderReference SplitReference(const StockOrder& order) {
  return OrderReference(order.orderReference, kReferenceSize);
}

// A body begins alike in every form; `rest` are the values of the format's own marks. One piece: a
// side of NUL loses all that follows it.
template <class Format, class... Rest>
void WriteBody(CTextWriter& line, Format format, const StockOrder& order,
               const OrderReference& reference, const Rest&... rest) {
  line.Append(format, RocToWesternDate(order.origin.rocDate), reference.orderNumber,
              reference.gatewayNumber, order.tradeType, order.stockCode, SentPrice(order),
              order.side, rest...);
}

// Sends no quantity, and lots of 1000 whatever the order says.
void WriteCancel(CTextWriter& line, const StockOrder& order, const OrderKey& key) {
  const OrderReference reference = SplitReference(order);
  WriteBody(line, WIRE("|10=%08d|36=%s|46=%s|28=%d|29=%s|31=%d|32=%c|N6=%d|27=%d|UT=1000|13=%c"),
            order, reference, order.handlingFlag, order.kind, order.flag13);
  OpenPayload(line, key);
  line.Append(WIRE("_%s_%c_%s__"), reference.orderNumber, order.side, order.stockCode);
}

void WriteChange(CTextWriter& line, const StockOrder& order, const OrderKey& key) {
  const OrderReference reference = SplitReference(order);
  WriteBody(line,
            WIRE("|10=%08d|36=%s|46=%s|28=%d|29=%s|31=%d|32=%c|37=%d|N6=%d|27=%d|UT=%d|13=%c"),
            order, reference, SentQuantity(order), order.handlingFlag, order.kind, order.unit,
            order.flag13);
  OpenPayload(line, key);
  line.Append(WIRE("_%s_%c_%s_%d_"), reference.orderNumber, order.side, order.stockCode,
              SentQuantity(order));
}

void WriteTaggedBody(CTextWriter& line, const StockOrder& order, const OrderReference& reference) {
  WriteBody(line, WIRE("|10=%08d|36=%s|46=%s|28=%d|29=%s|31=%d|32=%c|37=%d|N6=%d|27=%d|UT=%d"),
            order, reference, SentQuantity(order), order.handlingFlag, order.kind, order.unit);
}

// In tag PL the columns of order kind, price kind and price stay empty, for a cancellation the
// quantity's, too.
void WriteTaggedCancel(CTextWriter& line, const StockOrder& order, const OrderKey& key) {
  const OrderReference reference = SplitReference(order);
  WriteTaggedBody(line, order, reference);
  OpenPayload(line, key);
  line.Append(WIRE(",%c,%s,,%d,,,,%s"), order.side, order.stockCode, order.tradeType,
              reference.orderNumber);
}

void WriteTaggedChange(CTextWriter& line, const StockOrder& order, const OrderKey& key) {
  const OrderReference reference = SplitReference(order);
  WriteTaggedBody(line, order, reference);
  OpenPayload(line, key);
  line.Append(WIRE(",%c,%s,,%d,,%d,,%s"), order.side, order.stockCode, order.tradeType,
              SentQuantity(order), reference.orderNumber);
}

constexpr OrderForm kCancel = {'D', OrderHead::kPlain, FindFault, WriteCancel};
constexpr OrderForm kTaggedCancel = {'D', OrderHead::kSigned, FindFaultTagged, WriteTaggedCancel};
constexpr OrderForm kChange = {'C', OrderHead::kPlain, FindFault, WriteChange};
constexpr OrderForm kTaggedChange = {'C', OrderHead::kSigned, FindFaultTagged, WriteTaggedChange};

}  // namespace

// What each of these encoders takes, and the order that it makes of it.
#define AMENDMENT_PARAMETERS                                                                   \
  const char *branch, const char *identity, const char *password, const char *stockCode,       \
      const char *orderDate, const char *orderReference, long quantity, long unit, long price, \
      char side, char flag13, char orderKind, char unreadPriceKind, char tradeType,            \
      char handlingFlag, int *status
#define AMENDMENT                                                                              \
  StockOrder(branch, identity, password, stockCode, orderDate, orderReference, quantity, unit, \
             price, side, flag13, orderKind, unreadPriceKind, tradeType, handlingFlag)

char* CGatewayStk::CancelOrderEncode(AMENDMENT_PARAMETERS) {
  return EncodeOrder(kCancel, AMENDMENT, status);
}

char* CGatewayStk::CancelOrderEncode1(AMENDMENT_PARAMETERS) {
  return EncodeOrder(kTaggedCancel, AMENDMENT, status);
}

char* CGatewayStk::ChangeOrderEncode(AMENDMENT_PARAMETERS) {
  return EncodeOrder(kChange, AMENDMENT, status);
}

char* CGatewayStk::ChangeOrderEncode1(AMENDMENT_PARAMETERS) {
  return EncodeOrder(kTaggedChange, AMENDMENT, status);
}
