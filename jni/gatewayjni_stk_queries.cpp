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
