// What an order book tells of an order's state: the gateway does not send it.
#ifndef QUORVANE_GATEWAY_ORDERS_ORDER_STATE_H_
#define QUORVANE_GATEWAY_ORDERS_ORDER_STATE_H_

#include <cstdint>
#include <string_view>

// What the decision rests on.
struct OrderState {
  int32_t quantity;               // ordered
  int32_t cancelled;              // by reductions and cancels
  int32_t filled;                 // so far
  char timeInForce;               // 'R', 'I', 'F', or 0 while none is known and for stocks
  std::string_view state;         // "E" for an order that failed
  std::string_view handlingFlag;  // "0" for a reservation
  std::string_view gatewayText;   // of a futures order only when it failed, so none is "sent on"
  int32_t market;                 // of the session
};

// Whether the gateway says that an order failed.
inline bool IsFailed(std::string_view state) {
  return state == "E";
}

// The text of the state, for the user.
std::string_view OrderStateText(const OrderState& order);

// How a list shows tag JV: Y, N, and N for an order with a message where there is neither.
inline const char* ChangeFlag(std::string_view changeable, bool hasMessage) {
  if (changeable == "Y") return "1";
  return changeable == "N" || hasMessage ? "2" : "";
}

#endif  // QUORVANE_GATEWAY_ORDERS_ORDER_STATE_H_
