// Entry points of the trading certificate.
#include "gateway/core/gateway_pub.h"
#include "jni/entry_frame.h"

GATEWAY_EXPORT(ApplyCertEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring birth, jstring certMsg,
 jintArray status) {
  FrameOptions options;
  options.loggedText = 1;  // the identity field: whose application the log is about
  return RunEncoder<StatusUse::kGiven>(env, options, {market, platform, seqNo, serialNo, localIP},
                                       &CGatewayPub::ApplyCertEncode, status, branch, identity,
                                       password, birth, certMsg);
}

GATEWAY_EXPORT(ApplyCertDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::ApplyCertDecode, reply, status);
}

GATEWAY_EXPORT(ReNewCertEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring birth, jstring certMsg,
 jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayPub::ReNewCertEncode,
                status, branch, identity, password, birth, certMsg);
}

GATEWAY_EXPORT(ReNewCertDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::ReNewCertDecode, reply, status);
}

GATEWAY_EXPORT(RevokeCertEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring branch, jstring identity, jstring password, jstring birth, jstring certMsg,
 jintArray status) {
  FrameOptions options;
  // A call for good is in the log before anything can fail, and then whose certificate it is.
  options.opening = "Java_com_brindlex_kernel_quorvane_gatewayjni_RevokeCertEncode";
  options.loggedText = 1;
  return RunEncoder<StatusUse::kGiven>(env, options, {market, platform, seqNo, serialNo, localIP},
                                       &CGatewayPub::RevokeCertEncode, status, branch, identity,
                                       password, birth, certMsg);
}

GATEWAY_EXPORT(RevokeCertDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::RevokeCertDecode, reply, status);
}

GATEWAY_EXPORT(GetCertEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring certMsg, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayPub::GetCertEncode,
                status, certMsg);
}

GATEWAY_EXPORT(GetCertEncode2)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring certMsg, jintArray status) {
  FrameOptions options;
  // The messages are long: the log shows how far a call came, to its last release.
  options.stepLabel = "gatewayjni_GetCertEncode2_";
  return RunEncoder<StatusUse::kGiven>(env, options, {market, platform, seqNo, serialNo, localIP},
                                       &CGatewayPub::GetCertEncode2, status, certMsg);
}

GATEWAY_EXPORT(GetCertDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::GetCertDecode, reply, status);
}

GATEWAY_EXPORT(GetCertStatusEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring certMsg, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayPub::GetCertStatusEncode, status, certMsg);
}

GATEWAY_EXPORT(GetCertStatusDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::GetCertStatusDecode, reply, status);
}

GATEWAY_EXPORT(InstallCertOKEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring certMsg, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP},
                &CGatewayPub::InstallCertOKEncode, status, certMsg);
}

GATEWAY_EXPORT(InstallCertOKDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::InstallCertOKDecode, reply, status);
}

GATEWAY_EXPORT(OpenCertEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring certMsg, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayPub::OpenCertEncode,
                status, certMsg);
}

GATEWAY_EXPORT(OpenCertDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::OpenCertDecode, reply, status);
}

GATEWAY_EXPORT(RegisterCertEncode)
(JNIEnv* env, jclass, jint market, jint platform, jint seqNo, jstring serialNo, jstring localIP,
 jstring certMsg, jintArray status) {
  return Encode(env, {market, platform, seqNo, serialNo, localIP}, &CGatewayPub::RegisterCertEncode,
                status, certMsg);
}

GATEWAY_EXPORT(RegisterCertDecode)(JNIEnv* env, jclass, jstring reply, jintArray status) {
  return Decode(env, &CGatewayPub::RegisterCertDecode, reply, status);
}
