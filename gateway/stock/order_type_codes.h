// The codes that name an order's type to the user interface: made of order kind, trade type and
// side.
#ifndef QUORVANE_GATEWAY_STOCK_ORDER_TYPE_CODES_H_
#define QUORVANE_GATEWAY_STOCK_ORDER_TYPE_CODES_H_

#include <cstddef>

#include "gateway/core/number_set.h"

// A row names the orders of these kinds and trade types: `buy` when the side is exactly "B".
struct OrderTypeRow {
  NumberSet kinds;
  NumberSet tradeTypes;
  int buy;
  int other;
};

inline constexpr int kNoOrderType = 0;

// Kinds 0 to 4, alike in the order book, the fills and the settlement. From kind 5 on the
// settlement goes by numbers of its own.
inline constexpr OrderTypeRow kOrderTypeRows[] = {
    {SetOf(0), SetOf(0, 1), 1, 2},   {SetOf(0), SetOf(2), 7, 8},
    {SetOf(0), SetOf(3), 9, 10},     {SetOf(1, 3), SetOf(0, 1), 3, 4},
    {SetOf(1, 3), SetOf(3), 11, 12}, {SetOf(2, 4), SetOf(0, 1), 5, 6},
    {SetOf(2, 4), SetOf(3), 13, 14},
};

// Kinds 5 and 8 in the order book and the fills.
inline constexpr OrderTypeRow kLiveOrderTypeRows[] = {
    {SetOf(5), kEveryNumber, 38, 38},
    {SetOf(8), SetOf(3), 40, 41},
    {SetOf(8), kEveryNumber, 33, 34},
};

// The code of the first row that names such an order, or kNoOrderType.
template <size_t... kRows>
constexpr int FindOrderType(int kind, int tradeType, bool buys,
                            const OrderTypeRow (&... lists)[kRows]) {
  int code = kNoOrderType;
  const auto search = [&](const OrderTypeRow* rows, size_t count) {
    for (size_t i = 0; i < count; ++i) {
      if (!rows[i].kinds.Has(kind) || !rows[i].tradeTypes.Has(tradeType)) continue;
      code = buys ? rows[i].buy : rows[i].other;
      return true;
    }
    return false;
  };
  (void)(... || search(lists, kRows));
  return code;
}

#endif  // QUORVANE_GATEWAY_STOCK_ORDER_TYPE_CODES_H_
