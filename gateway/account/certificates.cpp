// The life of a trading certificate. Every reply takes one road, and so does every request but the
// registration's, whose message has no limit:
//
//   request  header FUNC=code|MSG=Base64 of the certificate message[|BIRTH=birth date]|01=
//   reply    |00=..|68=code|M2=text|01=      result: the text as it came, or "[CERT]code text"
//
// The certificate message is the application's own; requests without a birth date name no user.
#include "gateway/account/base64_utils.h"
#include "gateway/account/messages.h"
#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"

namespace {

enum Field { kResultCode, kMessage };

// The message is the certificate, or says why there is none.
constexpr TagRow kRows[] = {{kResultCode, "68", 20}, {kMessage, "M2", kUnbounded}};
constexpr CTagTable kTags(kRows);

// The step lines of one request, which those who read the log go by; null where it has none.
struct CertSteps {
  const char* beforeHead = nullptr;
  const char* afterHead[3] = {};
  const char* afterTail[2] = {};
};

constexpr CertSteps kNoSteps;
constexpr CertSteps kRevokeSteps = {nullptr, {LOG_TEXT("test1")}, {}};
constexpr CertSteps kGetCert2Steps = {
    LOG_TEXT("GetCertEncode2_1"),
    {LOG_TEXT("GetCertEncode2_3"), LOG_TEXT("GetCertEncode2_4"), LOG_TEXT("GetCertEncode2_5")},
    {LOG_TEXT("GetCertEncode2__6"), LOG_TEXT("GetCertEncode2__7")}};

void LogStep(const char* step) {
  if (step != nullptr) debuglog(step);
}

// What tells one request from another.
struct CertRequest {
  const char* function;
  const char* parameterError;  // for a message that cannot be sent
  bool hasBirth = false;
  const CertSteps& steps = kNoSteps;
};

// Whose certificate it is; requests without a birth date do not say.
struct CertOwner {
  const char* branch = "";
  const char* identity = "";
  const char* password = "";
  const char* birth = "";
};

void WriteTail(CTextWriter& line, const CertRequest& request, const CertOwner& owner,
               std::string_view message) {
  line.Append(WIRE("FUNC=%s|MSG="), request.function);
  line.AppendWritten(CBase64Utils::EncodedSize(message.size()), [message](char* out) {
    CBase64Utils::EncodeTo(message.data(), message.size(), out);
  });
  if (request.hasBirth) line.Append(WIRE("|BIRTH=%s"), owner.birth);
  line.AppendText("|01=");
}

// An empty message is refused before the header is made.
char* EncodeCert(CGatewayPub& gateway, const CertRequest& request, const CertOwner& owner,
                 const char* certMsg, int* status) {
  const std::string_view message = AsText(certMsg);
  if (message.empty()) return gateway.Fail(request.parameterError, status);
  LogStep(request.steps.beforeHead);
  CTextWriter line = gateway.StartQuery(owner.branch, owner.identity, owner.password, status);
  if (*status != 1) return line.Text();
  for (const char* step : request.steps.afterHead) LogStep(step);
  WriteTail(line, request, owner, message);
  for (const char* step : request.steps.afterTail) LogStep(step);
  return CGatewayPub::Finish(line, status, request.parameterError);
}

// The first record alone is read, whatever its length; without one, code and text are empty.
char* DecodeCert(CGatewayPub& gateway, const char* label, const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  LogReply(label, text);
  if (gateway.TransportFailed(text, status)) return gateway.m_szBuffer;
  CRecord record(kTags);
  CRecordWalker walker(text, kUnbounded);
  walker.Next(record);
  const std::string_view code = record.Text(kResultCode);
  const std::string_view answer = record.Text(kMessage);
  const bool accepted = code == kDoneCode;
  const size_t length = answer.size() + (accepted ? 0 : strlen("[CERT] ") + code.size());
  char* const room = gateway.RenewResult(length, status);
  if (room == nullptr) return nullptr;
  CTextWriter result(room, length + 1);
  if (!accepted) {
    *status = -1;
    result.Append(WIRE("[CERT]%s "), code);
  }
  result.AppendText(answer);
  return result.Text();
}

}  // namespace

char* CGatewayPub::ApplyCertEncode(const char* branch, const char* identity, const char* password,
                                   const char* birth, const char* certMsg, int* status) {
  return EncodeCert(*this, {"13", kApplyCertParameters, true}, {branch, identity, password, birth},
                    certMsg, status);
}

char* CGatewayPub::ReNewCertEncode(const char* branch, const char* identity, const char* password,
                                   const char* birth, const char* certMsg, int* status) {
  return EncodeCert(*this, {"15", kReNewCertParameters, true}, {branch, identity, password, birth},
                    certMsg, status);
}

char* CGatewayPub::RevokeCertEncode(const char* branch, const char* identity, const char* password,
                                    const char* birth, const char* certMsg, int* status) {
  return EncodeCert(*this, {"18", kRevokeCertParameters, true, kRevokeSteps},
                    {branch, identity, password, birth}, certMsg, status);
}

char* CGatewayPub::GetCertEncode(const char* certMsg, int* status) {
  debuglog("GetCertEncode");
  return EncodeCert(*this, {"11", kGetCertParameters}, {}, certMsg, status);
}

char* CGatewayPub::GetCertEncode2(const char* certMsg, int* status) {
  LogLine(WIRE("regMsg Len:%ld"), AsText(certMsg).size());
  return EncodeCert(*this, {"11", kGetCertParameters, false, kGetCert2Steps}, {}, certMsg, status);
}

char* CGatewayPub::GetCertStatusEncode(const char* certMsg, int* status) {
  return EncodeCert(*this, {"14", kGetCertStatusParameters}, {}, certMsg, status);
}

char* CGatewayPub::InstallCertOKEncode(const char* certMsg, int* status) {
  return EncodeCert(*this, {"16", kInstallCertOKParameters}, {}, certMsg, status);
}

char* CGatewayPub::OpenCertEncode(const char* certMsg, int* status) {
  return EncodeCert(*this, {"17", kOpenCertParameters}, {}, certMsg, status);
}

// Its message has no limit: the request is written into one heap block of its very size.
char* CGatewayPub::RegisterCertEncode(const char* certMsg, int* status) {
  constexpr CertRequest kRequest = {"10", kRegisterCertParameters};
  const std::string_view message = AsText(certMsg);
  LogLine(WIRE("RegisterCertEncode: Len:%ld"), message.size());
  debuglog(certMsg);
  if (message.empty()) return Fail(kRequest.parameterError, status);
  CTextWriter head = StartQuery("", "", "", status);
  if (*status != 1) return head.Text();
  const std::string_view header(head.Text(), head.Length());
  const size_t length =
      header.size() + strlen("FUNC=10|MSG=|01=") + CBase64Utils::EncodedSize(message.size());
  char* const room = RenewResult(length, status);
  if (room == nullptr) return nullptr;
  CTextWriter line(room, length + 1);
  line.AppendText(header);
  WriteTail(line, kRequest, {}, message);
  return line.Text();
}

char* CGatewayPub::ApplyCertDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("ApplyCertDecode"), reply, status);
}

char* CGatewayPub::ReNewCertDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("ReNewCertDecode"), reply, status);
}

char* CGatewayPub::RevokeCertDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("RevokeCertDecode"), reply, status);
}

char* CGatewayPub::GetCertDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("GetCertDecode"), reply, status);
}

char* CGatewayPub::GetCertStatusDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("GetCertStatusDecode"), reply, status);
}

char* CGatewayPub::InstallCertOKDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("InstallCertOKDecode"), reply, status);
}

// Logs under the name of the status reply.
char* CGatewayPub::OpenCertDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("GetCertStatusDecode"), reply, status);
}

char* CGatewayPub::RegisterCertDecode(const char* reply, int* status) {
  return DecodeCert(*this, LOG_TEXT("RegisterCertDecode"), reply, status);
}
