// The codes that name an order's type to the user interface: made of order kind, trade type and
// side.
#ifndef QUORVANE_GATEWAY_STOCK_ORDER_TYPE_CODES_H_
#define QUORVANE_GATEWAY_STOCK_ORDER_TYPE_CODES_H_

#include <cstddef>
#include <cstdint>

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

// The code of the first row that names such an order, or kNoOrderType. Worked out beforehand for
// all kinds and trade types that rows tell apart: the orders of a list are past guessing, and a
// search would be guessed wrong for most of them.
class COrderTypes {
 public:
  template <size_t... kRows>
  constexpr explicit COrderTypes(const OrderTypeRow (&... lists)[kRows]) {
    for (int kind = 0; kind <= kOtherKind; ++kind) {
      for (int tradeType = 0; tradeType <= kOtherTradeType; ++tradeType) {
        Codes& codes = m_codes[kind][tradeType];
        (void)(... || FindFirst(lists, kRows, kind, tradeType, codes));
      }
    }
  }

  constexpr int Find(int kind, int tradeType, bool buys) const {
    const Codes& codes = m_codes[Clamp(kind, kOtherKind)][Clamp(tradeType, kOtherTradeType)];
    return buys ? codes.buy : codes.other;
  }

 private:
  struct Codes {
    uint8_t buy = kNoOrderType;
    uint8_t other = kNoOrderType;
  };

  // No row names these, or anything above them, but by kEveryNumber.
  static constexpr int kOtherKind = 9;
  static constexpr int kOtherTradeType = 4;

  static constexpr uint32_t Clamp(int number, int most) {
    const auto wanted = static_cast<uint32_t>(number);
    const auto limit = static_cast<uint32_t>(most);
    return wanted < limit ? wanted : limit;
  }

  static constexpr bool FindFirst(const OrderTypeRow* rows, size_t count, int kind, int tradeType,
                                  Codes& codes) {
    for (size_t i = 0; i < count; ++i) {
      if (!rows[i].kinds.Has(kind) || !rows[i].tradeTypes.Has(tradeType)) continue;
      codes = {static_cast<uint8_t>(rows[i].buy), static_cast<uint8_t>(rows[i].other)};
      return true;
    }
    return false;
  }

  Codes m_codes[kOtherKind + 1][kOtherTradeType + 1] = {};
};

#endif  // QUORVANE_GATEWAY_STOCK_ORDER_TYPE_CODES_H_
