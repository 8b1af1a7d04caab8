// The settlement of a period: what an account pays and receives.
//
//   request  header |FUNC=6|H4=1|SDATE=period code|EDATE=|01=          a period of a selector
//            header |FUNC=6|H4=1|SDATE=first day|EDATE=last day|01=    dates as they were given
//   record   |50=date|27=kind|28=trade type|32=side|29=code|47=..|48=price|49=..|79=..|78=..|84=..
//            |81=..|82=..|85=..|87=..|86=..|89=..|88=..|96=sign|97=..|KT=type
//   result   count ! ( date @@ type @ 29 @ 47 @ price @ 49 @ 79 @ 78 @ 84 @ pair @ 86 @ 89 @ 88
//            @ sign @ 97 ! )*
//
// The brokerage JZG says the type itself, in KT; the other layout makes a type code of order kind,
// trade type and side. The pair is 81 @ 82, 85 @ 87 or 0 @ 0, by the kind or by KT.
#include <iterator>

#include "gateway/core/conversions.h"
#include "gateway/core/decimal.h"
#include "gateway/core/log.h"
#include "gateway/stock/gateway_stk.h"
#include "gateway/stock/messages.h"
#include "gateway/stock/order_type_codes.h"
#include "gateway/stock/stock_list.h"

namespace {

// The period codes of the selectors 1 to 6; the gateway knows no code 3.
constexpr const char* kPeriodCodes[] = {"1", "2", "4", "5", "6", "7"};

// The code of a period selector, or null when the text is none.
const char* PeriodCodeOf(const char* period) {
  const auto row = static_cast<uint32_t>(WrapSubtract(ReadInt32(AsText(period)), 1));
  return row < std::size(kPeriodCodes) ? kPeriodCodes[row] : nullptr;
}

// Of the fields that are named by their tags no more is known than where the result shows them.
enum Field {
  kDate50 = kOwnFields,
  kOrderKind,
  kTradeType,
  kSide,
  kStockCode,
  kQuantity47,
  kPrice48,
  kFigure49,
  kFigure79,
  kFigure78,
  kFigure84,
  kFigure81,
  kFigure82,
  kFigure85,
  kFigure87,
  kFigure86,
  kFigure89,
  kFigure88,
  kSign,
  kFigure97,
  kTypeText
};

constexpr TagRow kRows[] = {
    {kSequence, "67", 20},      {kResultCode, "68", 20},     {kMessage, "M2", kRecord},
    {kDate50, "50", kRecord},   {kOrderKind, "27", kRecord}, {kTradeType, "28", kRecord},
    {kSide, "32", kRecord},     {kStockCode, "29", kRecord}, {kQuantity47, "47", kRecord},
    {kPrice48, "48", kRecord},  {kFigure49, "49", kRecord},  {kFigure79, "79", kRecord},
    {kFigure78, "78", kRecord}, {kFigure84, "84", kRecord},  {kFigure81, "81", kRecord},
    {kFigure82, "82", kRecord}, {kFigure85, "85", kRecord},  {kFigure87, "87", kRecord},
    {kFigure86, "86", kRecord}, {kFigure89, "89", kRecord},  {kFigure88, "88", kRecord},
    {kSign, "96", kRecord},     {kFigure97, "97", kRecord},  {kTypeText, "KT", kRecord}};
constexpr CListTable kTags(kRows, kStockList);

// Kinds from 5 on, without regard to trade type and side: `code` is the first kind's, and the
// others follow in order.
struct KindRange {
  int first, last, code;
};

constexpr KindRange kKindRanges[] = {{5, 17, 19}, {20, 25, 32}, {26, 26, 39}};

int TypeCodeOf(const CRecord& record) {
  const int kind = record.Number(kOrderKind);
  for (const KindRange& range : kKindRanges) {
    if (kind >= range.first && kind <= range.last) return range.code + (kind - range.first);
  }
  return FindOrderType(kind, record.Number(kTradeType), record.Text(kSide) == "B", kOrderTypeRows);
}

// The two amounts that records of these kinds or types show.
struct PairRow {
  NumberSet selectors;
  int first, second;
};

void AppendPair(CResultText& list, const CRecord& record, const PairRow (&rows)[2], int selector) {
  for (const PairRow& row : rows) {
    if (!row.selectors.Has(selector)) continue;
    list.Append(WIRE("%s@%s@"), record.Text(row.first), record.Text(row.second));
    return;
  }
  list.AppendText("0@0@");
}

std::string_view TextOrZero(const CRecord& record, int field) {
  return record.Has(field) ? record.Text(field) : "0";
}

// What tells the two brokerages' replies apart.
struct PaymentLayout {
  bool hasTypeText;  // KT is the type, else a code is made
  int selector;      // the field that selects the pair
  PairRow pairs[2];
};

// False when the record's type has no code. Between date and type stands an empty field; a sign
// other than a minus is none.
bool AppendPayment(CResultText& list, const CRecord& record, const PaymentLayout& layout) {
  list.Append(WIRE("%s@@"), CTransDate(record.Text(kDate50)).Text());
  if (layout.hasTypeText) {
    list.AppendText(record.Text(kTypeText));
  } else {
    const int typeCode = TypeCodeOf(record);
    if (typeCode == kNoOrderType) return false;
    list.Append(WIRE("%d"), typeCode);
  }
  list.Append(WIRE("@%s@%s@%d@%s@%s@%s@%s@"), record.Text(kStockCode), record.Text(kQuantity47),
              ScalePrice(record.Text(kPrice48), 2), record.Text(kFigure49), record.Text(kFigure79),
              record.Text(kFigure78), record.Text(kFigure84));
  AppendPair(list, record, layout.pairs, record.Number(layout.selector));
  list.Append(WIRE("%s@%s@%s@%s@%s!"), TextOrZero(record, kFigure86), TextOrZero(record, kFigure89),
              TextOrZero(record, kFigure88), record.Text(kSign) == "-" ? "-" : "",
              record.Text(kFigure97));
  return true;
}

// Both layouts log under one name.
char* ListPayments(CGatewayStk& gateway, const char* reply, const PaymentLayout& layout,
                   int* status) {
  const std::string_view text = AsText(reply);
  LogReply("PaymentDecode", text);
  if (gateway.TransportFailed(text, status)) return gateway.m_szBuffer;
  CReplyList payments(text, kTags);
  if (char* const answer = gateway.AnswerWithoutData(payments, "0!", status)) return answer;
  CResultText list(gateway.DataText(), text.size());
  int count = 0;
  while (payments.NextData()) {
    const CRecord& record = payments.Record();
    if (!record.Has(kStockCode)) continue;
    if (!AppendPayment(list, record, layout)) return gateway.Fail(kOrderKindError, status);
    ++count;
  }
  return CGatewayStk::FinishList(list, count, status);
}

}  // namespace

char* CGatewayStk::PaymentEncode(const char* branch, const char* identity, const char* password,
                                 const char* periodOrStartDate, const char* endDate, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.AppendText("|FUNC=6|H4=1");
  if (const char* const code = PeriodCodeOf(periodOrStartDate)) {
    line.Append(WIRE("|SDATE=%s|EDATE="), code);
  } else {
    if (AsText(periodOrStartDate).empty() || AsText(endDate).empty())
      return Fail(line, status, kDateError);
    line.Append(WIRE("|SDATE=%s|EDATE=%s"), periodOrStartDate, endDate);
  }
  line.AppendText("|01=");
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayStk::PaymentDecode(const char* reply, int* status) {
  static constexpr PaymentLayout kLayout = {
      false,
      kOrderKind,
      {{SetOf(1, 3), kFigure81, kFigure82}, {SetOf(2, 4), kFigure85, kFigure87}}};
  return ListPayments(*this, reply, kLayout, status);
}

char* CGatewayStk::PaymentDecodeJZG(const char* reply, int* status) {
  static constexpr PaymentLayout kLayout = {
      true,
      kTypeText,
      {{SetOf(1, 12, 13), kFigure81, kFigure82}, {SetOf(2, 21, 22), kFigure85, kFigure87}}};
  return ListPayments(*this, reply, kLayout, status);
}
