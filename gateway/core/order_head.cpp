// The headers of order requests.
//
//   kPlain   F KIND BHNO CB IP 11 VER SN 65 14 <identity> 21 22 23 24 V4 [44]
//   kSigned  F KIND BHNO CB IP 11 VER SN 65 14 <identity> 21 22 23 24 V4
//   kBrief   F KIND CB BHNO VER SN 11 65 14 <identity>
//
// The first two leave an order key for the signature payload and need the device's address.
#include "gateway/core/gateway_pub.h"
#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"

namespace {

struct Identity {
  std::string_view first, second;
};

// A lone part stands for both; a part too long for its buffer counts as empty.
Identity SplitOrderIdentity(std::string_view identity) {
  const std::string_view first = Bounded(TakePiece(identity, '&'), kIdentityPartSize);
  const std::string_view second = Bounded(TakePiece(identity, '&'), kIdentityPartSize);
  return {first, second.empty() ? first : second};
}

// The second part decides. `bar` opens the blocks "15=1": the plain header goes without one, its
// tag 14 running straight into "15=1". These blocks end with a bar and the next field opens with
// one: the doubled '|' is the wire's.
bool WriteIdentity(CTextWriter& line, const Identity& identity, const char* bar,
                   const char* password) {
  const auto& [first, second] = identity;
  if (IsAccountLength(second.size())) {
    line.Append(WIRE("|15=0|IDNO=%s|ACNO=%s|PWD=%s"), first, second, password);
    return true;
  }
  if (!IsIdNumberLength(second.size())) return false;
  line.Append(WIRE("%s15=1|IDNO=%s|"), bar, second);
  if (IsAccountLength(first.size())) line.Append(WIRE("ACNO=%s|"), first);
  line.Append(WIRE("PWD=%s|"), password);
  return true;
}

}  // namespace

int CGatewayPub::initOrderHead(char function, const char* branch, const char* identity,
                               const char* password, const char* rocDate, char* out,
                               char* orderKey) {
  CTextWriter line = CTextWriter::Continue(out, kBufferSize);
  CTextWriter key(orderKey, kBufferSize);
  const OrderOrigin origin = {function, branch, identity, password, rocDate};
  const bool written = WriteOrderHead(OrderHead::kPlain, origin, line, key);
  key.Text();
  return EndPublicHead(line, written);
}

int CGatewayPub::initOrderHead1(char function, const char* branch, const char* identity,
                                const char* password, const char* rocDate, char* out,
                                char* orderKey) {
  CTextWriter line = CTextWriter::Continue(out, kBufferSize);
  CTextWriter key(orderKey, kBufferSize);
  const OrderOrigin origin = {function, branch, identity, password, rocDate};
  const bool written = WriteOrderHead(OrderHead::kSigned, origin, line, key);
  key.Text();
  return EndPublicHead(line, written);
}

int CGatewayPub::initOrderHead2(char function, const char* branch, const char* identity,
                                const char* password, char* out) {
  CTextWriter line = CTextWriter::Continue(out, kBufferSize);
  char unused[1];
  CTextWriter key(unused, sizeof unused);
  const OrderOrigin origin = {function, branch, identity, password, nullptr};
  const bool written = WriteOrderHead(OrderHead::kBrief, origin, line, key);
  return EndPublicHead(line, written);
}

bool CGatewayPub::WriteOrderHead(OrderHead head, const OrderOrigin& origin, CTextWriter& line,
                                 CTextWriter& key) {
  const Stamp stamp = TakeStamp();
  if (head != OrderHead::kBrief && LocalIP().empty()) {
    line.Replace(kNoAddress);
    return false;
  }
  const Identity identity = SplitOrderIdentity(AsText(origin.identity));
  WriteOrderKey(head, origin, identity.first, identity.second, stamp, key);
  WriteOrderOrigin(head, origin, stamp, line);
  if (!WriteIdentity(line, identity, head == OrderHead::kPlain ? "" : "|", origin.password)) {
    line.Replace(kIdentityLengths);
    return false;
  }
  if (head != OrderHead::kBrief) WriteStamps(line, stamp);
  if (head == OrderHead::kPlain && !AsText(origin.rocDate).empty()) {
    line.Append(WIRE("|44=%08d"), RocDateToStandardDate(origin.rocDate));
  }
  if (!line.Overflowed()) debuglog(line.Text());
  return true;
}

void CGatewayPub::WriteOrderKey(OrderHead head, const OrderOrigin& origin, std::string_view first,
                                std::string_view second, const Stamp& stamp,
                                CTextWriter& key) const {
  if (head == OrderHead::kPlain) {
    key.Append(WIRE("%s_%s_%s_%c"), origin.branch, second, first, origin.function);
  } else if (head == OrderHead::kSigned) {
    SerialScratch scratch;
    key.Append(WIRE("%s,%s,%04d%02d%02d,%s-"), SerialNo(scratch), LocalIP(), stamp.year,
               stamp.month, stamp.day, origin.branch);
    key.Append(WIRE("%s,%s,%c"), second, first, origin.function);
  }
}

void CGatewayPub::WriteOrderOrigin(OrderHead head, const OrderOrigin& origin, const Stamp& stamp,
                                   CTextWriter& line) const {
  SerialScratch scratch;
  if (head == OrderHead::kBrief) {
    line.Append(WIRE("F=1|KIND=%s|CB=1|BHNO=%s|VER=%d|SN=%s|11=%s"), RequestKind(), origin.branch,
                kProtocolVersion, SerialNo(scratch), PlatformName());
  } else {
    line.Append(WIRE("F=1|KIND=%s|BHNO=%s|CB=1|IP=%s|11=%s|VER=%d|SN=%s"), RequestKind(),
                origin.branch, LocalIP(), PlatformName(), kProtocolVersion, SerialNo(scratch));
  }
  line.Append(WIRE("|65=%010d|14=%c"), stamp.requestId, origin.function);
}

void CGatewayPub::WriteStamps(CTextWriter& line, const Stamp& stamp) {
  line.Append(WIRE("|21=%04d%02d%02d|22=%02d%02d%02d|23=%08d|24=5|V4="), stamp.year, stamp.month,
              stamp.day, stamp.hour, stamp.minute, stamp.second, stamp.requestId);
}
