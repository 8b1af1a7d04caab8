// Entry points of the session's own operations: login, account maintenance, certificates.
#include "gateway/core/gateway_pub.h"
#include "jni/entry_frame.h"

GATEWAY_EXPORT(AuthEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayPub::AuthEncode, status,
                branch, identity, password);
}

GATEWAY_EXPORT(AuthDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::AuthDecode, reply, status);
}

GATEWAY_EXPORT(GetTotalAccountEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayPub::GetTotalAccountEncode, status, branch, identity, password);
}

GATEWAY_EXPORT(GetTotalAccountDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::GetTotalAccountDecode, reply, status);
}
