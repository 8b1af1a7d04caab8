// New orders. Behind the header:
//
//   body      |27=|28=|29=|30=|UT=|13=|N6=  price group  |33=
//   payload   !!key_side_code_quantity_value, or a tag PL that names all
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/stock_order.h"

namespace {

constexpr NumberSet kPriceKinds = SetOf(kLimit, kLimitDown, kFlat, kLimitUp);

const char* FindFault(const StockOrder& order) {
  if (!kOrderKinds.Has(order.kind)) return kOrderKindError;
  if (!kPriceKinds.Has(order.priceKind)) return kPriceKindError;
  if (!kTradeTypes.Has(order.tradeType)) return kTradeTypeError;
  if (IsStockCodeTooLong(order)) return kStockCodeTooLong;
  if (order.quantity <= 0) return kQuantityError;
  return nullptr;
}

bool HasLimit(const StockOrder& order) {
  return order.tradeType != kFixedPrice && order.priceKind == kLimit;
}

// A negative price prints as two signed parts: both are divided toward zero.
int Whole(const StockOrder& order) {
  return order.price / 100;
}
int Hundredths(const StockOrder& order) {
  return order.price % 100;
}

void WriteBody(CTextWriter& line, const StockOrder& order) {
  line.Append(WIRE("|27=%d|28=%d|29=%s|30=%d|UT=%d|13=%c|N6=%d"), order.kind, order.tradeType,
              order.stockCode, SentQuantity(order), order.unit, order.flag13, order.handlingFlag);
  if (HasLimit(order)) {
    line.Append(WIRE("|31=%d.%02d|M8=0|32=%c|33="), Whole(order), Hundredths(order), order.side);
  } else if (order.tradeType == kFixedPrice) {
    line.Append(WIRE("|31=|M8=|32=%c|33="), order.side);
  } else {
    line.Append(WIRE("|31=0|M8=%d|32=%c|33="), order.priceKind, order.side);
  }
}

// Names one value for the price: the limit, the price kind or the trade type, whichever decides.
void WriteBare(CTextWriter& line, const StockOrder& order, const OrderKey& key) {
  WriteBody(line, order);
  OpenPayload(line, key);
  if (HasLimit(order)) {
    line.Append(WIRE("_%c_%s_%d_%d.%02d"), order.side, order.stockCode, SentQuantity(order),
                Whole(order), Hundredths(order));
  } else {
    line.Append(WIRE("_%c_%s_%d_%d"), order.side, order.stockCode, SentQuantity(order),
                order.tradeType == kFixedPrice ? order.tradeType : order.priceKind);
  }
}

// Names them all, with 0 for the price where no limit applies.
void WriteTagged(CTextWriter& line, const StockOrder& order, const OrderKey& key) {
  WriteBody(line, order);
  OpenPayload(line, key);
  if (HasLimit(order)) {
    line.Append(WIRE(",%c,%s,%d,%d,%d,%d,%d.%02d,"), order.side, order.stockCode, order.kind,
                order.tradeType, order.priceKind, SentQuantity(order), Whole(order),
                Hundredths(order));
  } else {
    line.Append(WIRE(",%c,%s,%d,%d,%d,%d,0,"), order.side, order.stockCode, order.kind,
                order.tradeType, order.priceKind, SentQuantity(order));
  }
}

constexpr OrderForm kBareOrder = {'I', OrderHead::kPlain, FindFault, WriteBare};
constexpr OrderForm kTaggedOrder = {'I', OrderHead::kSigned, FindFault, WriteTagged};

}  // namespace

char* CGatewayStk::SubmitOrderEncode(const char* branch, const char* identity, const char* password,
                                     const char* stockCode, const char* orderDate, long quantity,
                                     long unit, long price, char side, char flag13, char orderKind,
                                     char priceKind, char tradeType, char handlingFlag,
                                     int* status) {
  const StockOrder order(branch, identity, password, stockCode, orderDate, nullptr, quantity, unit,
                         price, side, flag13, orderKind, priceKind, tradeType, handlingFlag);
  return EncodeOrder(kBareOrder, order, status);
}

char* CGatewayStk::SubmitOrderEncode1(const char* branch, const char* identity,
                                      const char* password, const char* stockCode,
                                      const char* orderDate, long quantity, long unit, long price,
                                      char side, char flag13, char orderKind, char priceKind,
                                      char tradeType, char handlingFlag, int* status) {
  const StockOrder order(branch, identity, password, stockCode, orderDate, nullptr, quantity, unit,
                         price, side, flag13, orderKind, priceKind, tradeType, handlingFlag);
  return EncodeOrder(kTaggedOrder, order, status);
}
