// Open positions, in a section of futures and one of options.
//
//   reply    68=code|M2=refusal ( |00=...|67=sequence|68=code|33=..|V9=..|... |01= )*
//   result   <5>!count! futures* <6>!count! options*
//   futures  32 @ TIMEX&F&33&month @ R8 @ 48 @ 50 @ currency !
//   spread   32|EL @ TIMEX&Y&33&month|month @ R8 @ 48|W5 @ 50 @ currency !
//   option   32 @ TIMEX&O&33&month&V8&strike @ R8 @ 48 @ 50 !
//   pair     32|EL @ TIMEX&X&33|V9&month|month&V8|W1&strike|strike @ R8 @ 48|W5 @ 50 !
#include "gateway/core/conversions.h"
#include "gateway/core/messages.h"
#include "gateway/futures/futures_list.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/futures/messages.h"

namespace {

// A section is never longer than twice its reply: the shortest record, 16 characters, gives 19, and
// a price at most one character more than its field, where it wraps.
constexpr size_t kSectionPerReply = 2;

// Of the fields that are named by their tags no more is known than where the result shows them.
enum Field {
  kCommodity1 = kOwnFields,
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
  kPriceW5,
  kQuantityR8,
  kDate50,
  kCurrency
};

constexpr TagRow kRows[] = {
    {kSequence, "67", kRecord},   {kResultCode, "68", 8},       {kMessage, "M2", kNotRead},
    {kCommodity1, "33", kRecord}, {kCommodity2, "V9", kRecord}, {kMonth1, "29", kRecord},
    {kMonth2, "W0", kRecord},     {kCallPut1, "V8", kRecord},   {kCallPut2, "W1", kRecord},
    {kStrike1, "34", kRecord},    {kStrike2, "W2", kRecord},    {kSide1, "32", kRecord},
    {kSide2, "EL", kRecord},      {kPrice48, "48", kRecord},    {kPriceW5, "W5", kRecord},
    {kQuantityR8, "R8", kRecord}, {kDate50, "50", kRecord},     {kCurrency, "28", kRecord}};
constexpr CListTable kTags(kRows, kFuturesList);

bool IsOption(const CRecord& record) {
  const std::string_view callPut = record.Text(kCallPut1);
  return callPut == "P" || callPut == "C";
}

const char* CurrencyName(const CRecord& record) {
  const std::string_view code = record.Text(kCurrency);
  switch (code.empty() ? '\0' : code.front()) {
    case '1':
      return "TWD";
    case '2':
      return "USD";
    case '4':
      return "RMB";
    default:
      return "";
  }
}

// Each month travels with "00" behind it.
void AppendFutures(CResultText& list, const CRecord& record) {
  if (record.Has(kCommodity2)) {
    list.Append(WIRE("%s|%s@TIMEX&Y&%s&%s00|%s00@%d@%ld|%ld@%s@%s!"), record.Text(kSide1),
                record.Text(kSide2), record.Text(kCommodity1), record.Text(kMonth1),
                record.Text(kMonth2), record.Number(kQuantityR8), PriceOf(record, kPrice48),
                PriceOf(record, kPriceW5), record.Text(kDate50), CurrencyName(record));
  } else {
    list.Append(WIRE("%s@TIMEX&F&%s&%s00@%d@%ld@%s@%s!"), record.Text(kSide1),
                record.Text(kCommodity1), record.Text(kMonth1), record.Number(kQuantityR8),
                PriceOf(record, kPrice48), record.Text(kDate50), CurrencyName(record));
  }
}

// Options show no currency. A pair without W5 shows that field empty.
void AppendOption(CResultText& list, const CRecord& record) {
  if (!record.Has(kCommodity2)) {
    list.Append(WIRE("%s@TIMEX&O&%s&%s00&%s&%ld@%d@%ld@%s!"), record.Text(kSide1),
                record.Text(kCommodity1), record.Text(kMonth1), record.Text(kCallPut1),
                PriceOf(record, kStrike1), record.Number(kQuantityR8), PriceOf(record, kPrice48),
                record.Text(kDate50));
    return;
  }
  list.Append(WIRE("%s|%s@TIMEX&X&%s|%s&%s00|%s00&%s|%s&%ld|%ld@%d@%ld|"), record.Text(kSide1),
              record.Text(kSide2), record.Text(kCommodity1), record.Text(kCommodity2),
              record.Text(kMonth1), record.Text(kMonth2), record.Text(kCallPut1),
              record.Text(kCallPut2), PriceOf(record, kStrike1), PriceOf(record, kStrike2),
              record.Number(kQuantityR8), PriceOf(record, kPrice48));
  if (record.Has(kPriceW5)) list.Append(WIRE("%ld"), PriceOf(record, kPriceW5));
  list.Append(WIRE("@%s!"), record.Text(kDate50));
}

}  // namespace

char* CGatewayFut::QueryInventoryEncode(const char* branch, const char* identity,
                                        const char* password, int* status) {
  for (const char* const text : {branch, identity, password}) {
    if (AsText(text).empty()) return Fail(kBadPositionQuery, status);
  }
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.AppendText("FUNC=O|01=");
  return Finish(line, status, kBadParameters);
}

// The sections grow side by side in the object's two texts.
char* CGatewayFut::QueryInventoryDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  if (char* const answer = AnswerWithoutRecords(text, "<5>!0!<6>!0!", status)) return answer;

  CReplyList positions(text, kTags);
  CResultText futures(FutText(), kSectionPerReply * text.size());
  CResultText options(OptText(), kSectionPerReply * text.size());
  int futuresCount = 0;
  int optionsCount = 0;
  while (positions.NextData()) {
    const CRecord& record = positions.Record();
    if (IsOption(record)) {
      AppendOption(options, record);
      ++optionsCount;
    } else {
      AppendFutures(futures, record);
      ++futuresCount;
    }
  }
  const std::string_view first = AsText(futures.Finish("<5>!", futuresCount));
  const std::string_view second = AsText(options.Finish("<6>!", optionsCount));
  if (first.empty() || second.empty()) {
    *status = -1;
    return nullptr;
  }
  char* const result = RenewResult(first.size() + second.size(), status);
  if (result == nullptr) return nullptr;
  memcpy(result, first.data(), first.size());
  memcpy(result + first.size(), second.data(), second.size());
  return result;
}
