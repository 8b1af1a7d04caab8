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
  kFigureLO,
  kFigurePN,
  kFigureRA,
  kFigureQY,
  kFigureQX,
  kFigureU5,
  kFigureU9,
  kFigureRF,
  kFigureF0,
  kFigureF1,
  kFigureF2,
  kFigureF3
};

constexpr TagRow kRows[] = {
    {kFigureLO, "LO", kUnbounded}, {kFigurePN, "PN", 512},        {kFigureRA, "RA", kUnbounded},
    {kFigureQY, "QY", kUnbounded}, {kFigureQX, "QX", kUnbounded}, {kFigureU5, "U5", kUnbounded},
    {kFigureU9, "U9", kUnbounded}, {kFigureRF, "RF", kUnbounded}, {kFigureF0, "F0", kUnbounded},
    {kFigureF1, "F1", kUnbounded}, {kFigureF2, "F2", kUnbounded}, {kFigureF3, "F3", kUnbounded}};
constexpr CTagTable kTags(kRows);

// A place of the record: an amount with its implied decimals, or none.
struct Place {
  int field = -1;
  int decimals = 4;
};

constexpr Place kNothing;

constexpr Place kLayout[] = {
    kNothing,    {kFigureLO, 2}, kNothing,    {kFigurePN}, {kFigureRA},  // 1 to 5
    {kFigureLO}, {kFigureQY},    kNothing,    {kFigureQX}, kNothing,     // 6 to 10
    {kFigureU5}, kNothing,       kNothing,    kNothing,    kNothing,     // 11 to 15
    {kFigureU9}, {kFigureU5},    kNothing,    kNothing,    kNothing,     // 16 to 20
    kNothing,    {kFigureRF},    kNothing,    kNothing,    kNothing,     // 21 to 25
    kNothing,    {kFigureF0},    {kFigureF1}, {kFigureF2}, {kFigureF3},  // 26 to 30
};
static_assert(sizeof kLayout / sizeof *kLayout == 30);

// PN may hold two amounts joined by '&', which the user interface reads itself.
void AppendPlace(CTextWriter& result, const CRecord& record, const Place& place) {
  if (place.field >= 0) {
    const std::string_view amount = record.Text(place.field);
    if (place.field == kFigurePN && amount.find('&') != std::string_view::npos) {
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
  CTextWriter result = StartRequest();
  result.AppendText("1!TWD@");
  for (const Place& place : kLayout) AppendPlace(result, record, place);
  result.AppendChar('!');
  return result.Text();
}
