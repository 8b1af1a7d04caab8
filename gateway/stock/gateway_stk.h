// The operations of the stock market: orders, order book and fills, positions and credit,
// settlement.
#ifndef QUORVANE_GATEWAY_STOCK_GATEWAY_STK_H_
#define QUORVANE_GATEWAY_STOCK_GATEWAY_STK_H_

#include "gateway/core/gateway_pub.h"

struct OrderForm;
struct StockOrder;

// A session object of CGatewayPub, with its contracts: who owns a returned text, what `*status`
// tells, how null texts read.
class CGatewayStk : public CGatewayPub {
 public:
  CGatewayStk() = default;
  ~CGatewayStk() override;

  // New orders. `identity` is the user's ID number and account joined by '&'; `orderDate` is in the
  // Republic of China calendar (1130115) or empty. `quantity` is above 0 and counts lots of `unit`
  // shares for the trade types 0 and 3, shares for 2; `price` is in hundredths. Order kind, price
  // kind, trade type and N6 flag are unsigned bytes; side and tag-13 flag are sent as they are.
  //
  // SubmitOrderEncode carries its signature payload bare in tag 33, SubmitOrderEncode1 in tag PL.
  using NewOrderEncoder = char*(const char* branch, const char* identity, const char* password,
                                const char* stockCode, const char* orderDate, long quantity,
                                long unit, long price, char side, char flag13, char orderKind,
                                char priceKind, char tradeType, char handlingFlag, int* status);
  NewOrderEncoder SubmitOrderEncode, SubmitOrderEncode1;

  // The brief order: header and trade type alone, nothing checked. When the header fails its
  // message comes with the trade type behind it.
  char* SubmitOrderEncode2(const char* branch, const char* identity, const char* password,
                           char function, char tradeType);

  // Cancellations and changes of the order that `orderReference`, two numbers joined by '&', names.
  // Other arguments as in a new order, with neither quantity nor price checked; `unreadPriceKind`
  // is sent by none. The payload is bare, or in tag PL for the names that end in 1.
  using AmendmentEncoder = char*(const char* branch, const char* identity, const char* password,
                                 const char* stockCode, const char* orderDate,
                                 const char* orderReference, long quantity, long unit, long price,
                                 char side, char flag13, char orderKind, char unreadPriceKind,
                                 char tradeType, char handlingFlag, int* status);
  AmendmentEncoder CancelOrderEncode, CancelOrderEncode1, ChangeOrderEncode, ChangeOrderEncode1;

  // The gateway's answer to a new order: "number@date@@accepted!".
  char* SubmitOrderDecode(const char* reply, int* status);

  // The gateway's answer to a cancellation or change: an empty text when it went through.
  char* CancelChangeOrderDecode(const char* reply, int* status);

  // The orders of a day: `date` goes out as it is, for both ends of the period. The decoder shows
  // some states by m_nMarket; 14 fields to an order.
  char* QueryOrderEncode(const char* branch, const char* identity, const char* password,
                         const char* date, int tradeType, int* status);
  char* QueryOrderDecode(const char* reply, int* status);

  // The fills of a period, whose dates are moved to the other calendar. 8 fields to a fill.
  char* QueryReplyEncode(const char* branch, const char* identity, const char* password,
                         const char* startDate, const char* endDate, int* status);
  char* QueryReplyDecode(const char* reply, int* status);

  // The positions: sections "<n>!count!records" of four sorts of holdings, or three sorts in the
  // layout of the brokerage JZG.
  char* QueryInventoryEncode(const char* branch, const char* identity, const char* password,
                             int* status);
  char* QueryInventoryDecode(const char* reply, int* status);
  char* QueryInventoryDecodeJZG(const char* reply, int* status);

  // Margin and short-selling figures of one stock: a record of 8 fields.
  char* QueryCreditInfoEncode(const char* branch, const char* identity, const char* password,
                              const char* stockCode, int* status);
  char* QueryCreditInfoDecode(const char* reply, int* status);

  // The settlement of a period: `periodOrStartDate` is a selector 1 to 6, or the first day, with
  // `endDate` the last. 17 fields to a record, in the layout of the brokerage JZG too.
  char* PaymentEncode(const char* branch, const char* identity, const char* password,
                      const char* periodOrStartDate, const char* endDate, int* status);
  char* PaymentDecode(const char* reply, int* status);
  char* PaymentDecodeJZG(const char* reply, int* status);

 private:
  // The one road of the encoders that have a status.
  char* EncodeOrder(const OrderForm& form, const StockOrder& order, int* status);
};

#endif  // QUORVANE_GATEWAY_STOCK_GATEWAY_STK_H_
