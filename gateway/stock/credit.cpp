// Margin and short-selling figures of one stock.
//
//   request  header |FUNC=8|29=code|01=
//   record   |68=code|M2=refusal|29=code|A0=..|76=..|77=..|B8=..|B9=..|A1=..|A2=..
//   result   29 @ 76 @ 77 @ B8 @ B9 @ A0 @ A1 @ A2 !      of the first record alone
#include "gateway/core/list_frame.h"
#include "gateway/core/messages.h"
#include "gateway/stock/gateway_stk.h"

namespace {

constexpr size_t kRecord = 218;

// Of the figures no more is known than where the result shows them. There is no list to end.
enum Field {
  kStockCode = kOwnFields,
  kFigure76,
  kFigure77,
  kFigureB8,
  kFigureB9,
  kFigureA0,
  kFigureA1,
  kFigureA2
};

constexpr TagRow kRows[] = {
    {kSequence, "67", kNotRead}, {kResultCode, "68", 24}, {kMessage, "M2", kRecord},
    {kStockCode, "29", 24},      {kFigure76, "76", 24},   {kFigure77, "77", 24},
    {kFigureB8, "B8", 24},       {kFigureB9, "B9", 24},   {kFigureA0, "A0", 24},
    {kFigureA1, "A1", 24},       {kFigureA2, "A2", 24}};
constexpr CListTable kTags(kRows, {kRecord});

}  // namespace

char* CGatewayStk::QueryCreditInfoEncode(const char* branch, const char* identity,
                                         const char* password, const char* stockCode, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("|FUNC=8|29=%s|01="), stockCode);
  return FinishEscaped(line, status, kBadParameters);
}

// The reply is not logged.
char* CGatewayStk::QueryCreditInfoDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  if (TransportFailed(text, status)) return m_szBuffer;
  const CReplyList credit(text, kTags);
  if (char* const answer = AnswerWithoutData(credit, "@@@@@@@!", status)) return answer;
  CTextWriter answer = StartRequest();
  for (const int field :
       {kStockCode, kFigure76, kFigure77, kFigureB8, kFigureB9, kFigureA0, kFigureA1}) {
    answer.Append(WIRE("%s@"), credit.Record().Text(field));
  }
  answer.Append(WIRE("%s!"), credit.Record().Text(kFigureA2));
  return answer.Text();
}
