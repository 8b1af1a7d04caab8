#include "gateway/orders/order_state.h"

#include "gateway/core/decimal.h"
#include "gateway/orders/messages.h"

namespace {

// What the gateway's text may say of an order that did not fail.
constexpr std::string_view kAllCancelled = "全部取消";
constexpr std::string_view kSentOn = "委託已傳送，等待接收回報！";

// The markets, plain and with the futures offset, whose users see a sent order as received.
bool ShowsReceipt(int32_t market) {
  return market == 3 || market == 103;
}

}  // namespace

// The first rule that holds decides.
std::string_view OrderStateText(const OrderState& order) {
  const bool immediate = order.timeInForce == 'F' || order.timeInForce == 'I';
  const int32_t done = WrapAdd(order.cancelled, order.filled);
  if (IsFailed(order.state)) return kFailedState;
  if (order.gatewayText == kAllCancelled) return kCancelledState;
  if (order.gatewayText == kSentOn) {
    return ShowsReceipt(order.market) ? kReceivedState : kProcessingState;
  }
  if (order.cancelled == order.quantity) return immediate ? kUnmatchedState : kCancelledState;
  if (order.filled == 0 && order.cancelled == 0) {
    return order.handlingFlag == "0" ? kReservedState : kAcceptedState;
  }
  if (order.filled == 0) return kReducedState;
  if (order.filled == order.quantity) return kFilledState;
  if (done != order.quantity) return kPartlyFilledState;
  return order.timeInForce == 'I' ? kPartlyMatchedState : kFilledCancelledState;
}
