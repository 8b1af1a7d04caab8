// What a fill or position reply, or one of its records, says of itself.
#ifndef QUORVANE_GATEWAY_FUTURES_REPLY_CODE_H_
#define QUORVANE_GATEWAY_FUTURES_REPLY_CODE_H_

#include <cstddef>
#include <string_view>

#include "gateway/core/reply_reader.h"
#include "gateway/core/text_writer.h"

// Buffers of a code and of a refusal's message.
inline constexpr size_t kReplyCodeSize = 8;
inline constexpr size_t kRefusalSize = 512;

inline constexpr std::string_view kDone = "0000";
inline constexpr std::string_view kNoData = "5001";

// A record numbered so, or above, marks the end of every futures list.
inline constexpr int kEndMark = 900000;

// Room for one record: a longer one reads as empty.
inline constexpr size_t kFuturesRecordSize = 1024;

inline std::string_view ReplyCode(std::string_view reply) {
  return Bounded(FindField(reply, "68", Blanks::kTaken), kReplyCodeSize);
}

// The code itself, or "message(code)" when it is neither done nor "no data": the gateway's message
// as it stands, without a source.
inline void WriteReplyCode(std::string_view code, std::string_view reply, CTextWriter& out) {
  if (code == kDone || code == kNoData) {
    out.AppendText(code);
  } else {
    const std::string_view message = FindField(reply, "M2", Blanks::kTaken);
    out.Append(WIRE("%s(%s)"), Bounded(message, kRefusalSize), code);
  }
}

#endif  // QUORVANE_GATEWAY_FUTURES_REPLY_CODE_H_
