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

// The brief header goes without.
bool HasAddress(const OrderKey& key) {
  return key.head == OrderHead::kBrief || !key.address.text.empty();
}

// The pieces of the usual header.
ALWAYS_INLINE inline auto Origin(const OrderKey& key) {
  return MakePiece(WIRE("F=1|KIND=%c|BHNO=%s|CB=1|IP=%s|11=%s|VER=%s|SN=%s|65=00%s|14=%c"),
                   key.market, key.origin.branch, key.address, key.edition, kProtocolVersion,
                   key.serialNo, key.stamp.requestId, key.function);
}
ALWAYS_INLINE inline auto Account(const OrderKey& key) {
  return MakePiece(WIRE("|15=0|IDNO=%s|ACNO=%s|PWD=%s"), key.identity.first, key.identity.second,
                   key.origin.password);
}
ALWAYS_INLINE inline auto Stamps(const OrderKey& key) {
  return MakePiece(WIRE("|21=%04d%02d%02d|22=%s|23=%s|24=5|V4="), key.stamp.year, key.stamp.month,
                   key.stamp.day, key.stamp.Clock(), key.stamp.requestId);
}

bool NamesAccount(const OrderKey& key) {
  return IsAccountLength(key.identity.second.size());
}

// The second part decides. The blocks "15=1" open without a bar in the plain header, its tag 14
// running straight into "15=1". They end with a bar and the next field opens with one: the doubled
// '|' is the wire's.
bool WriteIdentity(CTextWriter& line, const OrderKey& key) {
  const auto [first, second] = key.identity;
  if (NamesAccount(key)) {
    line.AppendPieces(Account(key));
    return true;
  }
  if (!IsIdNumberLength(second.size())) return false;
  if (key.head != OrderHead::kPlain) line.AppendChar('|');
  line.Append(WIRE("15=1|IDNO=%s|"), second);
  if (IsAccountLength(first.size())) line.Append(WIRE("ACNO=%s|"), first);
  line.Append(WIRE("PWD=%s|"), key.origin.password);
  return true;
}

// Any other origin than an account behind the usual header.
__attribute__((noinline, cold)) bool WriteUnusualOrigin(CTextWriter& line, const OrderKey& key) {
  if (key.head == OrderHead::kBrief) {
    line.Append(WIRE("F=1|KIND=%c|CB=1|BHNO=%s|VER=%s|SN=%s|11=%s|65=00%s|14=%c"), key.market,
                key.origin.branch, kProtocolVersion, key.serialNo, key.edition, key.stamp.requestId,
                key.function);
  } else {
    line.AppendPieces(Origin(key));
  }
  return WriteIdentity(line, key);
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
  KeyStore store;
  const OrderKey key(*this, head, function, origin, store);
  const bool written = WriteOrderHead(line, key);
  if (orderKey != nullptr && HasAddress(key)) {
    CTextWriter text(orderKey, kBufferSize);
    key.AppendTo(text);
    text.Text();
  }
  return EndPublicHead(line, written);
}

bool CGatewayPub::WriteOrderHead(CTextWriter& line, const OrderKey& key) {
  if (!HasAddress(key)) {
    line.Replace(kNoAddress);
    return false;
  }
  if (Mostly(key.head != OrderHead::kBrief && NamesAccount(key))) {
    line.AppendPieces(Origin(key), Account(key));
  } else if (!WriteUnusualOrigin(line, key)) {
    line.Replace(kIdentityLengths);
    return false;
  }
  if (key.head == OrderHead::kPlain && Mostly(!key.origin.rocDate.empty())) {
    line.AppendPieces(Stamps(key),
                      MakePiece(WIRE("|44=%08d"), RocToWesternDate(key.origin.rocDate)));
  } else if (key.head != OrderHead::kBrief) {
    line.AppendPieces(Stamps(key));
  }
  if (!line.Overflowed()) debuglog(line.Text());
  return true;
}

OrderKey::OrderKey(CGatewayPub& session, OrderHead orderHead, char orderFunction,
                   const OrderOrigin& name, KeyStore& store)
    : head(orderHead),
      function(orderFunction),
      origin(name),
      market(session.RequestKind()),
      edition(session.PlatformName()),
      address{session.LocalIP()},
      serialNo(session.SerialNo(address.text, store.serialNo)),
      identity(SplitIdentity(name.identity)),
      stamp(store.stamp) {
  session.TakeStamp(store.stamp);
}

void OrderKey::AppendTo(CTextWriter& text) const {
  if (head == OrderHead::kPlain) text.AppendPieces(Plain());
  if (head == OrderHead::kSigned) text.AppendPieces(Signed());
}
