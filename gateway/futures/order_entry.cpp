// Futures and options orders: new, change, cancel.
//
//   request  <order header> 27 28 29 30 31 M8 32 33 34 O4 V5 V6 V8 [<second leg>]
//            ( W3 | 36 46 37 ) N6 <signature payload>
#include "gateway/core/conversions.h"
#include "gateway/core/messages.h"
#include "gateway/core/protocol.h"
#include "gateway/futures/futures_order.h"
#include "gateway/futures/gateway_fut.h"
#include "gateway/orders/order_reference.h"

namespace {

// Room for one value of an order reference: a longer one is dropped.
constexpr size_t kReferencePartSize = 48;

constexpr int kPriceDecimals = 4;
constexpr char kMarketPrice[] = "00000000.000000";

bool NamesEveryLeg(const FuturesOrder& order) {
  switch (order.kind) {
    case OrderKind::kFutures:
      return order.first.NamesContract();
    case OrderKind::kOption:
      return order.first.NamesOption();
    case OrderKind::kCombination:
      return order.first.NamesOption() && order.second.NamesOption();
    case OrderKind::kSpread:
      return order.first.NamesContract() && order.second.NamesContract();
  }
  return false;
}

// The price as it is sent and signed.
class CPriceText {
 public:
  CPriceText(CGatewayPub& gateway, const FuturesOrder& order) {
    if (order.IsAtMarket()) {
      memcpy(m_szPrice, kMarketPrice, sizeof kMarketPrice);
    } else {
      gateway.SetPriceString(order.price, kPriceDecimals, m_szPrice, sizeof m_szPrice);
    }
  }

  const char* Text() const { return m_szPrice; }

 private:
  char m_szPrice[16];
};

// Codes are compared by their first characters, as far as a code reaches.
bool SameStart(const char* one, const char* other, size_t characters) {
  const auto start = [characters](const char* text) {
    const std::string_view whole = AsText(text);
    return std::string_view(whole.data(), whole.size() < characters ? whole.size() : characters);
  };
  return start(one) == start(other);
}

// How the two legs of an order make one product.
const char* CombinationCode(const FuturesOrder& order) {
  const Leg& first = order.first;
  const Leg& second = order.second;
  if (order.kind == OrderKind::kSpread) return "7";
  if (order.kind != OrderKind::kCombination) return "";
  if (first.side == second.side) {
    return SameStart(first.commodity, second.commodity, 16) ? "3" : "4";
  }
  if (!SameStart(first.callPut, second.callPut, 8)) return "5";
  return SameStart(first.month, second.month, 16) ? "1" : "2";
}

// W1 carries the call/put and W2 the strike; only a new order repeats its quantity for the leg.
void WriteSecondLeg(const FuturesOrder& order, CTextWriter& body) {
  const Leg& leg = order.second;
  if (order.IsNew()) {
    body.Append(WIRE("|EL=%c|V9=%s|W0=%s|W1=%s|W2=%s|EM=%ld"), leg.side, leg.commodity, leg.month,
                leg.callPut, leg.strike, order.quantity);
  } else {
    body.Append(WIRE("|EL=%c|V9=%s|W0=%s|W1=%s|W2=%s"), leg.side, leg.commodity, leg.month,
                leg.callPut, leg.strike);
  }
}

void WriteBody(const FuturesOrder& order, const char* price, CTextWriter& body) {
  const Leg& leg = order.first;
  body.Append(WIRE("|27=%d|28=0|29=%s|30=%ld|31=%s|M8=|32=%c|33=%s|34=%s"), int{order.priceType},
              leg.month, order.quantity, price, leg.side, leg.commodity, leg.strike);
  body.Append(WIRE("|O4=%s|V5=%s|V6=%s|V8=%s"), order.timeInForce == 'F' ? "1" : "0",
              order.timeInForce == 'I' ? "1" : "0", CombinationCode(order), leg.callPut);
  if (order.HasTwoLegs()) WriteSecondLeg(order, body);
  if (order.IsNew()) {
    body.Append(WIRE("|W3=%c"), order.flagW3);
    return;
  }
  const OrderReference reference(AsText(order.orderReference), kReferencePartSize);
  body.Append(WIRE("|36=%s|46=%s|37=%ld"), reference.orderNumber, reference.gatewayNumber,
              order.quantity);
}

// An order and the two texts that its signature payload needs beside it.
struct Signing {
  const FuturesOrder& order;
  std::string_view key;
  const char* price;
};

// Values joined by '_', as many as each case has.
void SignPlain(const Signing& signing, CTextWriter& out) {
  const FuturesOrder& order = signing.order;
  const Leg& first = order.first;
  const Leg& second = order.second;
  const OrderReference reference(AsText(order.orderReference), kReferencePartSize);
  if (order.IsNew() && order.HasTwoLegs()) {
    out.Append(WIRE("!!%s_%c_%c_%s_%s_%s_%s_%c_%s_%s_%s_%s_%ld_%s"), signing.key, order.timeInForce,
               first.side, first.commodity, first.month, first.strike, first.callPut, second.side,
               second.commodity, second.month, second.strike, second.callPut, order.quantity,
               signing.price);
  } else if (order.IsNew()) {
    out.Append(WIRE("!!%s_%c_%c_%s_%s_%s_%s_%ld_%s"), signing.key, order.timeInForce, first.side,
               first.commodity, first.month, first.strike, first.callPut, order.quantity,
               signing.price);
  } else if (order.function == 'C') {
    out.Append(WIRE("!!%s_%s_%ld"), signing.key, reference.orderNumber, order.quantity);
  } else {
    out.Append(WIRE("!!%s_%s"), signing.key, reference.orderNumber);
  }
}

// Always sixteen places: key, time in force, W3, price type, five of each leg, quantity, price;
// then the reference of a change or cancel. A leg's call/put stands last here, unlike in the tags.
void SignInPlaces(const Signing& signing, CTextWriter& out) {
  const FuturesOrder& order = signing.order;
  const Leg& first = order.first;
  const Leg& second = order.second;
  const OrderReference reference(AsText(order.orderReference), kReferencePartSize);
  if (order.IsNew() && order.HasTwoLegs()) {
    out.Append(WIRE("|PL=S!!%s,%c,%c,%d,%c,%s,%s,%s,%s,%c,%s,%s,%s,%s,%ld,%s,"), signing.key,
               order.timeInForce, order.flagW3, int{order.priceType}, first.side, first.commodity,
               first.month, first.strike, first.callPut, second.side, second.commodity,
               second.month, second.strike, second.callPut, order.quantity, signing.price);
  } else if (order.IsNew()) {
    out.Append(WIRE("|PL=S!!%s,%c,%c,%d,%c,%s,%s,%s,%s,,,,,,%ld,%s,"), signing.key,
               order.timeInForce, order.flagW3, int{order.priceType}, first.side, first.commodity,
               first.month, first.strike, first.callPut, order.quantity, signing.price);
  } else if (order.function == 'A') {
    out.Append(WIRE("|PL=S!!%s,%c,,,,,,,,,,,,,%ld,%s,%s"), signing.key, order.timeInForce,
               order.quantity, signing.price, reference.orderNumber);
  } else if (order.function == 'C') {
    out.Append(WIRE("|PL=S!!%s,,,,,,,,,,,,,,%ld,,%s"), signing.key, order.quantity,
               reference.orderNumber);
  } else {
    out.Append(WIRE("|PL=S!!%s,,,,,,,,,,,,,,0,,%s"), signing.key, reference.orderNumber);
  }
}

using Sign = void(const Signing& signing, CTextWriter& out);

// Appends an order's tags to `body` and turns the key in `signature` into its payload; false, and
// nothing written, when the order does not name what its kind needs.
bool WriteRecord(CGatewayPub& gateway, const FuturesOrder& order, Sign* sign, CTextWriter& body,
                 CTextWriter& signature) {
  if (!NamesEveryLeg(order)) return false;
  const CPriceText price(gateway, order);
  WriteBody(order, price.Text(), body);
  char scratch[CGatewayPub::kBufferSize];
  CTextWriter key(scratch, sizeof scratch);
  key.AppendText({signature.Text(), signature.Length()});
  signature.Replace("");
  sign({order, {key.Text(), key.Length()}, price.Text()}, signature);
  return true;
}

// A public record method: what it returns, and its two buffers.
int EncodeRecord(CGatewayPub& gateway, const FuturesOrder& order, Sign* sign, char* body,
                 char* signature) {
  CTextWriter line = CTextWriter::Continue(body, CGatewayFut::kBodySize);
  CTextWriter payload = CTextWriter::Continue(signature, CGatewayPub::kBufferSize);
  const bool written = WriteRecord(gateway, order, sign, line, payload);
  const bool fits = !payload.Overflowed();
  payload.Text();
  if (!written || !fits) line.Replace(kBadParameters);
  return EndPublicText(line, written && fits);
}

}  // namespace

char* CGatewayFut::EncodeOrder(OrderHead head, const OrderOrigin& origin, const FuturesOrder& order,
                               int* status) {
  *status = 1;
  CTextWriter line = StartRequest();
  const OrderKey key = KeyOf(head, order.function, origin);
  if (!WriteOrderHead(line, key)) {
    *status = -1;
    return line.Text();
  }
  CTextWriter signature(m_szSignature, sizeof m_szSignature);
  key.AppendTo(signature);
  Sign* const sign = head == OrderHead::kPlain ? SignPlain : SignInPlaces;
  if (WriteRecord(*this, order, sign, line, signature)) {
    line.Append(WIRE("|N6=%d"), int{order.handlingFlag});
    line.AppendText({signature.Text(), signature.Length()});
    if (signature.Overflowed()) return Fail(line, status, kBadParameters);
  } else {
    *status = -1;
    line.AppendText(kBadParameters);  // the header stays in front of it
  }
  return Finish(line, status, kBadParameters);
}

// What each of these methods takes of an order, and the order that it makes of it.
#define ORDER_PARAMETERS                                                                      \
  const char *orderReference, [[maybe_unused]] const char *orderDate, const char *commodity1, \
      const char *commodity2, const char *month1, const char *month2, const char *strike1,    \
      const char *strike2, const char *callPut1, const char *callPut2, char handlingFlag,     \
      char orderKind, char priceType, char function, char flagW3, char timeInForce, char,     \
      char side1, char side2, int quantity, int, int price
#define ORDER                                                                                  \
  FuturesOrder {                                                                               \
    orderReference, {side1, commodity1, month1, strike1, callPut1},                            \
        {side2, commodity2, month2, strike2, callPut2}, static_cast<uint8_t>(handlingFlag),    \
        OrderKind{static_cast<uint8_t>(orderKind)}, static_cast<uint8_t>(priceType), function, \
        flagW3, timeInForce, quantity, price                                                   \
  }
#define ORIGIN_PARAMETERS const char *branch, const char *identity, const char *password
#define ORIGIN                                                            \
  OrderOrigin {                                                           \
    AsText(branch), AsText(identity), AsText(password), AsText(orderDate) \
  }

char* CGatewayFut::SubmitOrderEncode(ORIGIN_PARAMETERS, ORDER_PARAMETERS, int* status) {
  return EncodeOrder(OrderHead::kPlain, ORIGIN, ORDER, status);
}

char* CGatewayFut::SubmitOrderEncode1(ORIGIN_PARAMETERS, ORDER_PARAMETERS, int* status) {
  return EncodeOrder(OrderHead::kSigned, ORIGIN, ORDER, status);
}

int CGatewayFut::EncodeSubmitOrderRecord(ORDER_PARAMETERS, char* body, char* signature) {
  return EncodeRecord(*this, ORDER, SignPlain, body, signature);
}

int CGatewayFut::EncodeSubmitOrderRecord1(ORDER_PARAMETERS, char* body, char* signature) {
  return EncodeRecord(*this, ORDER, SignInPlaces, body, signature);
}
