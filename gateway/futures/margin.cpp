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

constexpr size_t kAny = SIZE_MAX;  // no bound is named for the record nor for its amounts
constexpr size_t kPNSize = 512;

enum Field { kLO, kPN, kRA, kQY, kQX, kU5, kU9, kRF, kF0, kF1, kF2, kF3 };

constexpr CTagTable kTags({{"LO"},
                           {"PN"},
                           {"RA"},
                           {"QY"},
                           {"QX"},
                           {"U5"},
                           {"U9"},
                           {"RF"},
                           {"F0"},
                           {"F1"},
                           {"F2"},
                           {"F3"}});

// A place of the record: an amount with its implied decimals, or none.
struct Place {
  int field = -1;
  int decimals = 4;
};

constexpr Place kNothing;

constexpr Place kLayout[] = {
    kNothing, {kLO, 2}, kNothing, {kPN},    {kRA},     // 1 to 5
    {kLO},    {kQY},    kNothing, {kQX},    kNothing,  // 6 to 10
    {kU5},    kNothing, kNothing, kNothing, kNothing,  // 11 to 15
    {kU9},    {kU5},    kNothing, kNothing, kNothing,  // 16 to 20
    kNothing, {kRF},    kNothing, kNothing, kNothing,  // 21 to 25
    kNothing, {kF0},    {kF1},    {kF2},    {kF3},     // 26 to 30
};
static_assert(sizeof kLayout / sizeof *kLayout == 30);

// PN may hold two amounts joined by '&', which the user interface reads itself.
void AppendPlace(CTextWriter& result, const CRecord& record, const Place& place) {
  if (place.field >= 0) {
    const std::string_view amount = record.Text(place.field, place.field == kPN ? kPNSize : kAny);
    if (place.field == kPN && amount.find('&') != std::string_view::npos) {
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
  *status = 1;
  CTextWriter line = StartRequest();
  if (!StartQuery(line, branch, identity, password, status)) return line.Text();
  line.Append(WIRE("FUNC=P|28=%d|01="), QueryTypeOnWire(queryType));
  return FinishEscaped(line, status, kBadParameters);
}

char* CGatewayFut::QueryFinanceDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (text.empty()) return Fail(kNoReply, status);
  CRecord record(kTags);
  CRecordWalker walker(text, kAny);
  walker.Next(record);
  CTextWriter result(m_szBuffer, sizeof m_szBuffer);
  result.AppendText("1!TWD@");
  for (const Place& place : kLayout) AppendPlace(result, record, place);
  result.AppendChar('!');
  return result.Text();
}
