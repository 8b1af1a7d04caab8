// What the headers of requests are made of.
#ifndef QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_
#define QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_

#include <cstddef>
#include <string_view>

#include "gateway/core/text_writer.h"

// Characters that are kept of the device's serial number and address.
inline constexpr size_t kSerialNoSize = 20;
inline constexpr size_t kLocalIPSize = 64;

// Room for a full serial number with the address run onto it.
using SerialScratch = char[kSerialNoSize + kLocalIPSize];

// The local time of one call and the request id made of it.
struct Stamp {
  int year, month, day;
  FixedText<8> requestId;  // HHMMSS and two digits of the sequence number

  FixedText<6> Clock() const {
    FixedText<6> clock;
    memcpy(clock.chars, requestId.chars, sizeof clock.chars);
    return clock;
  }
};

// The three order headers: what each sends is in order_head.cpp.
enum class OrderHead { kPlain, kSigned, kBrief };

// The host's texts in an order header; `rocDate` is sent by kPlain alone.
struct OrderOrigin {
  std::string_view branch;
  std::string_view identity;
  std::string_view password;
  std::string_view rocDate;
};

// The text that opens an order's signature payload, as the parts that its header knows. They lie in
// the host's texts, the session and the key itself, and are stored where they are read from: a copy
// of what was just written in other sizes would wait for it.
struct OrderKey {
  OrderKey() = default;
  OrderKey(const OrderKey&) = delete;
  OrderKey& operator=(const OrderKey&) = delete;

  // The key itself; nothing where the header has none.
  void AppendTo(CTextWriter& text) const;

  // The key with what goes before it in a request: the payload stands bare behind the last field,
  // or in tag PL.
  void OpenPayload(CTextWriter& line) const {
    line.AppendText(head == OrderHead::kPlain ? "!!" : "|PL=S!!");
    AppendTo(line);
  }

  OrderHead head = OrderHead::kBrief;
  char function;
  const OrderOrigin* origin;
  std::string_view first, second;  // of the identity
  std::string_view serialNo, address;
  Stamp stamp;
  SerialScratch scratch;  // of serialNo
};

#endif  // QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_
