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

#define ORDER_PARAMETERS                                                                          \
  LOGIN_PARAMETERS, jstring reference, jstring orderDate, jstring commodity1, jstring commodity2, \
      jstring month1, jstring month2, jstring strike1, jstring strike2, jstring callPut1,         \
      jstring callPut2, jbyte n6, jbyte orderKind, jbyte priceType, jchar function, jchar w3,     \
      jchar timeInForce, jchar unusedLetter, jchar side1, jchar side2, jint quantity,             \
      jint unusedNumber, jint price
#define ORDER                                                                                      \
  LOGIN, reference, orderDate, commodity1, commodity2, month1, month2, strike1, strike2, callPut1, \
      callPut2, n6, orderKind, priceType, function, w3, timeInForce, unusedLetter, side1, side2,   \
      quantity, unusedNumber, price

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
