// The texts that a user of the stock market may be shown, beside those of every operation.
#ifndef QUORVANE_GATEWAY_STOCK_MESSAGES_H_
#define QUORVANE_GATEWAY_STOCK_MESSAGES_H_

#include "gateway/core/messages.h"
#include "gateway/orders/messages.h"

// Orders that are not sent. A quantity of 0 is refused too, by the words for one below 0.
inline constexpr char kOrderKindError[] = "[CLIENT] 委託種類錯誤";
inline constexpr char kPriceKindError[] = "[CLIENT] 委託價格錯誤";
inline constexpr char kTradeTypeError[] = "[CLIENT] 委託交易錯誤";
inline constexpr char kStockCodeTooLong[] = "[CLIENT] 股票代號最多六碼";
inline constexpr char kQuantityError[] = "[CLIENT] 委託數量不可小於0";

// Queries that are not sent.
inline constexpr char kDateError[] = "[CLIENT] 日期輸入錯誤";

// The state of a failed order that still waits.
inline constexpr char kWaitingState[] = "處理中";

// Prices that are no number.
inline constexpr char kLimitDownPrice[] = "跌停價";
inline constexpr char kFlatPrice[] = "平盤價";
inline constexpr char kLimitUpPrice[] = "漲停價";

#endif  // QUORVANE_GATEWAY_STOCK_MESSAGES_H_
