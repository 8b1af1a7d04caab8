// The codes of order types: the first row that names an order, in lists of rows joined.

#include "gateway/stock/order_type_codes.h"

#include <gtest/gtest.h>

#include <climits>
#include <vector>

namespace gateway_tests {
namespace {

int SearchRows(const std::vector<OrderTypeRow>& rows, int kind, int tradeType, bool buys) {
  for (const OrderTypeRow& row : rows) {
    if (row.kinds.Has(kind) && row.tradeTypes.Has(tradeType)) return buys ? row.buy : row.other;
  }
  return kNoOrderType;
}

std::vector<int> Numbers() {
  std::vector<int> numbers = {INT_MIN, INT_MAX, 255, 256, -256};
  for (int number = -3; number <= 40; ++number) numbers.push_back(number);
  return numbers;
}

template <class... Lists>
void ExpectRowsInOrder(const Lists&... lists) {
  std::vector<OrderTypeRow> rows;
  (rows.insert(rows.end(), std::begin(lists), std::end(lists)), ...);
  for (int kind : Numbers()) {
    for (int tradeType : Numbers()) {
      for (bool buys : {false, true}) {
        EXPECT_EQ(FindOrderType(kind, tradeType, buys, lists...),
                  SearchRows(rows, kind, tradeType, buys))
            << kind << ", " << tradeType << ", " << buys;
      }
    }
  }
}

TEST(OrderTypeCodes, TheFirstRowThatNamesAnOrderHoldsItsCode) {
  ExpectRowsInOrder(kOrderTypeRows);
  ExpectRowsInOrder(kOrderTypeRows, kLiveOrderTypeRows);
}

TEST(OrderTypeCodes, EarlierRowsHideLaterOnes) {
  constexpr OrderTypeRow kFirst[] = {{SetOf(1), SetOf(2), 1, 2}};
  constexpr OrderTypeRow kSecond[] = {{SetOf(1), kEveryNumber, 3, 4},
                                      {SetOf(1, 8), SetOf(3), 5, 6}};
  ExpectRowsInOrder(kFirst, kSecond);
}

}  // namespace
}  // namespace gateway_tests
