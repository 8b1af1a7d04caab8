// Entry points of login, the account list and account maintenance.
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

GATEWAY_EXPORT(OpenAccountEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring extra1, jstring identity, jstring extra2, jstring name, jstring address, jstring tel,
 jbyte time, jbyte item, jintArray status) {
  FrameOptions options;
  options.keptTexts =
      3;  // name, address and telephone stay with the VM, as the app's builds expect
  return RunEncoder<StatusUse::kGiven>(env, options, {market, platform, seqNo, serialNo, localIP},
                                       &CGatewayPub::OpenAccountEncode, status, extra1, identity,
                                       extra2, name, address, tel, time, item);
}

GATEWAY_EXPORT(OpenAccountDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::OpenAccountDecode, reply, status);
}

GATEWAY_EXPORT(ChangePasswordEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring newPassword, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayPub::ChangePasswordEncode, status, branch, identity, password,
                newPassword);
}

GATEWAY_EXPORT(ChangePasswordDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::ChangePasswordDecode, reply, status);
}

GATEWAY_EXPORT(QueryBankRemainEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayPub::QueryBankRemainEncode, status, branch, identity, password);
}

GATEWAY_EXPORT(QueryBankRemainDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::QueryBankRemainDecode, reply, status);
}
