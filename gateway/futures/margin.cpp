// The margin account.
//
//   reply    |00=...|LO=..|PN=..|RA=..|... |01=
//   result   1!TWD@ ( amount @ ){30} !
//
// The reply has no result code: whatever is not empty gives a record, of zeros where tags lack.
#include "gateway/core/conversions.h"
#include "gateway/core/messages.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/futures/messages.h"

namespace {

// Of the amounts no more is known than where the result shows them, two of them twice.
enum Field {
  kAmountLO,
  kAmountPN,
  kAmountRA,
  kAmountQY,
  kAmountQX,
  kAmountU5,
  kAmountU9,
  kAmountRF,
  kAmountF0,
  kAmountF1,
  kAmountF2,
  kAmountF3
};

constexpr TagRow kRows[] = {
    {kAmountLO, "LO", kUnbounded}, {kAmountPN, "PN", 512},        {kAmountRA, "RA", kUnbounded},
    {kAmountQY, "QY", kUnbounded}, {kAmountQX, "QX", kUnbounded}, {kAmountU5, "U5", kUnbounded},
    {kAmountU9, "U9", kUnbounded}, {kAmountRF, "RF", kUnbounded}, {kAmountF0, "F0", kUnbounded},
    {kAmountF1, "F1", kUnbounded}, {kAmountF2, "F2", kUnbounded}, {kAmountF3, "F3", kUnbounded}};
constexpr CTagTable kTags(kRows);

// A place of the record: an amount with its implied decimals, or none.
struct Place {
  int field = -1;
  int decimals = 4;
};

constexpr Place kNothing;

constexpr Place kLayout[] = {
    kNothing,    {kAmountLO, 2}, kNothing,    {kAmountPN}, {kAmountRA},  // 1 to 5
    {kAmountLO}, {kAmountQY},    kNothing,    {kAmountQX}, kNothing,     // 6 to 10
    {kAmountU5}, kNothing,       kNothing,    kNothing,    kNothing,     // 11 to 15
    {kAmountU9}, {kAmountU5},    kNothing,    kNothing,    kNothing,     // 16 to 20
    kNothing,    {kAmountRF},    kNothing,    kNothing,    kNothing,     // 21 to 25
    kNothing,    {kAmountF0},    {kAmountF1}, {kAmountF2}, {kAmountF3},  // 26 to 30
};
static_assert(sizeof kLayout / sizeof *kLayout == 30);

// PN may hold two amounts joined by '&', which the user interface reads itself.
void AppendPlace(CTextWriter& result, const CRecord& record, const Place& place) {
  if (place.field >= 0) {
    const std::string_view amount = record.Text(place.field);
    if (place.field == kAmountPN && amount.find('&') != std::string_view::npos) {
      result.AppendText(amount);
    } else {
      result.Append(WIRE("%ld"), ScaleAmount(amount, place.decimals));
    }
  }
  result.AppendChar('@');
}

// What the gateway calls the account view that the host asks for.
constexpr int QueryTypeOnWire(int queryType) {
  if (queryType == 0) return 3;
  return queryType == 3 || queryType == 4 ? 5 : queryType;
}

}  // namespace

char* CGatewayFut::QueryFinanceEncode(const char* branch, const char* identity,
                                      const char* password, int queryType, int* status) {
  CTextWriter line = StartQuery(branch, identity, password, status);
  if (*status != 1) return line.Text();
  line.Append(WIRE("FUNC=P|28=%d|01="), QueryTypeOnWire(queryType));
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayFut::QueryFinanceDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (text.empty()) return Fail(kNoReply, status);
  CRecord record(kTags);
  CRecordWalker walker(text, kUnbounded);
  walker.Next(record);
  CTextWriter result(m_szBuffer, sizeof m_szBuffer);
  result.AppendText("1!TWD@");
  for (const Place& place : kLayout) AppendPlace(result, record, place);
  result.AppendChar('!');
  return result.Text();
}
