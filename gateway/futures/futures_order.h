// An order on futures or options, with its wide argument list named.
#ifndef QUORVANE_GATEWAY_FUTURES_FUTURES_ORDER_H_
#define QUORVANE_GATEWAY_FUTURES_FUTURES_ORDER_H_

#include <cstdint>

#include "gateway/core/wire_text.h"

// Order kinds; the host may send any other byte, which is no order.
enum class OrderKind : uint8_t { kFutures = 1, kOption = 2, kCombination = 3, kSpread = 4 };

// One contract of an order. Texts may be null, which reads as empty.
struct Leg {
  char side;
  const char* commodity;
  const char* month;
  const char* strike;
  const char* callPut;

  bool NamesContract() const { return !AsText(commodity).empty() && !AsText(month).empty(); }
  bool NamesOption() const {
    return NamesContract() && !AsText(strike).empty() && !AsText(callPut).empty();
  }
};

// The host's three byte numbers are unsigned: -1 is 255.
struct FuturesOrder {
  const char* orderReference;
  Leg first;
  Leg second;
  uint8_t handlingFlag;
  OrderKind kind;
  uint8_t priceType;
  char function;
  char flagW3;
  char timeInForce;
  int32_t quantity;
  int32_t price;

  bool IsNew() const { return function == 'I'; }
  bool HasTwoLegs() const { return kind == OrderKind::kCombination || kind == OrderKind::kSpread; }
  bool IsAtMarket() const { return priceType == 1 || priceType == 3; }
};

#endif  // QUORVANE_GATEWAY_FUTURES_FUTURES_ORDER_H_
