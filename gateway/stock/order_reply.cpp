// The gateway's answers to orders: one line of fields, no records.
//
//   reply    |39=state|K1=text|19=outcome|46=number|44=date
//   result   new order: number@date@@accepted!   cancellation, change: empty
//
// An order went through when 39 is a single blank and 19 begins with one of S, T, X, Y; else the
// text K1 says why not.
#include "gateway/core/conversions.h"
#include "gateway/core/messages.h"
#include "gateway/stock/gateway_stk.h"

namespace {

// Two values of this size fit the answer.
constexpr size_t kAnswerFieldSize = 2000;

std::string_view Read(std::string_view reply, std::string_view tag, size_t bound) {
  return Bounded(FindField(reply, tag, Blanks::kTaken), bound);
}

// The outcome when the gateway took the order, or NUL.
char OutcomeOf(std::string_view reply) {
  if (Read(reply, "39", 20) != " ") return '\0';
  const std::string_view outcome = Read(reply, "19", 20);
  if (outcome.empty() || memchr("STXY", outcome.front(), 4) == nullptr) return '\0';
  return outcome.front();
}

}  // namespace

bool CGatewayStk::OrderRefused(std::string_view reply, char& outcome, int* status) {
  *status = 1;
  if (reply.empty()) {
    Fail(kOrderInTransit, status);
    return true;
  }
  if (TransportFailed(reply, status)) return true;
  outcome = OutcomeOf(reply);
  if (outcome != '\0') return false;
  Fail(Read(reply, "K1", 200), status);
  return true;
}

char* CGatewayStk::SubmitOrderDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  char outcome;
  if (OrderRefused(text, outcome, status)) return m_szBuffer;
  const CTransDate date(Read(text, "44", kAnswerFieldSize));
  CTextWriter answer(m_szBuffer, sizeof m_szBuffer);
  answer.Append(WIRE("%s@%s@@%s!"), Read(text, "46", kAnswerFieldSize), date.Text(),
                outcome == 'X' ? "0" : "1");
  return answer.Text();
}

char* CGatewayStk::CancelChangeOrderDecode(const char* reply, int* status) {
  char outcome;
  if (OrderRefused(AsText(reply), outcome, status)) return m_szBuffer;
  return Answer("");
}
