// Entry points of the stock market's lists: order book and fills, positions and credit, settlement.
#include "gateway/stock/gateway_stk.h"
#include "jni/entry_frame.h"

GATEWAY_EXPORT(QueryOrderEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring date, jint tradeType,
 jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::QueryOrderEncode,
                status, branch, identity, password, date, tradeType);
}

// The one decoder that is told the market: some states read differently there.
GATEWAY_EXPORT(QueryOrderDecode)
(JNIEnv* env, jclass, jint market, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::QueryOrderDecode, reply, status, FrameOptions(), market);
}

GATEWAY_EXPORT(QueryReplyEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring startDate, jstring endDate,
 jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::QueryReplyEncode,
                status, branch, identity, password, startDate, endDate);
}

GATEWAY_EXPORT(QueryReplyDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::QueryReplyDecode, reply, status);
}

GATEWAY_EXPORT(QueryInventoryEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayStk::QueryInventoryEncode, status, branch, identity, password);
}

GATEWAY_EXPORT(QueryInventoryDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::QueryInventoryDecode, reply, status);
}

GATEWAY_EXPORT(QueryInventoryDecodeJZG)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::QueryInventoryDecodeJZG, reply, status);
}

GATEWAY_EXPORT(QueryCreditInfoEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayStk::QueryCreditInfoEncode, status, branch, identity, password, stockCode);
}

GATEWAY_EXPORT(QueryCreditInfoDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::QueryCreditInfoDecode, reply, status);
}

GATEWAY_EXPORT(PaymentEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring period, jstring endDate,
 jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::PaymentEncode,
                status, branch, identity, password, period, endDate);
}

GATEWAY_EXPORT(PaymentDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::PaymentDecode, reply, status);
}

GATEWAY_EXPORT(PaymentDecodeJZG)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::PaymentDecodeJZG, reply, status);
}
