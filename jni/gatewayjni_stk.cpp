// Entry points of the stock market.
#include "gateway/stock/gateway_stk.h"
#include "jni/entry_frame.h"

// New orders.

#define ORDER_PARAMETERS                                                                        \
  LOGIN_PARAMETERS, jstring stockCode, jstring orderDate, jint quantity, jint unit, jint price, \
      jbyte side, jbyte flag13, jbyte orderKind, jbyte priceKind, jbyte tradeType,              \
      jbyte handlingFlag
#define ORDER                                                                             \
  LOGIN, stockCode, orderDate, quantity, unit, price, side, flag13, orderKind, priceKind, \
      tradeType, handlingFlag

ENCODER(SubmitOrderEncode, CGatewayStk::SubmitOrderEncode, (ORDER_PARAMETERS), ORDER)
ENCODER(SubmitOrderEncode1, CGatewayStk::SubmitOrderEncode1, (ORDER_PARAMETERS), ORDER)

// Has no status array.
GATEWAY_EXPORT(SubmitOrderEncode2)
(JNIEnv* env, jclass, SESSION_PARAMETERS, LOGIN_PARAMETERS, jbyte function, jbyte tradeType) {
  return Encode(env, FrameOptions(), SESSION, &CGatewayStk::SubmitOrderEncode2, nullptr, LOGIN,
                function, tradeType);
}

DECODER(SubmitOrderDecode, CGatewayStk::SubmitOrderDecode)

// Orders cancelled and changed.

#define AMENDMENT_PARAMETERS                                                                     \
  LOGIN_PARAMETERS, jstring stockCode, jstring orderDate, jstring orderReference, jint quantity, \
      jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind, jbyte unreadPriceKind,   \
      jbyte tradeType, jbyte handlingFlag
#define AMENDMENT                                                                              \
  LOGIN, stockCode, orderDate, orderReference, quantity, unit, price, side, flag13, orderKind, \
      unreadPriceKind, tradeType, handlingFlag

ENCODER(CancelOrderEncode, CGatewayStk::CancelOrderEncode, (AMENDMENT_PARAMETERS), AMENDMENT)
ENCODER(CancelOrderEncode1, CGatewayStk::CancelOrderEncode1, (AMENDMENT_PARAMETERS), AMENDMENT)
ENCODER(ChangeOrderEncode, CGatewayStk::ChangeOrderEncode, (AMENDMENT_PARAMETERS), AMENDMENT)
ENCODER(ChangeOrderEncode1, CGatewayStk::ChangeOrderEncode1, (AMENDMENT_PARAMETERS), AMENDMENT)
DECODER(CancelChangeOrderDecode, CGatewayStk::CancelChangeOrderDecode)

// Order book and fills.

ENCODER(QueryOrderEncode, CGatewayStk::QueryOrderEncode,
        (LOGIN_PARAMETERS, jstring date, jint tradeType), LOGIN, date, tradeType)

// The one decoder that is told the market: some states read differently there.
GATEWAY_EXPORT(QueryOrderDecode)
(JNIEnv* env, jclass, jint market, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::QueryOrderDecode, reply, status, FrameOptions(), market);
}

ENCODER(QueryReplyEncode, CGatewayStk::QueryReplyEncode,
        (LOGIN_PARAMETERS, jstring startDate, jstring endDate), LOGIN, startDate, endDate)
DECODER(QueryReplyDecode, CGatewayStk::QueryReplyDecode)

// Positions, credit, settlement.

ENCODER(QueryInventoryEncode, CGatewayStk::QueryInventoryEncode, (LOGIN_PARAMETERS), LOGIN)
DECODER(QueryInventoryDecode, CGatewayStk::QueryInventoryDecode)
DECODER(QueryInventoryDecodeJZG, CGatewayStk::QueryInventoryDecodeJZG)

ENCODER(QueryCreditInfoEncode, CGatewayStk::QueryCreditInfoEncode,
        (LOGIN_PARAMETERS, jstring stockCode), LOGIN, stockCode)
DECODER(QueryCreditInfoDecode, CGatewayStk::QueryCreditInfoDecode)

ENCODER(PaymentEncode, CGatewayStk::PaymentEncode,
        (LOGIN_PARAMETERS, jstring periodOrStartDate, jstring endDate), LOGIN, periodOrStartDate,
        endDate)
DECODER(PaymentDecode, CGatewayStk::PaymentDecode)
DECODER(PaymentDecodeJZG, CGatewayStk::PaymentDecodeJZG)
