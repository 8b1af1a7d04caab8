// The road that every stock order takes, and the brief order.
#include "gateway/stock/stock_order.h"

#include "gateway/stock/gateway_stk.h"

char* CGatewayStk::EncodeOrder(const OrderForm& form, const StockOrder& order, int* status) {
  *status = 1;
  CTextWriter line = StartRequest();
  char scratch[kBufferSize];
  CTextWriter key(scratch, sizeof scratch);
  const OrderHead head = form.payload == Payload::kBare ? OrderHead::kPlain : OrderHead::kSigned;
  const OrderOrigin origin = {form.function, order.branch, order.identity, order.password,
                              order.date};
  if (!WriteOrderHead(head, origin, line, key)) {
    *status = -1;
    return line.Text();
  }
  const char* const fault = form.fault(order);
  if (fault != nullptr) return Fail(line, status, fault);
  form.write(line, order, {scratch, key.Length()});
  return Finish(line, status, kBadParameters);
}

// The trade type follows whatever the header left, its message too.
char* CGatewayStk::SubmitOrderEncode2(const char* branch, const char* identity,
                                      const char* password, char function, char tradeType) {
  CTextWriter line = StartRequest();
  char scratch[1];
  CTextWriter unusedKey(scratch, sizeof scratch);
  const OrderOrigin origin = {function, branch, identity, password, nullptr};
  WriteOrderHead(OrderHead::kBrief, origin, line, unusedKey);
  line.Append(WIRE("|28=%d"), StockOrder::NumberOf(tradeType));
  int unusedStatus = 1;
  return Finish(line, &unusedStatus, kBadParameters);
}
