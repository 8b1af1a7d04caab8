// The brief order, which is a header and its trade type.
#include "gateway/stock/stock_order.h"

#include "gateway/stock/gateway_stk.h"

// The trade type follows whatever the header left, its message too.
char* CGatewayStk::SubmitOrderEncode2(const char* branch, const char* identity,
                                      const char* password, char function, char tradeType) {
  CTextWriter line = StartRequest();
  const OrderOrigin origin = {AsText(branch), AsText(identity), AsText(password), {}};
  KeyStore store;
  WriteOrderHead(line, OrderKey(*this, OrderHead::kBrief, function, origin, store));
  line.Append(WIRE("|28=%d"), StockOrder::NumberOf(tradeType));
  int unusedStatus = 1;
  return Finish(line, &unusedStatus, kBadParameters);
}
