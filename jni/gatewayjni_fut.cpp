// Entry points of futures and options.
#include "gateway/futures/gateway_fut.h"
#include "jni/entry_frame.h"

GATEWAY_EXPORT(FutSubmitOrderEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring reference, jstring orderDate,
 jstring commodity1, jstring commodity2, jstring month1, jstring month2, jstring strike1,
 jstring strike2, jstring callPut1, jstring callPut2, jbyte n6, jbyte orderKind, jbyte priceType,
 jchar function, jchar w3, jchar timeInForce, jchar unusedLetter, jchar side1, jchar side2,
 jint quantity, jint unusedNumber, jint price, jintArray status) {
  return Encode(env, FuturesSession({market, platform, seqNo, serialNo, localIP}),
                &CGatewayFut::SubmitOrderEncode, status, branch, identity, password, reference,
                orderDate, commodity1, commodity2, month1, month2, strike1, strike2, callPut1,
                callPut2, n6, orderKind, priceType, function, w3, timeInForce, unusedLetter, side1,
                side2, quantity, unusedNumber, price);
}

GATEWAY_EXPORT(FutSubmitOrderEncode1)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring reference, jstring orderDate,
 jstring commodity1, jstring commodity2, jstring month1, jstring month2, jstring strike1,
 jstring strike2, jstring callPut1, jstring callPut2, jbyte n6, jbyte orderKind, jbyte priceType,
 jchar function, jchar w3, jchar timeInForce, jchar unusedLetter, jchar side1, jchar side2,
 jint quantity, jint unusedNumber, jint price, jintArray status) {
  return Encode(env, FuturesSession({market, platform, seqNo, serialNo, localIP}),
                &CGatewayFut::SubmitOrderEncode1, status, branch, identity, password, reference,
                orderDate, commodity1, commodity2, month1, month2, strike1, strike2, callPut1,
                callPut2, n6, orderKind, priceType, function, w3, timeInForce, unusedLetter, side1,
                side2, quantity, unusedNumber, price);
}

GATEWAY_EXPORT(FutSubmitOrderDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayFut::SubmitOrderDecode, reply, status);
}

GATEWAY_EXPORT(FutQueryOrderEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring date, jint selection,
 jintArray status) {
  return Encode(env, FuturesSession({market, platform, seqNo, serialNo, localIP}),
                &CGatewayFut::QueryOrderEncode, status, branch, identity, password, date,
                selection);
}

// An order book is too long and too telling for the log: the one result that does not go there.
GATEWAY_EXPORT(FutQueryOrderDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  FrameOptions options;
  options.logsResult = false;
  return Decode(env, &CGatewayFut::QueryOrderDecode, reply, status, options);
}

GATEWAY_EXPORT(FutQueryReplyEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring startDate, jstring endDate,
 jintArray status) {
  return Encode(env, FuturesSession({market, platform, seqNo, serialNo, localIP}),
                &CGatewayFut::QueryReplyEncode, status, branch, identity, password, startDate,
                endDate);
}

GATEWAY_EXPORT(FutQueryReplyDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayFut::QueryReplyDecode, reply, status);
}

GATEWAY_EXPORT(FutQueryInventoryEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jintArray status) {
  return Encode(env, FuturesSession({market, platform, seqNo, serialNo, localIP}),
                &CGatewayFut::QueryInventoryEncode, status, branch, identity, password);
}

GATEWAY_EXPORT(FutQueryInventoryDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayFut::QueryInventoryDecode, reply, status);
}

GATEWAY_EXPORT(QueryFinanceEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jint queryType, jintArray status) {
  return Encode(env, FuturesSession({market, platform, seqNo, serialNo, localIP}),
                &CGatewayFut::QueryFinanceEncode, status, branch, identity, password, queryType);
}

GATEWAY_EXPORT(QueryFinanceDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayFut::QueryFinanceDecode, reply, status);
}
