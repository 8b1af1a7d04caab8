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

enum Field {
  kReference = kOwnFields,
  kKind,
  kTradeType,
  kSide,
  kStockCode,
  kFilled,
  kPrice,
  kField49,
  kDate,
  kTime
};

constexpr CTagTable kTags({{"67"},
                           {"68"},
                           {"M2"},
                           {"36"},
                           {"27"},
                           {"28"},
                           {"32"},
                           {"29"},
                           {"47"},
                           {"48"},
                           {"49"},
                           {"50"},
                           {"51"}});
static_assert(OpensListTable(kTags), "the list frame reads its rows");

constexpr COrderTypes kOrderTypes(kOrderTypeRows, kLiveOrderTypeRows);

int TypeCodeOf(const CRecord& record) {
  return kOrderTypes.Find(record.Number(kKind, kFieldSize), record.Number(kTradeType, kFieldSize),
                          record.Text(kSide, kFieldSize) == "B");
}

void AppendFill(CResultText& list, const CRecord& record, int typeCode) {
  list.Append(WIRE("%s@%d@%s@%d@%d@%d@%s@%s!"), record.Text(kReference, kFieldSize), typeCode,
              record.Text(kStockCode, kFieldSize), record.Number(kFilled, kFieldSize),
              ScalePrice(record.Text(kPrice, kFieldSize), 2), record.Number(kField49, kFieldSize),
              CTransDate(record.Text(kDate, kFieldSize)).Text(),
              FirstSix(record.Text(kTime, kFieldSize)));
}

}  // namespace

char* CGatewayStk::QueryReplyEncode(const char* branch, const char* identity, const char* password,
                                    const char* startDate, const char* endDate, int* status) {
  *status = 1;
  CTextWriter line = StartRequest();
  if (!WriteQueryHead(line, branch, identity, password)) {
    *status = -1;
    return line.Text();
  }
  const CTransDate start(AsText(startDate));
  const CTransDate end(AsText(endDate));
  if (start.Text().empty() || end.Text().empty()) return Fail(line, status, kDateError);
  line.Append(WIRE("|FUNC=3|57=2|SDATE=%s|EDATE=%s|01=\n"), start.Text(), end.Text());
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayStk::QueryReplyDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (TransportFailed(text, status)) return m_szBuffer;
  CReplyList fills(text, kTags, kStockListShape);
  if (char* const answer = AnswerWithoutData(fills, "0!", status)) return answer;
  CResultText list({m_pData, m_nDataSize, m_nDataLen}, text.size());
  int count = 0;
  while (fills.NextData()) {
    const CRecord& record = fills.Record();
    if (record.Number(kFilled, kFieldSize) == 0) continue;
    const int typeCode = TypeCodeOf(record);
    if (typeCode == kNoOrderType) return Fail(kOrderKindError, status);
    AppendFill(list, record, typeCode);
    ++count;
  }
  return FinishList(list, count, status);
}
