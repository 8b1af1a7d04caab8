// The list of futures fills.
//
//   reply    68=code|M2=refusal ( |00=...|67=sequence|68=code|36=..|46=..|... |01= )*
//   result   count ! record*
//   record   36&46 @ legs @ TAIMEX&contract @ remaining&filled @ price&48 @ @ @ 22&51 @ MT
//            @ 44&50 !
#include "gateway/core/conversions.h"
#include "gateway/core/messages.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/futures/leg_code.h"
#include "gateway/futures/messages.h"
#include "gateway/futures/reply_code.h"

namespace {

// Where no smaller buffer is named for a field, the record is its bound.
constexpr size_t kAny = kFuturesRecordSize;
constexpr size_t kShort = 16;

constexpr int kPriceDecimals = 4;

enum Field {
  kReference = kOwnFields,
  kNumber,
  kPrice,
  kQuantity,
  kReduced,
  kFilled,
  kField22,
  kField50,
  kField51,
  kCommodity,
  kCommodity2,
  kMonth1,
  kMonth2,
  kCallPut1,
  kCallPut2,
  kStrike1,
  kStrike2,
  kSide1,
  kSide2,
  kField48,
  kW3,
  kMT,
  kDate
};

constexpr CTagTable kTags({{"67"}, {"68"}, {"M2"}, {"36"}, {"46"}, {"31"}, {"70"}, {"37"}, {"47"},
                           {"22"}, {"50"}, {"51"}, {"33"}, {"V9"}, {"29"}, {"W0"}, {"V8"}, {"W1"},
                           {"34"}, {"W2"}, {"32"}, {"EL"}, {"48"}, {"W3"}, {"MT"}, {"44"}});
static_assert(OpensListTable(kTags));

constexpr ListShape kShape = {kFuturesRecordSize, kAny, kReplyCodeSize, kRefusalSize, true};

int32_t Price(const CRecord& record, int field) {
  return ScalePrice(record.Text(field, kAny), kPriceDecimals);
}

// A leg whose side is neither buying nor selling has no code; an unusual W3 is taken as none.
void AppendLegCodes(CResultText& list, const CRecord& record) {
  const LegPair* const known = FindLegPair(record.Text(kW3, kAny));
  const LegPair& pair = known == nullptr ? kUsualLegPair : *known;
  const int first = SideOffset(record.Text(kSide1, kAny));
  if (first != kNoSide) list.Append(WIRE("%d"), pair.buying + first);
  if (!record.Has(kCommodity2)) return;
  const int second = SideOffset(record.Text(kSide2, kAny));
  if (second != kNoSide) list.Append(WIRE("|%d"), pair.buying + second);
}

// The product word differs from that of the order book and the positions. Pairs show one commodity.
void AppendContract(CResultText& list, const CRecord& record) {
  const std::string_view commodity = record.Text(kCommodity, kAny);
  const std::string_view month = record.Text(kMonth1, kAny);
  const std::string_view callPut = record.Text(kCallPut1, kAny);
  if (record.Has(kCommodity2)) {
    list.Append(WIRE("TAIMEX&X&%s&%s|%s&%s|%s&%ld|%ld"), commodity, month,
                record.Text(kMonth2, kAny), callPut, record.Text(kCallPut2, kAny),
                Price(record, kStrike1), Price(record, kStrike2));
  } else {
    list.Append(WIRE("TAIMEX&%s&%s&%s&%s&%ld"), IsBlank(callPut) ? "F" : "O", commodity, month,
                callPut, Price(record, kStrike1));
  }
}

void AppendFill(CResultText& list, const CRecord& record) {
  const int32_t quantity = record.Number(kQuantity, kAny);
  const int32_t remaining =
      quantity == 0 ? 0 : WrapSubtract(quantity, record.Number(kReduced, kAny));
  const std::string_view mt = record.Text(kMT, 8);
  list.Append(WIRE("%s&%s@"), record.Text(kReference, kShort), record.Text(kNumber, kShort));
  AppendLegCodes(list, record);
  list.AppendChar('@');
  AppendContract(list, record);
  list.Append(WIRE("@%d&%d@%ld&%ld@@@%s&%s@%c@%s&%s!"), remaining, record.Number(kFilled, kAny),
              Price(record, kPrice), Price(record, kField48), record.Text(kField22, kShort),
              FirstSix(record.Text(kField51, kAny)), mt.empty() ? ' ' : mt.front(),
              record.Text(kDate, kShort), record.Text(kField50, kShort));
}

}  // namespace

char* CGatewayFut::QueryReplyEncode(const char* branch, const char* identity, const char* password,
                                    const char* startDate, const char* endDate, int* status) {
  *status = 1;
  CTextWriter line = StartRequest();
  for (const char* const text : {branch, identity, password, startDate, endDate}) {
    if (AsText(text).empty()) return Fail(line, status, kBadParameters);
  }
  const int start = RocDateToStandardDate(startDate);
  const int end = RocDateToStandardDate(endDate);
  if (start == 0 || end == 0) return Fail(line, status, kBadDateRange);
  if (!StartQuery(line, branch, identity, password, status)) return line.Text();
  line.Append(WIRE("FUNC=x|FUNC1=1|SDATE=%d|EDATE=%d|01=\n"), start, end);
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayFut::QueryReplyDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (char* const answer = AnswerWithoutRecords(text, "0!", status)) return answer;

  CReplyList fills(text, kTags, kShape);
  CResultText list({m_pData, m_nDataSize, m_nDataLen}, text.size());
  int count = 0;
  for (; fills.NextData(); ++count) AppendFill(list, fills.Record());
  return FinishList(list, count, status);
}
