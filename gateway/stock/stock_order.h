// What one stock order is, and the forms that it is sent in.
#ifndef QUORVANE_GATEWAY_STOCK_STOCK_ORDER_H_
#define QUORVANE_GATEWAY_STOCK_STOCK_ORDER_H_

#include "gateway/core/decimal.h"
#include "gateway/core/number_set.h"
#include "gateway/core/request_head.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/messages.h"

// The arguments of one order by name. The host's bytes are unsigned numbers, but for the two that
// are sent as characters. Texts are the host's and outlive the order.
struct StockOrder {
  StockOrder(const char* hostBranch, const char* hostIdentity, const char* hostPassword,
             const char* hostStockCode, const char* hostOrderDate, const char* hostReference,
             long hostQuantity, long hostUnit, long hostPrice, char hostSide, char hostFlag13,
             char hostKind, char hostPriceKind, char hostTradeType, char hostHandlingFlag)
      : origin{AsText(hostBranch), AsText(hostIdentity), AsText(hostPassword),
               AsText(hostOrderDate)},
        stockCode(AsText(hostStockCode)),
        orderReference(AsText(hostReference)),
        quantity(static_cast<int>(hostQuantity)),
        unit(static_cast<int>(hostUnit)),
        price(static_cast<int>(hostPrice)),
        side(hostSide),
        flag13(hostFlag13),
        kind(NumberOf(hostKind)),
        priceKind(NumberOf(hostPriceKind)),
        tradeType(NumberOf(hostTradeType)),
        handlingFlag(NumberOf(hostHandlingFlag)) {}

  // The number of a host's byte.
  static uint8_t NumberOf(char byte) { return static_cast<uint8_t>(byte); }

  OrderOrigin origin;
  std::string_view stockCode;
  std::string_view orderReference;  // the order to cancel or change; empty in a new order
  int quantity;                     // lots, or shares of an odd lot
  int unit;                         // shares per lot
  int price;                        // hundredths
  char side;
  char flag13;
  uint8_t kind;
  uint8_t priceKind;
  uint8_t tradeType;
  uint8_t handlingFlag;
};

// Trade types: lots, an odd lot, lots at the session's fixed price.
enum TradeType { kLots = 0, kOddLot = 2, kFixedPrice = 3 };

// Price kinds: the limit that the order names, or a price that the market names.
enum PriceKind { kLimit = 0, kLimitDown = 1, kFlat = 5, kLimitUp = 9 };

inline constexpr NumberSet kTradeTypes = SetOf(kLots, kOddLot, kFixedPrice);
inline constexpr NumberSet kOrderKinds = SetOf(0, 1, 2, 3, 4, 5, 8);

inline constexpr size_t kStockCodeChars = 6;

// What goes out for the quantity: shares.
inline int SentQuantity(const StockOrder& order) {
  return order.tradeType == kOddLot ? order.quantity : WrapMultiply(order.quantity, order.unit);
}

// What goes out for the price.
inline int SentPrice(const StockOrder& order) {
  return order.tradeType == kFixedPrice ? 0 : order.price;
}

inline bool IsStockCodeTooLong(const StockOrder& order) {
  return order.stockCode.size() > kStockCodeChars;
}

// Appends what opens a payload: it stands bare behind the last field, or in tag PL.
void OpenPayload(CTextWriter& line, const OrderKey& key);

// What one encoder sends: behind the plain header a bare payload, behind the signed one a payload
// in tag PL. `fault` tells what keeps an order from being sent, null for nothing; `write` appends
// body and payload to the header.
struct OrderForm {
  char function;
  OrderHead head;
  const char* (*fault)(const StockOrder& order);
  void (*write)(CTextWriter& line, const StockOrder& order, const OrderKey& key);
};

#endif  // QUORVANE_GATEWAY_STOCK_STOCK_ORDER_H_
