// The gateway's answers to stock orders (see orders/order_answer.h).
//
//   result   new order: number@date@@accepted!   cancellation, change: empty
#include "gateway/core/conversions.h"
#include "gateway/orders/messages.h"
#include "gateway/orders/order_answer.h"
#include "gateway/stock/gateway_stk.h"

namespace {

constexpr ReplyField kRefusalMark = {"39", 20};
constexpr ReplyField kGatewayText = {"K1", 200};
constexpr ReplyField kAcceptance = {"19", 20};

// Two values of this size fit the result.
constexpr ReplyField kGatewayNumber = {"46", 2000};
constexpr ReplyField kOrderDate = {"44", 2000};

// The letter with which the gateway took an order. NUL when it refused one, or sent no answer: then
// m_szBuffer tells it and the status is -1.
char LetterOf(CGatewayPub& gateway, std::string_view reply, int* status) {
  if (reply.empty()) {
    gateway.Fail(kOrderInTransit, status);
    return '\0';
  }
  if (gateway.TransportFailed(reply, status)) return '\0';
  const bool refused = ReadField(reply, kRefusalMark) != kNoRefusalMark;
  const char letter = refused ? '\0' : AcceptanceLetter(ReadField(reply, kAcceptance));
  if (letter == '\0') gateway.Fail(ReadField(reply, kGatewayText), status);
  return letter;
}

}  // namespace

char* CGatewayStk::SubmitOrderDecode(const char* reply, int* status) {
  const std::string_view text = AsText(reply);
  const char letter = LetterOf(*this, text, status);
  if (letter == '\0') return m_szBuffer;
  const CTransDate date(ReadField(text, kOrderDate));
  CTextWriter result = StartRequest();
  result.Append(WIRE("%s@%s@@%c!"), ReadField(text, kGatewayNumber), date.Text(),
                AcceptedFlag(letter));
  return result.Text();
}

char* CGatewayStk::CancelChangeOrderDecode(const char* reply, int* status) {
  return LetterOf(*this, AsText(reply), status) == '\0' ? m_szBuffer : Answer("");
}
