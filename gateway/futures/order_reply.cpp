// The gateway's answer to a futures or options order (see orders/order_answer.h).
//
//   reply    further |MT=flag
//   result   46 @ date @ @ accepted @ flag @ !
#include "gateway/core/conversions.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/orders/messages.h"
#include "gateway/orders/order_answer.h"

namespace {

constexpr ReplyField kRefusalMark = {"39", 256};
constexpr ReplyField kAcceptance = {"19", 128};
constexpr ReplyField kGatewayNumber = {"46", 128};
constexpr ReplyField kOrderDate = {"44", 16};
constexpr ReplyField kFlagMT = {"MT", CGatewayPub::kBufferSize};

// The mark and the letter refuse alike, but for the blanks before the text.
constexpr ReplyField kTextOfMark = {"K1", 128, Blanks::kSkipped};
constexpr ReplyField kTextOfLetter = {"K1", 128};

// What follows the accepted flag, by the first character of tag MT.
const char* FlagEnding(std::string_view flag) {
  if (flag.empty()) return "@@!";
  return flag.front() == '0' ? "@0@!" : flag.front() == '1' ? "@1@!" : "@@!";
}

}  // namespace

// An empty reply is told from a failed transport first: the order is under way.
char* CGatewayFut::SubmitOrderDecode(const char* reply, int* status) {
  *status = 1;
  const std::string_view text = AsText(reply);
  if (text.empty()) return Answer(kOrderInTransit);
  if (TransportFailed(text, status)) return m_szBuffer;
  if (ReadField(text, kRefusalMark) != kNoRefusalMark) {
    return Fail(ReadField(text, kTextOfMark), status);
  }
  const char letter = AcceptanceLetter(ReadField(text, kAcceptance));
  if (letter == '\0') return Fail(ReadField(text, kTextOfLetter), status);
  const CTransDate date(ReadField(text, kOrderDate));
  CTextWriter result = StartRequest();
  result.Append(WIRE("%s@%s@@%c%s"), ReadField(text, kGatewayNumber), date.Text(),
                AcceptedFlag(letter), FlagEnding(ReadField(text, kFlagMT)));
  return result.Text();
}
