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

  FixedValue<6> Clock() const { return {requestId.chars}; }
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

class CGatewayPub;

// The parts of an order key that are made for it.
struct KeyStore {
  Stamp stamp;
  SerialScratch serialNo;
};

// What one order is named by, in its header and, as the order key, at the start of its signature
// payload. The parts lie in the host's texts, the session and the store, and are copied from there
// alone: a copy of what was just written in other sizes would wait for it.
struct OrderKey {
  // Reads the clock. The session, `name` and `store` outlive the key.
  OrderKey(CGatewayPub& session, OrderHead orderHead, char orderFunction, const OrderOrigin& name,
           KeyStore& store);
  OrderKey(const OrderKey&) = delete;
  OrderKey& operator=(const OrderKey&) = delete;

  // The key as a piece, behind a plain header and behind a signed one.
  ALWAYS_INLINE auto Plain() const {
    return MakePiece(WIRE("%s_%s_%s_%c"), origin.branch, identity.second, identity.first, function);
  }
  ALWAYS_INLINE auto Signed() const {
    return MakePiece(WIRE("%s,%s,%04d%02d%02d,%s-%s,%s,%c"), serialNo, address, stamp.year,
                     stamp.month, stamp.day, origin.branch, identity.second, identity.first,
                     function);
  }

  // The key of its header; nothing where the header has none.
  void AppendTo(CTextWriter& text) const;

  const OrderHead head;
  const char function;
  const OrderOrigin& origin;
  const char market;  // securities or futures
  const PaddedText edition;
  const PaddedText address;
  const PaddedText serialNo;
  const IdentityParts identity;
  const Stamp& stamp;
};

#endif  // QUORVANE_GATEWAY_CORE_REQUEST_HEAD_H_
