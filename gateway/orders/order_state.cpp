#include "gateway/orders/order_state.h"

#include "gateway/core/decimal.h"
#include "gateway/orders/messages.h"

namespace {

// What the gateway's text may say of an order that did not fail.
constexpr std::string_view kAllCancelled = "全部取消";
constexpr std::string_view kSentOn = "委託已傳送，等待接收回報！";

// The markets, plain and with the futures offset, whose users see a sent order as received.
constexpr bool ShowsReceipt(int32_t market) {
  return market == 3 || market == 103;
}

// What became of the quantity of an order.
bool IsCancelled(const OrderState& order) {
  return order.quantity == order.cancelled;
}
bool IsFilled(const OrderState& order) {
  return order.quantity == order.filled;
}
bool IsUntouched(const OrderState& order) {
  return order.filled == 0 && order.cancelled == 0;
}
bool IsFilledAndCancelled(const OrderState& order) {
  return order.quantity == WrapAdd(order.cancelled, order.filled);
}

struct StateRow {
  bool (*holds)(const OrderState& order);
  std::string_view text;
};

// The first row that holds decides.
constexpr StateRow kStates[] = {
    {[](const OrderState& o) { return IsFailed(o.state); }, kFailedState},
    {[](const OrderState& o) { return o.gatewayText == kAllCancelled; }, kCancelledState},
    {[](const OrderState& o) { return o.gatewayText == kSentOn && ShowsReceipt(o.market); },
     kReceivedState},
    {[](const OrderState& o) { return o.gatewayText == kSentOn; }, kProcessingState},
    {[](const OrderState& o) {
       return IsCancelled(o) && (o.timeInForce == 'F' || o.timeInForce == 'I');
     },
     kUnmatchedState},
    {[](const OrderState& o) { return IsCancelled(o); }, kCancelledState},
    {[](const OrderState& o) { return IsUntouched(o) && o.handlingFlag == "0"; }, kReservedState},
    {[](const OrderState& o) { return IsUntouched(o); }, kAcceptedState},
    {[](const OrderState& o) { return o.filled == 0; }, kReducedState},
    {[](const OrderState& o) { return IsFilled(o); }, kFilledState},
    {[](const OrderState& o) { return IsFilledAndCancelled(o) && o.timeInForce == 'I'; },
     kPartlyMatchedState},
    {[](const OrderState& o) { return IsFilledAndCancelled(o); }, kFilledCancelledState},
    {[](const OrderState&) { return true; }, kPartlyFilledState},
};

}  // namespace

std::string_view OrderStateText(const OrderState& state) {
  const StateRow* row = kStates;
  while (!row->holds(state)) ++row;
  return row->text;
}
