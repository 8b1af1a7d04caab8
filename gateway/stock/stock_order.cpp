// The road that every stock order takes, and the brief order, which is a header and its trade type.
#include "gateway/stock/stock_order.h"

#include "gateway/stock/gateway_stk.h"

void OpenPayload(CTextWriter& line, const OrderKey& key) {
  if (key.head == OrderHead::kSigned) line.Append(WIRE("|PL=S"));
  line.Append(WIRE("!!"));
  key.AppendTo(line);
}

char* CGatewayStk::EncodeOrder(const OrderForm& form, const StockOrder& order, int* status) {
  *status = 1;
  CTextWriter line = StartRequest();
  const OrderKey key = KeyOf(form.head, form.function, order.origin);
  if (!WriteOrderHead(line, key)) {
    *status = -1;
    return line.Text();
  }
  const char* const fault = form.fault(order);
  if (fault != nullptr) return Fail(line, status, fault);
  form.write(line, order, key);
  return Finish(line, status, kBadParameters);
}

// The trade type follows whatever the header left, its message too.
char* CGatewayStk::SubmitOrderEncode2(const char* branch, const char* identity,
                                      const char* password, char function, char tradeType) {
  CTextWriter line = StartRequest();
  const OrderOrigin origin = {AsText(branch), AsText(identity), AsText(password), {}};
  WriteOrderHead(line, KeyOf(OrderHead::kBrief, function, origin));
  line.Append(WIRE("|28=%d"), StockOrder::NumberOf(tradeType));
  int unusedStatus = 1;
  return Finish(line, &unusedStatus, kBadParameters);
}
