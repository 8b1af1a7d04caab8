// Entry points of stock orders: new, cancelled, changed, and the answers to them.
#include "gateway/stock/gateway_stk.h"
#include "jni/entry_frame.h"

GATEWAY_EXPORT(SubmitOrderEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jstring date, jint quantity,
 jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind, jbyte priceKind, jbyte tradeType,
 jbyte n6, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::SubmitOrderEncode,
                status, branch, identity, password, stockCode, date, quantity, unit, price, side,
                flag13, orderKind, priceKind, tradeType, n6);
}

GATEWAY_EXPORT(SubmitOrderEncode1)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jstring date, jint quantity,
 jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind, jbyte priceKind, jbyte tradeType,
 jbyte n6, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::SubmitOrderEncode1,
                status, branch, identity, password, stockCode, date, quantity, unit, price, side,
                flag13, orderKind, priceKind, tradeType, n6);
}

// Has no status array.
GATEWAY_EXPORT(SubmitOrderEncode2)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jbyte function, jbyte tradeType) {
  return RunEncoder<StatusUse::kNone>(
      env, FrameOptions(), {market, platform, seqNo, serialNo, localIP},
      &CGatewayStk::SubmitOrderEncode2, nullptr, branch, identity, password, function, tradeType);
}

GATEWAY_EXPORT(CancelOrderEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jstring date,
 jstring reference, jint quantity, jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind,
 jbyte unread, jbyte tradeType, jbyte n6, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::CancelOrderEncode,
                status, branch, identity, password, stockCode, date, reference, quantity, unit,
                price, side, flag13, orderKind, unread, tradeType, n6);
}

GATEWAY_EXPORT(CancelOrderEncode1)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jstring date,
 jstring reference, jint quantity, jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind,
 jbyte unread, jbyte tradeType, jbyte n6, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::CancelOrderEncode1,
                status, branch, identity, password, stockCode, date, reference, quantity, unit,
                price, side, flag13, orderKind, unread, tradeType, n6);
}

GATEWAY_EXPORT(ChangeOrderEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jstring date,
 jstring reference, jint quantity, jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind,
 jbyte unread, jbyte tradeType, jbyte n6, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::ChangeOrderEncode,
                status, branch, identity, password, stockCode, date, reference, quantity, unit,
                price, side, flag13, orderKind, unread, tradeType, n6);
}

GATEWAY_EXPORT(ChangeOrderEncode1)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring stockCode, jstring date,
 jstring reference, jint quantity, jint unit, jint price, jbyte side, jbyte flag13, jbyte orderKind,
 jbyte unread, jbyte tradeType, jbyte n6, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayStk::ChangeOrderEncode1,
                status, branch, identity, password, stockCode, date, reference, quantity, unit,
                price, side, flag13, orderKind, unread, tradeType, n6);
}

GATEWAY_EXPORT(SubmitOrderDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::SubmitOrderDecode, reply, status);
}

GATEWAY_EXPORT(CancelChangeOrderDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayStk::CancelChangeOrderDecode, reply, status);
}
