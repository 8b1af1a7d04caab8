// The frame of the lists of the stock market.
#ifndef QUORVANE_GATEWAY_STOCK_STOCK_LIST_H_
#define QUORVANE_GATEWAY_STOCK_STOCK_LIST_H_

#include "gateway/core/list_frame.h"

// Buffers in bytes: a record or value that does not fit with a terminator reads as empty.
inline constexpr ListShape kStockListShape = {400, 20, 20, 400};

inline constexpr size_t kFieldSize = 50;  // of a record's value

#endif  // QUORVANE_GATEWAY_STOCK_STOCK_LIST_H_
