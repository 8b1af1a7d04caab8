// Account maintenance: opening an account, changing the trading password, the balance of the linked
// bank account.
//
//   request  header FUNC=9|NAME=..|ADDRESS=..|TEL=..|TIME=code|ITEM=code|01=       opening
//            header FUNC=1|54=password|55=new password|01=                         password
//            header FUNC=7|01=                                                     balance
//   reply    |68=code|M2=refusal                               opening, password: result is empty
//            |00=..|PN=balance|01=                             balance: result 1!@@@@balance@!
#include "gateway/core/gateway_pub.h"
#include "gateway/core/log.h"
#include "gateway/core/messages.h"

namespace {

// The answer to opening an account and to changing the password.
constexpr ReplyField kReplyCode = {"68", 20};
constexpr ReplyField kRefusal = {"M2", 200};

// Room for the balance record: a longer one reads as empty.
constexpr size_t kRecord = 200;

enum Field { kBankBalance };

constexpr TagRow kRows[] = {{kBankBalance, "PN", kRecord}};
constexpr CTagTable kTags(kRows);

// A code that the host passes as one byte, sent as an unsigned number.
int UnsignedCode(char code) {
  return static_cast<unsigned char>(code);
}

// The answer to a request that has no result but its success.
char* Acknowledge(CGatewayPub& gateway, std::string_view reply, int* status) {
  if (gateway.TransportFailed(reply, status)) return gateway.m_szBuffer;
  const std::string_view code = ReadField(reply, kReplyCode);
  if (code == kDoneCode) return gateway.Answer("");
  return gateway.Refuse(ReadField(reply, kRefusal), code, status);
}

}  // namespace

char* CGatewayPub::OpenAccountEncode(const char*, const char* identity, const char*,
                                     const char* name, const char* address, const char* tel,
                                     char time, char item, int* status) {
  CTextWriter line = StartQuery("", identity, "", status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("FUNC=9|NAME=%s|ADDRESS=%s|TEL=%s"), name, address, tel);
  line.Append(WIRE("|TIME=%d|ITEM=%d|01="), UnsignedCode(time), UnsignedCode(item));
  return Finish(line, status, kBadParameters);
}

// The escape covers the whole request, the header's edition name too; a header that failed is a
// message for the user and keeps its blanks.
char* CGatewayPub::ChangePasswordEncode(const char* branch, const char* identity,
                                        const char* password, const char* newPassword,
                                        int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("FUNC=1|54=%s|55=%s|01="), password, newPassword);
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayPub::QueryBankRemainEncode(const char* branch, const char* identity,
                                         const char* password, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.AppendText("FUNC=7|01=");
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayPub::OpenAccountDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  LogReply("OpenAccountDecode", text);
  return Acknowledge(*this, text, status);
}

// Its reply is not logged.
char* CGatewayPub::ChangePasswordDecode(const char* reply, int* status) {
  return Acknowledge(*this, AsText(reply), status);
}

// The result code is not looked at: a refused query shows an empty balance.
char* CGatewayPub::QueryBankRemainDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  LogReply("QueryBankRemainDecode", text);
  if (TransportFailed(text, status)) return m_szBuffer;
  CRecord record(kTags);
  CRecordWalker walker(text, kRecord);
  walker.Next(record);
  CTextWriter answer = StartRequest();
  answer.Append(WIRE("1!@@@@%s@!"), record.Text(kBankBalance));
  return answer.Text();
}
