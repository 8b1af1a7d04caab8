// The fills of a period.
//
//   record   |36=reference|27=kind|28=trade type|32=side|29=code|47=filled|48=price|49=number
//            |50=date|51=time
//   result   count ! ( 36 @ type code @ 29 @ filled @ price @ 49 @ date @ time ! )*
//
// A record without a filled quantity is no fill; a fill whose type has no code fails the whole
// list.
#include "gateway/core/conversions.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/messages.h"
#include "gateway/stock/order_type_codes.h"
#include "gateway/stock/stock_list.h"

namespace {

// Of the fields that are named by their tags no more is known than what the result shows.
enum Field {
  kOrderNumber = kOwnFields,
  kOrderKind,
  kTradeType,
  kSide,
  kStockCode,
  kFilledQuantity,
  kFillPrice,
  kNumber49,
  kDate50,
  kTime51
};

constexpr TagRow kRows[] = {
    {kSequence, "67", 20},    {kResultCode, "68", 20}, {kMessage, "M2", kRecord},
    {kOrderNumber, "36", 50}, {kOrderKind, "27", 50},  {kTradeType, "28", 50},
    {kSide, "32", 50},        {kStockCode, "29", 50},  {kFilledQuantity, "47", 50},
    {kFillPrice, "48", 50},   {kNumber49, "49", 50},   {kDate50, "50", 50},
    {kTime51, "51", 50}};
constexpr CListTable kTags(kRows, kStockList);

int TypeCodeOf(const CRecord& record) {
  return FindOrderType(record.Number(kOrderKind), record.Number(kTradeType),
                       record.Text(kSide) == "B", kOrderTypeRows, kLiveOrderTypeRows);
}

void AppendFill(CResultText& list, const CRecord& record, int typeCode) {
  list.Append(WIRE("%s@%d@%s@%d@%d@%d@%s@%s!"), record.Text(kOrderNumber), typeCode,
              record.Text(kStockCode), record.Number(kFilledQuantity),
              ScalePrice(record.Text(kFillPrice), 2), record.Number(kNumber49),
              CTransDate(record.Text(kDate50)).Text(), FirstSix(record.Text(kTime51)));
}

}  // namespace

char* CGatewayStk::QueryReplyEncode(const char* branch, const char* identity, const char* password,
                                    const char* startDate, const char* endDate, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  const CTransDate start(AsText(startDate));
  const CTransDate end(AsText(endDate));
  if (start.Text().empty() || end.Text().empty()) return Fail(line, status, kDateError);
  line.Append(WIRE("|FUNC=3|57=2|SDATE=%s|EDATE=%s|01=\n"), start.Text(), end.Text());
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayStk::QueryReplyDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  if (TransportFailed(text, status)) return m_szBuffer;
  CReplyList fills(text, kTags);
  if (char* const answer = AnswerWithoutData(fills, "0!", status)) return answer;
  CResultText list(DataText(), text.size());
  int count = 0;
  while (fills.NextData()) {
    const CRecord& record = fills.Record();
    if (record.Number(kFilledQuantity) == 0) continue;
    const int typeCode = TypeCodeOf(record);
    if (typeCode == kNoOrderType) return Fail(kOrderKindError, status);
    AppendFill(list, record, typeCode);
    ++count;
  }
  return FinishList(list, count, status);
}
