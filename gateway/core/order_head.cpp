// The headers of order requests.
//
//   kPlain   F KIND BHNO CB IP 11 VER SN 65 14 <identity> 21 22 23 24 V4 [44]
//   kSigned  F KIND BHNO CB IP 11 VER SN 65 14 <identity> 21 22 23 24 V4
//   kBrief   F KIND CB BHNO VER SN 11 65 14 <identity>
//
// The first two leave an order key for the signature payload and need the device's address.
#include "gateway/core/conversions.h"
#include "gateway/core/gateway_pub.h"
#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"

namespace {

// A lone part stands for both; a part too long for its buffer counts as empty.
IdentityParts SplitIdentity(std::string_view identity) {
  const std::string_view first = Bounded(TakePiece(identity, '&'), kIdentityPartSize);
  const std::string_view second = Bounded(TakePiece(identity, '&'), kIdentityPartSize);
  return {first, second.empty() ? first : second};
}

// The second part decides. The blocks "15=1" open without a bar in the plain header, its tag 14
// running straight into "15=1". They end with a bar and the next field opens with one: the doubled
// '|' is the wire's.
bool WriteIdentity(CTextWriter& line, const OrderKey& key) {
  const auto [first, second] = key.identity;
  if (IsAccountLength(second.size())) {
    line.Append(WIRE("|15=0|IDNO=%s|ACNO=%s|PWD=%s"), first, second, key.origin.password);
    return true;
  }
  if (!IsIdNumberLength(second.size())) return false;
  if (key.head != OrderHead::kPlain) line.AppendChar('|');
  line.Append(WIRE("15=1|IDNO=%s|"), second);
  if (IsAccountLength(first.size())) line.Append(WIRE("ACNO=%s|"), first);
  line.Append(WIRE("PWD=%s|"), key.origin.password);
  return true;
}

void WriteOrigin(CTextWriter& line, const OrderKey& key) {
  const Device& device = key.device;
  if (key.head == OrderHead::kBrief) {
    line.Append(WIRE("F=1|KIND=%c|CB=1|BHNO=%s|VER=%s|SN=%s%s|11=%s|65=00%s|14=%c"), key.market,
                key.origin.branch, kProtocolVersion, device.serialNo, device.serialTail,
                device.edition, key.stamp.RequestId(), key.function);
  } else {
    line.Append(WIRE("F=1|KIND=%c|BHNO=%s|CB=1|IP=%s|11=%s|VER=%s|SN=%s%s|65=00%s|14=%c"),
                key.market, key.origin.branch, device.address, device.edition, kProtocolVersion,
                device.serialNo, device.serialTail, key.stamp.RequestId(), key.function);
  }
}

void WriteStamps(CTextWriter& line, const OrderKey& key) {
  const Stamp& stamp = key.stamp;
  line.Append(WIRE("|21=%04d%02d%02d|22=%s|23=%s|24=5|V4="), stamp.year, stamp.month, stamp.day,
              stamp.Clock(), stamp.RequestId());
  if (key.head == OrderHead::kPlain && !key.origin.rocDate.empty()) {
    line.Append(WIRE("|44=%08d"), RocToWesternDate(key.origin.rocDate));
  }
}

}  // namespace

int CGatewayPub::initOrderHead(char function, const char* branch, const char* identity,
                               const char* password, const char* rocDate, char* out,
                               char* orderKey) {
  return WritePublicHead(OrderHead::kPlain, function,
                         {AsText(branch), AsText(identity), AsText(password), AsText(rocDate)}, out,
                         orderKey);
}

int CGatewayPub::initOrderHead1(char function, const char* branch, const char* identity,
                                const char* password, const char*, char* out, char* orderKey) {
  return WritePublicHead(OrderHead::kSigned, function,
                         {AsText(branch), AsText(identity), AsText(password), {}}, out, orderKey);
}

int CGatewayPub::initOrderHead2(char function, const char* branch, const char* identity,
                                const char* password, char* out) {
  return WritePublicHead(OrderHead::kBrief, function,
                         {AsText(branch), AsText(identity), AsText(password), {}}, out, nullptr);
}

int CGatewayPub::WritePublicHead(OrderHead head, char function, const OrderOrigin& origin,
                                 char* out, char* orderKey) {
  CTextWriter line = CTextWriter::Continue(out, kBufferSize);
  const OrderKey key = KeyOf(head, function, origin);
  const bool written = WriteOrderHead(line, key);
  if (orderKey != nullptr && key.HasAddress()) {
    CTextWriter text(orderKey, kBufferSize);
    key.AppendTo(text);
    text.Text();
  }
  return EndPublicText(line, written);
}

bool CGatewayPub::WriteOrderHead(CTextWriter& line, const OrderKey& key) {
  if (!key.HasAddress()) {
    line.Replace(kNoAddress);
    return false;
  }
  WriteOrigin(line, key);
  if (!WriteIdentity(line, key)) {
    line.Replace(kIdentityLengths);
    return false;
  }
  if (key.head != OrderHead::kBrief) WriteStamps(line, key);
  if (!line.Overflowed()) debuglog(line.Text());
  return true;
}

OrderKey CGatewayPub::KeyOf(OrderHead head, char function, const OrderOrigin& origin) {
  return {head,        function,   RequestKind(), origin, SplitIdentity(origin.identity),
          TheDevice(), TakeStamp()};
}

void OrderKey::AppendTo(CTextWriter& text) const {
  if (head == OrderHead::kPlain) {
    text.Append(WIRE("%s_%s_%s_%c"), origin.branch, identity.second, identity.first, function);
  } else {
    text.Append(WIRE("%s%s,%s,%04d%02d%02d,%s-%s,%s,%c"), device.serialNo, device.serialTail,
                device.address, stamp.year, stamp.month, stamp.day, origin.branch, identity.second,
                identity.first, function);
  }
}
