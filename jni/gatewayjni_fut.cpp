// Entry points of futures and options.
#include "gateway/futures/gateway_fut.h"
#include "jni/entry_frame.h"

namespace {

// The same Java value serves both markets, and above 100 the request goes to futures.
constexpr jint kFuturesMarketOffset = 100;

HostSession OnFutures(HostSession session) {
  session.market = WrapAdd(session.market, kFuturesMarketOffset);
  return session;
}

}  // namespace

#define FUTURES_ENCODER(operation, method, parameters, ...) \
  ENCODER_OF(OnFutures(SESSION), operation, method, parameters, __VA_ARGS__)

#define ORDER_PARAMETERS                                                                        \
  LOGIN_PARAMETERS, jstring orderReference, jstring orderDate, jstring commodity1,              \
      jstring commodity2, jstring month1, jstring month2, jstring strike1, jstring strike2,     \
      jstring callPut1, jstring callPut2, jbyte handlingFlag, jbyte orderKind, jbyte priceType, \
      jchar function, jchar flagW3, jchar timeInForce, jchar unreadLetter, jchar side1,         \
      jchar side2, jint quantity, jint unreadNumber, jint price
#define ORDER                                                                                 \
  LOGIN, orderReference, orderDate, commodity1, commodity2, month1, month2, strike1, strike2, \
      callPut1, callPut2, handlingFlag, orderKind, priceType, function, flagW3, timeInForce,  \
      unreadLetter, side1, side2, quantity, unreadNumber, price

FUTURES_ENCODER(FutSubmitOrderEncode, CGatewayFut::SubmitOrderEncode, (ORDER_PARAMETERS), ORDER)
FUTURES_ENCODER(FutSubmitOrderEncode1, CGatewayFut::SubmitOrderEncode1, (ORDER_PARAMETERS), ORDER)
DECODER(FutSubmitOrderDecode, CGatewayFut::SubmitOrderDecode)

FUTURES_ENCODER(FutQueryOrderEncode, CGatewayFut::QueryOrderEncode,
                (LOGIN_PARAMETERS, jstring date, jint selection), LOGIN, date, selection)

// The one result that does not go into the log.
GATEWAY_EXPORT(FutQueryOrderDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  FrameOptions options;
  options.logsResult = false;
  return Decode(env, &CGatewayFut::QueryOrderDecode, reply, status, options);
}

FUTURES_ENCODER(FutQueryReplyEncode, CGatewayFut::QueryReplyEncode,
                (LOGIN_PARAMETERS, jstring startDate, jstring endDate), LOGIN, startDate, endDate)
DECODER(FutQueryReplyDecode, CGatewayFut::QueryReplyDecode)

FUTURES_ENCODER(FutQueryInventoryEncode, CGatewayFut::QueryInventoryEncode, (LOGIN_PARAMETERS),
                LOGIN)
DECODER(FutQueryInventoryDecode, CGatewayFut::QueryInventoryDecode)

FUTURES_ENCODER(QueryFinanceEncode, CGatewayFut::QueryFinanceEncode,
                (LOGIN_PARAMETERS, jint queryType), LOGIN, queryType)
DECODER(QueryFinanceDecode, CGatewayFut::QueryFinanceDecode)
