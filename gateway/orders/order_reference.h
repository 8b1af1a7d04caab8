// What names an order that is to be changed or cancelled.
#ifndef QUORVANE_GATEWAY_ORDERS_ORDER_REFERENCE_H_
#define QUORVANE_GATEWAY_ORDERS_ORDER_REFERENCE_H_

#include "gateway/core/protocol.h"
#include "gateway/core/reply_reader.h"

// The host's two numbers, joined by '&'; what follows a second '&' is not read, and a number that
// does not fit `bound` is dropped.
struct OrderReference {
  OrderReference(std::string_view text, size_t bound)
      : orderNumber(Bounded(TakePiece(text, '&'), bound)),
        gatewayNumber(Bounded(TakePiece(text, '&'), bound)) {}

  std::string_view orderNumber;    // tag 36
  std::string_view gatewayNumber;  // tag 46
};

#endif  // QUORVANE_GATEWAY_ORDERS_ORDER_REFERENCE_H_
