// What the headers of requests are made of.
#ifndef QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_
#define QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_

#include <cstddef>
#include <string_view>

#include "gateway/core/text_writer.h"

// Characters that are kept of the device's serial number and address.
inline constexpr size_t kSerialNoSize = 20;
inline constexpr size_t kLocalIPSize = 64;

// The local time of one call and the request id made of it.
struct Stamp {
  int year, month, day;
  char digits[8];  // HHMMSS and two digits of the sequence number

  std::string_view RequestId() const { return {digits, sizeof digits}; }
  std::string_view Clock() const { return {digits, 6}; }
};

// The device as headers name it; the texts lie in the session. A serial number that fills its field
// has no terminator there, so the gateway knows it with the address run onto it: `serialTail`.
struct Device {
  std::string_view edition;
  std::string_view address;
  std::string_view serialNo;
  std::string_view serialTail;
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

struct IdentityParts {
  std::string_view first;
  std::string_view second;  // the same where there is but one
};

// What one order is named by, in its header and, as the order key, at the start of its signature
// payload. Its texts are the host's and the session's.
struct OrderKey {
  OrderHead head;
  char function;
  char market;  // securities or futures
  OrderOrigin origin;
  IdentityParts identity;
  Device device;
  Stamp stamp;

  // The brief header goes without an address.
  bool HasAddress() const { return head == OrderHead::kBrief || !device.address.empty(); }

  // Appends the key of its header. REQUIRES a header that has one: kPlain or kSigned.
  void AppendTo(CTextWriter& text) const;
};

#endif  // QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_
