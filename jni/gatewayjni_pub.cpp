// Entry points of login, account maintenance and the trading certificate.
#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"
#include "jni/entry_frame.h"

ENCODER(AuthEncode, CGatewayPub::AuthEncode, (LOGIN_PARAMETERS), LOGIN)
DECODER(AuthDecode, CGatewayPub::AuthDecode)

ENCODER(GetTotalAccountEncode, CGatewayPub::GetTotalAccountEncode, (LOGIN_PARAMETERS), LOGIN)
DECODER(GetTotalAccountDecode, CGatewayPub::GetTotalAccountDecode)

// Name, address and telephone are never released: a few bytes a call, kept on purpose.
GATEWAY_EXPORT(OpenAccountEncode)
(JNIEnv* env, jclass, SESSION_PARAMETERS, jstring extra1, jstring identity, jstring extra2,
 jstring name, jstring address, jstring tel, jbyte time, jbyte item, jintArray status) {
  FrameOptions options;
  options.keptTexts = 3;
  return Encode(env, options, SESSION, &CGatewayPub::OpenAccountEncode, status, extra1, identity,
                extra2, name, address, tel, time, item);
}
DECODER(OpenAccountDecode, CGatewayPub::OpenAccountDecode)

ENCODER(ChangePasswordEncode, CGatewayPub::ChangePasswordEncode,
        (LOGIN_PARAMETERS, jstring newPassword), LOGIN, newPassword)
DECODER(ChangePasswordDecode, CGatewayPub::ChangePasswordDecode)

ENCODER(QueryBankRemainEncode, CGatewayPub::QueryBankRemainEncode, (LOGIN_PARAMETERS), LOGIN)
DECODER(QueryBankRemainDecode, CGatewayPub::QueryBankRemainDecode)

// Certificates of an owner.

#define OWNER_PARAMETERS LOGIN_PARAMETERS, jstring birth, jstring certMsg
#define OWNER LOGIN, birth, certMsg

GATEWAY_EXPORT(ApplyCertEncode)
(JNIEnv* env, jclass, SESSION_PARAMETERS, OWNER_PARAMETERS, jintArray status) {
  FrameOptions options;
  options.loggedText = 1;  // the identity field: whose application the log is about
  return Encode(env, options, SESSION, &CGatewayPub::ApplyCertEncode, status, OWNER);
}
DECODER(ApplyCertDecode, CGatewayPub::ApplyCertDecode)

ENCODER(ReNewCertEncode, CGatewayPub::ReNewCertEncode, (OWNER_PARAMETERS), OWNER)
DECODER(ReNewCertDecode, CGatewayPub::ReNewCertDecode)

GATEWAY_EXPORT(RevokeCertEncode)
(JNIEnv* env, jclass, SESSION_PARAMETERS, OWNER_PARAMETERS, jintArray status) {
  FrameOptions options;
  // A call for good is in the log before anything can fail, and then whose certificate it is.
  options.opening = LOG_TEXT("Java_com_brindlex_kernel_quorvane_gatewayjni_RevokeCertEncode");
  options.loggedText = 1;
  return Encode(env, options, SESSION, &CGatewayPub::RevokeCertEncode, status, OWNER);
}
DECODER(RevokeCertDecode, CGatewayPub::RevokeCertDecode)

// Certificates by the application's own message alone.

ENCODER(GetCertEncode, CGatewayPub::GetCertEncode, (jstring certMsg), certMsg)

GATEWAY_EXPORT(GetCertEncode2)
(JNIEnv* env, jclass, SESSION_PARAMETERS, jstring certMsg, jintArray status) {
  FrameOptions options;
  // The messages are long: the log shows how far a call came, to its last release.
  options.stepLabel = LOG_TEXT("gatewayjni_GetCertEncode2_");
  return Encode(env, options, SESSION, &CGatewayPub::GetCertEncode2, status, certMsg);
}
DECODER(GetCertDecode, CGatewayPub::GetCertDecode)

ENCODER(GetCertStatusEncode, CGatewayPub::GetCertStatusEncode, (jstring certMsg), certMsg)
DECODER(GetCertStatusDecode, CGatewayPub::GetCertStatusDecode)

ENCODER(InstallCertOKEncode, CGatewayPub::InstallCertOKEncode, (jstring certMsg), certMsg)
DECODER(InstallCertOKDecode, CGatewayPub::InstallCertOKDecode)

ENCODER(OpenCertEncode, CGatewayPub::OpenCertEncode, (jstring certMsg), certMsg)
DECODER(OpenCertDecode, CGatewayPub::OpenCertDecode)

ENCODER(RegisterCertEncode, CGatewayPub::RegisterCertEncode, (jstring certMsg), certMsg)
DECODER(RegisterCertDecode, CGatewayPub::RegisterCertDecode)
