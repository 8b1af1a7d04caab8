// What the lists of futures and options have in common.
#ifndef QUORVANE_GATEWAY_FUTURES_FUTURES_LIST_H_
#define QUORVANE_GATEWAY_FUTURES_FUTURES_LIST_H_

#include <cstddef>
#include <string_view>

#include "gateway/core/conversions.h"
#include "gateway/core/list_frame.h"
#include "gateway/core/text_writer.h"

// Room for one record: a longer one reads as empty. It bounds the fields that have no smaller one.
inline constexpr size_t kRecord = 1024;

// Fills and positions: a record without content ends them too.
inline constexpr ListShape kFuturesList = {kRecord, true};

// What the reply as a whole says; a record's own code and message have the same bounds.
inline constexpr ReplyField kReplyCode = {"68", 8};
inline constexpr ReplyField kRefusal = {"M2", 512};

// A price or strike of a record, with four implied decimals.
inline int32_t PriceOf(const CRecord& record, int field) {
  return ScalePrice(record.Text(field), 4);
}

inline std::string_view ReplyCode(std::string_view reply) {
  return ReadField(reply, kReplyCode);
}

// The code itself, or "message(code)" when it is neither done nor "no data": the gateway's message
// as it stands, without a source.
inline void WriteReplyCode(std::string_view code, std::string_view reply, CTextWriter& out) {
  if (code == kDoneCode || code == kNoDataCode) {
    out.AppendText(code);
  } else {
    out.Append(WIRE("%s(%s)"), ReadField(reply, kRefusal), code);
  }
}

#endif  // QUORVANE_GATEWAY_FUTURES_FUTURES_LIST_H_
