// The list of futures fills.
//
//   reply    68=code|M2=refusal ( |00=...|67=sequence|68=code|36=..|46=..|... |01= )*
//   result   count ! record*
//   record   36&46 @ legs @ TAIMEX&contract @ remaining&filled @ price&48 @ @ @ 22&51 @ MT
//            @ 44&50 !
#include "gateway/core/conversions.h"
#include "gateway/core/messages.h"
#include "gateway/futures/futures_list.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/futures/leg_code.h"
#include "gateway/futures/messages.h"

namespace {

// Of the fields that are named by their tags no more is known than where the result shows them.
enum Field {
  kOrderNumber = kOwnFields,
  kGatewayNumber,
  kPrice,
  kOrderedQuantity,
  kReduced37,
  kFilledQuantity,
  kEntryTime,
  kDate50,
  kTime51,
  kCommodity1,
  kCommodity2,
  kMonth1,
  kMonth2,
  kCallPut1,
  kCallPut2,
  kStrike1,
  kStrike2,
  kSide1,
  kSide2,
  kPrice48,
  kFlagW3,
  kFlagMT,
  kOrderDate
};

constexpr TagRow kRows[] = {{kSequence, "67", kRecord},
                            {kResultCode, "68", 8},
                            {kMessage, "M2", kNotRead},
                            {kOrderNumber, "36", 16},
                            {kGatewayNumber, "46", 16},
                            {kPrice, "31", kRecord},
                            {kOrderedQuantity, "70", kRecord},
                            {kReduced37, "37", kRecord},
                            {kFilledQuantity, "47", kRecord},
                            {kEntryTime, "22", 16},
                            {kDate50, "50", 16},
                            {kTime51, "51", kRecord},
                            {kCommodity1, "33", kRecord},
                            {kCommodity2, "V9", kRecord},
                            {kMonth1, "29", kRecord},
                            {kMonth2, "W0", kRecord},
                            {kCallPut1, "V8", kRecord},
                            {kCallPut2, "W1", kRecord},
                            {kStrike1, "34", kRecord},
                            {kStrike2, "W2", kRecord},
                            {kSide1, "32", kRecord},
                            {kSide2, "EL", kRecord},
                            {kPrice48, "48", kRecord},
                            {kFlagW3, "W3", kRecord},
                            {kFlagMT, "MT", 8},
                            {kOrderDate, "44", 16}};
constexpr CListTable kTags(kRows, kFuturesList);

// A leg whose side is neither buying nor selling has no code; an unusual W3 is taken as none.
void AppendLegCodes(CResultText& list, const CRecord& record) {
  const LegPair* const known = FindLegPair(record.Text(kFlagW3));
  const LegPair& pair = known == nullptr ? kUsualLegPair : *known;
  const int first = SideOffset(record.Text(kSide1));
  if (first != kNoSide) list.Append(WIRE("%d"), pair.buying + first);
  if (!record.Has(kCommodity2)) return;
  const int second = SideOffset(record.Text(kSide2));
  if (second != kNoSide) list.Append(WIRE("|%d"), pair.buying + second);
}

// The product word differs from that of the order book and the positions. Pairs show one commodity.
void AppendContract(CResultText& list, const CRecord& record) {
  const std::string_view commodity = record.Text(kCommodity1);
  const std::string_view month = record.Text(kMonth1);
  const std::string_view callPut = record.Text(kCallPut1);
  if (record.Has(kCommodity2)) {
    list.Append(WIRE("TAIMEX&X&%s&%s|%s&%s|%s&%ld|%ld"), commodity, month, record.Text(kMonth2),
                callPut, record.Text(kCallPut2), PriceOf(record, kStrike1),
                PriceOf(record, kStrike2));
  } else {
    list.Append(WIRE("TAIMEX&%s&%s&%s&%s&%ld"), IsBlank(callPut) ? "F" : "O", commodity, month,
                callPut, PriceOf(record, kStrike1));
  }
}

void AppendFill(CResultText& list, const CRecord& record) {
  const int32_t quantity = record.Number(kOrderedQuantity);
  const int32_t remaining = quantity == 0 ? 0 : WrapSubtract(quantity, record.Number(kReduced37));
  const std::string_view mt = record.Text(kFlagMT);
  list.Append(WIRE("%s&%s@"), record.Text(kOrderNumber), record.Text(kGatewayNumber));
  AppendLegCodes(list, record);
  list.AppendChar('@');
  AppendContract(list, record);
  list.Append(WIRE("@%d&%d@%ld&%ld@@@%s&%s@%c@%s&%s!"), remaining, record.Number(kFilledQuantity),
              PriceOf(record, kPrice), PriceOf(record, kPrice48), record.Text(kEntryTime),
              FirstSix(record.Text(kTime51)), mt.empty() ? ' ' : mt.front(),
              record.Text(kOrderDate), record.Text(kDate50));
}

}  // namespace

char* CGatewayFut::QueryReplyEncode(const char* branch, const char* identity, const char* password,
                                    const char* startDate, const char* endDate, int* status) {
  for (const char* const text : {branch, identity, password, startDate, endDate}) {
    if (AsText(text).empty()) return Fail(kBadParameters, status);
  }
  const int start = RocToWesternDate(AsText(startDate));
  const int end = RocToWesternDate(AsText(endDate));
  if (start == 0 || end == 0) return Fail(kBadDateRange, status);
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("FUNC=x|FUNC1=1|SDATE=%d|EDATE=%d|01=\n"), start, end);
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayFut::QueryReplyDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  if (char* const answer = AnswerWithoutRecords(text, "0!", status)) return answer;

  CReplyList fills(text, kTags);
  CResultText list(DataText(), text.size());
  int count = 0;
  for (; fills.NextData(); ++count) AppendFill(list, fills.Record());
  return FinishList(list, count, status);
}
