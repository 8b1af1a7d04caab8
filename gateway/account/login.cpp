// Login, and the list of the user's accounts. Both replies carry the same account records:
//
//   reply    |68=code|M2=refusal|M3=notice  record*
//   record   |00=..|67=sequence|68=code|07=..|M5=..|16=..|17=account, head|18=account, tail
//            |69=..|01=
//   result   count ! ( <07>@M5@account@16@69! )*  [ <M>@notice! ]     the notice: login alone
//
// A refusal's message is shown as the gateway sent it, without a source or code.
#include "gateway/core/gateway_pub.h"
#include "gateway/core/list_frame.h"
#include "gateway/core/log.h"
#include "gateway/core/messages.h"

namespace {

// Of the whole reply.
constexpr ReplyField kReplyCode = {"68", 20};
constexpr ReplyField kRefusal = {"M2", CGatewayPub::kBufferSize};
constexpr ReplyField kNotice = {"M3", 300};

// Of a record. Of the fields that are named by their tags no more is known than where the result
// shows them.
enum Field {
  kAccountField07 = kOwnFields,
  kAccountFieldM5,
  kAccountField16,
  kAccountHead,
  kAccountTail,
  kAccountField69
};

constexpr TagRow kRows[] = {{kSequence, "67", 20},
                            {kResultCode, "68", 20},
                            {kMessage, "M2", kNotRead},
                            {kAccountField07, "07", 10},
                            {kAccountFieldM5, "M5", 20},
                            {kAccountField16, "16", 20},
                            {kAccountHead, "17", 10, Blanks::kSkipped},
                            {kAccountTail, "18", 10, Blanks::kSkipped},
                            {kAccountField69, "69", 20}};

// The end mark is above 900000 here, and a record without content ends the list too.
constexpr CListTable kTags(kRows, {200, true, 900001});

// An account shorter than 7 characters is shown with 7 digits.
void AppendAccount(CResultText& list, std::string_view head, std::string_view tail) {
  char scratch[20];
  CTextWriter account(scratch, sizeof scratch);
  account.Append(WIRE("%s%s"), head, tail);
  const std::string_view text(account.Text(), account.Length());
  if (text.empty() || text.size() >= 7) {
    list.AppendText(text);
  } else {
    list.Append(WIRE("%07d"), ReadInt32(text));
  }
}

void AppendAccountLine(CResultText& list, const CRecord& record) {
  list.Append(WIRE("<%s>@%s@"), record.Text(kAccountField07), record.Text(kAccountFieldM5));
  AppendAccount(list, record.Text(kAccountHead), record.Text(kAccountTail));
  list.Append(WIRE("@%s@%s!"), record.Text(kAccountField16), record.Text(kAccountField69));
}

int AppendAccountLines(CResultText& list, std::string_view reply) {
  int count = 0;
  for (CReplyList accounts(reply, kTags); accounts.NextData(); ++count) {
    AppendAccountLine(list, accounts.Record());
  }
  return count;
}

// The notice counts as one more record. It is asked for only behind a list of accounts: a login
// without accounts shows none.
int AppendNotice(CResultText& list, std::string_view reply) {
  const std::string_view notice = ReadField(reply, kNotice);
  LogLine(WIRE("[strResult2]%s"), notice);
  if (notice.empty()) return 0;
  list.Append(WIRE("<M>@%s!"), notice);
  return 1;
}

char* EncodeFunction(CGatewayPub& gateway, const char* branch, const char* identity,
                     const char* password, const char* function, int* status) {
  CTextWriter line = gateway.StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("FUNC=%s|01="), function);
  return CGatewayPub::Finish(line, status, kBadParameters);
}

char* ListAccounts(CGatewayPub& gateway, std::string_view reply, bool login, int* status) {
  if (gateway.TransportFailed(reply, status)) return gateway.m_szBuffer;
  const std::string_view code = ReadField(reply, kReplyCode);
  if (login) LogLine(WIRE("[strResult]%s"), code);
  if (code != kDoneCode) return gateway.Fail(ReadField(reply, kRefusal), status);
  CResultText list(gateway.DataText(), reply.size());
  int count = AppendAccountLines(list, reply);
  if (count == 0) return gateway.Answer("0!");
  if (login) count += AppendNotice(list, reply);
  char* const result = CGatewayPub::FinishList(list, count, status);
  if (login) LogLine(WIRE("[status]%d"), *status);
  return result;
}

}  // namespace

char* CGatewayPub::AuthEncode(const char* branch, const char* identity, const char* password,
                              int* status) {
  return EncodeFunction(*this, branch, identity, password, "0", status);
}

char* CGatewayPub::GetTotalAccountEncode(const char* branch, const char* identity,
                                         const char* password, int* status) {
  return EncodeFunction(*this, branch, identity, password, "12", status);
}

char* CGatewayPub::AuthDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  LogReply("AuthDecode", text);
  return ListAccounts(*this, text, true, status);
}

char* CGatewayPub::GetTotalAccountDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  LogReply("GetTotalAccountDecode", text);
  return ListAccounts(*this, text, false, status);
}
