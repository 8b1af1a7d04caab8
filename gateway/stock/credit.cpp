// Margin and short-selling figures of one stock.
//
//   request  header |FUNC=8|29=code|01=
//   record   |68=code|M2=refusal|29=code|A0=..|76=..|77=..|B8=..|B9=..|A1=..|A2=..
//   result   29 @ 76 @ 77 @ B8 @ B9 @ A0 @ A1 @ A2 !      of the first record alone
#include "gateway/core/list_frame.h"
#include "gateway/core/messages.h"
#include "gateway/stock/gateway_stk.h"

namespace {

constexpr size_t kRecordSize = 218;
constexpr size_t kValueSize = 24;

enum Field { kCode = kOwnFields, k76, k77, kB8, kB9, kA0, kA1, kA2 };

constexpr CTagTable kTags(
    {{"67"}, {"68"}, {"M2"}, {"29"}, {"76"}, {"77"}, {"B8"}, {"B9"}, {"A0"}, {"A1"}, {"A2"}});
static_assert(OpensListTable(kTags), "the list frame reads its rows");

// There is no list to end: the sequence is not read. A refusal is as long as its record lets it be.
constexpr ListShape kShape = {kRecordSize, kRecordSize, kValueSize, kRecordSize};

}  // namespace

char* CGatewayStk::QueryCreditInfoEncode(const char* branch, const char* identity,
                                         const char* password, const char* stockCode, int* status) {
  *status = 1;
  CTextWriter line = StartRequest();
  if (!WriteQueryHead(line, branch, identity, password)) {
    *status = -1;
    return line.Text();
  }
  line.Append(WIRE("|FUNC=8|29=%s|01="), stockCode);
  return FinishEscaped(line, status, kBadParameters);
}

// The reply is not logged.
char* CGatewayStk::QueryCreditInfoDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (TransportFailed(text, status)) return m_szBuffer;
  const CReplyList credit(text, kTags, kShape);
  if (char* const answer = AnswerWithoutData(credit, "@@@@@@@!", status)) return answer;
  CTextWriter answer = StartRequest();
  for (const int field : {kCode, k76, k77, kB8, kB9, kA0, kA1}) {
    answer.Append(WIRE("%s@"), credit.Record().Text(field, kValueSize));
  }
  answer.Append(WIRE("%s!"), credit.Record().Text(kA2, kValueSize));
  return answer.Text();
}
