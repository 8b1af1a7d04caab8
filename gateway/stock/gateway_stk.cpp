#include "gateway/stock/gateway_stk.h"

#include "gateway/core/log.h"

CGatewayStk::~CGatewayStk() {
  ::debuglog("~CGatewayStk");
}
