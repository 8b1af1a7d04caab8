// The texts that a user of the stock market may be shown, beside those of every operation.
#ifndef QUORVANE_GATEWAY_STOCK_MESSAGES_H_
#define QUORVANE_GATEWAY_STOCK_MESSAGES_H_

#include "gateway/core/messages.h"

// Orders that are not sent. A quantity of 0 is refused too, by the words for one below 0.
inline constexpr char kPriceKindError[] = "[CLIENT] 委託價格錯誤";
inline constexpr char kTradeTypeError[] = "[CLIENT] 委託交易錯誤";
inline constexpr char kStockCodeTooLong[] = "[CLIENT] 股票代號最多六碼";
inline constexpr char kQuantityError[] = "[CLIENT] 委託數量不可小於0";

// Queries that are not sent.
inline constexpr char kDateError[] = "[CLIENT] 日期輸入錯誤";

// States of an order.
inline constexpr char kCancelledState[] = "已取消";
inline constexpr char kProcessingState[] = "正在處理";
inline constexpr char kReceivedState[] = "委託收到";
inline constexpr char kFilledState[] = "已成交";
inline constexpr char kFilledCancelledState[] = "部份成交，其餘已取消";
inline constexpr char kPartlyFilledState[] = "部份成交";
inline constexpr char kReservedState[] = "預約單";
inline constexpr char kAcceptedState[] = "委託成功";
inline constexpr char kReducedState[] = "已改量";
inline constexpr char kFailedState[] = "委託失敗";
inline constexpr char kWaitingState[] = "處理中";

// Prices that are no number.
inline constexpr char kMarketPrice[] = "市價";
inline constexpr char kLimitDownPrice[] = "跌停價";
inline constexpr char kFlatPrice[] = "平盤價";
inline constexpr char kLimitUpPrice[] = "漲停價";

#endif  // QUORVANE_GATEWAY_STOCK_MESSAGES_H_
