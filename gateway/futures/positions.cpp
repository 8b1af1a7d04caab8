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
#include "gateway/futures/gateway_fut.h"
#include "gateway/futures/messages.h"
#include "gateway/futures/reply_code.h"

namespace {

constexpr int kPriceDecimals = 4;

// A section is never longer than twice its reply: the shortest record, 16 characters, gives 19, and
// a price gives less than its field.
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

// One record with its values read.
struct Position {
  explicit Position(const CRecord& record)
      : commodity1(record.Text(kCommodity1)),
        commodity2(record.Text(kCommodity2)),
        month1(record.Text(kMonth1)),
        month2(record.Text(kMonth2)),
        callPut1(record.Text(kCallPut1)),
        callPut2(record.Text(kCallPut2)),
        side1(record.Text(kSide1)),
        side2(record.Text(kSide2)),
        w5(record.Text(kPriceW5)),
        date50(record.Text(kDate50)),
        currency(record.Text(kCurrency)),
        strike1(ScalePrice(record.Text(kStrike1), kPriceDecimals)),
        strike2(ScalePrice(record.Text(kStrike2), kPriceDecimals)),
        price48(ScalePrice(record.Text(kPrice48), kPriceDecimals)),
        priceW5(ScalePrice(w5, kPriceDecimals)),
        quantityR8(record.Number(kQuantityR8)) {}

  bool IsOption() const { return callPut1 == "P" || callPut1 == "C"; }
  bool HasTwoLegs() const { return !commodity2.empty(); }

  std::string_view commodity1, commodity2, month1, month2, callPut1, callPut2, side1, side2, w5,
      date50, currency;
  int32_t strike1, strike2, price48, priceW5, quantityR8;
};

const char* CurrencyName(std::string_view code) {
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
void AppendFutures(CResultText& list, const Position& position) {
  const char* const currency = CurrencyName(position.currency);
  if (position.HasTwoLegs()) {
    list.Append(WIRE("%s|%s@TIMEX&Y&%s&%s00|%s00@%d@%ld|%ld@%s@%s!"), position.side1,
                position.side2, position.commodity1, position.month1, position.month2,
                position.quantityR8, position.price48, position.priceW5, position.date50, currency);
  } else {
    list.Append(WIRE("%s@TIMEX&F&%s&%s00@%d@%ld@%s@%s!"), position.side1, position.commodity1,
                position.month1, position.quantityR8, position.price48, position.date50, currency);
  }
}

// Options show no currency. A pair without W5 shows that field empty.
void AppendOption(CResultText& list, const Position& position) {
  if (!position.HasTwoLegs()) {
    list.Append(WIRE("%s@TIMEX&O&%s&%s00&%s&%ld@%d@%ld@%s!"), position.side1, position.commodity1,
                position.month1, position.callPut1, position.strike1, position.quantityR8,
                position.price48, position.date50);
    return;
  }
  list.Append(WIRE("%s|%s@TIMEX&X&%s|%s&%s00|%s00&%s|%s&%ld|%ld@%d@%ld|"), position.side1,
              position.side2, position.commodity1, position.commodity2, position.month1,
              position.month2, position.callPut1, position.callPut2, position.strike1,
              position.strike2, position.quantityR8, position.price48);
  if (!position.w5.empty()) list.Append(WIRE("%ld"), position.priceW5);
  list.Append(WIRE("@%s!"), position.date50);
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
    const Position position(positions.Record());
    if (position.IsOption()) {
      AppendOption(options, position);
      ++optionsCount;
    } else {
      AppendFutures(futures, position);
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
