// What the order book tells of an order's state: the gateway does not send it.
#ifndef QUORVANE_GATEWAY_FUTURES_ORDER_STATE_H_
#define QUORVANE_GATEWAY_FUTURES_ORDER_STATE_H_

#include <cstdint>
#include <string_view>

// What the decision rests on.
struct OrderState {
  int32_t quantity;          // ordered
  int32_t cancelled;         // by reductions and cancels
  int32_t filled;            // so far
  char timeInForce;          // 'R', 'I', 'F', or 0 while none is known
  std::string_view failure;  // "E" for an order that failed
  std::string_view n6;       // "0" for an order that waits for the market to open
  std::string_view message;  // of a failed order; the gateway sends none for the others
  int32_t market;            // of the session
};

// The text of the state, for the user.
std::string_view OrderStateText(const OrderState& state);

#endif  // QUORVANE_GATEWAY_FUTURES_ORDER_STATE_H_
