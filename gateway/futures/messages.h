// The texts that futures and options operations show, beside those of every operation.
#ifndef QUORVANE_GATEWAY_FUTURES_MESSAGES_H_
#define QUORVANE_GATEWAY_FUTURES_MESSAGES_H_

// Futures replies are not asked for transport markers: only an empty one tells of the transport.
inline constexpr char kNoReply[] = "[CLIENT]主機連線失敗";
inline constexpr char kNoReplyToJudge[] = "[CLIENT]連線失敗";

inline constexpr char kBadOrderDate[] = "[CLIENT]日期輸入錯誤";
inline constexpr char kBadDateRange[] = "[CLIENT]起訖日期錯誤";
inline constexpr char kBadPositionQuery[] = "傳入的參數錯誤";  // the one without a source
inline constexpr char kLegKindError[] = "[CLIENT]委託種類錯誤";

inline constexpr char kRangeMarketPrice[] = "範圍市價";

#endif  // QUORVANE_GATEWAY_FUTURES_MESSAGES_H_
