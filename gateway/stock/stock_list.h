// The frame of the lists of the stock market.
#ifndef QUORVANE_GATEWAY_STOCK_STOCK_LIST_H_
#define QUORVANE_GATEWAY_STOCK_STOCK_LIST_H_

#include "gateway/core/list_frame.h"

// The record buffer: a longer record reads as empty. It bounds the fields that have no smaller one.
inline constexpr size_t kRecord = 400;

inline constexpr ListShape kStockList = {kRecord};

#endif  // QUORVANE_GATEWAY_STOCK_STOCK_LIST_H_
