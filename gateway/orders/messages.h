// The texts that tell a user of orders, on either market; each is UTF-8.
#ifndef QUORVANE_GATEWAY_ORDERS_MESSAGES_H_
#define QUORVANE_GATEWAY_ORDERS_MESSAGES_H_

#include <string_view>

inline constexpr char kOrderInTransit[] = "委託單傳送中!!";

// States of an order; the two of an immediate order, fill or kill or immediate or cancel, are those
// of what its matching left.
inline constexpr std::string_view kFailedState = "委託失敗";
inline constexpr std::string_view kReceivedState = "委託收到";
inline constexpr std::string_view kProcessingState = "正在處理";
inline constexpr std::string_view kCancelledState = "已取消";
inline constexpr std::string_view kUnmatchedState = "撮合未成交";
inline constexpr std::string_view kReservedState = "預約單";
inline constexpr std::string_view kAcceptedState = "委託成功";
inline constexpr std::string_view kReducedState = "已改量";
inline constexpr std::string_view kFilledState = "已成交";
inline constexpr std::string_view kPartlyMatchedState = "撮合部份成交";
inline constexpr std::string_view kFilledCancelledState = "部份成交，其餘已取消";
inline constexpr std::string_view kPartlyFilledState = "部份成交";

// The price of an order at the market.
inline constexpr char kMarketPrice[] = "市價";

#endif  // QUORVANE_GATEWAY_ORDERS_MESSAGES_H_
