#include "tests/fuzz/plain_reader.h"

namespace gateway_fuzz {
namespace {

constexpr size_t kNowhere = std::string_view::npos;

// `at` is not behind the text's end.
inline bool StandsAt(std::string_view text, size_t at, std::string_view what) {
  if (what.size() > text.size() - at) return false;
  for (size_t i = 0; i < what.size(); ++i) {
    if (text[at + i] != what[i]) return false;
  }
  return true;
}

// Where "|tag=" stands.
size_t FindField(std::string_view text, std::string_view tag, size_t from) {
  for (size_t at = from; at < text.size(); ++at) {
    if (text[at] == '|' && StandsAt(text, at + 1, tag) &&
        StandsAt(text, at + 1 + tag.size(), "=")) {
      return at;
    }
  }
  return kNowhere;
}

}  // namespace

size_t PlainFind(std::string_view text, std::string_view what, size_t from) {
  for (size_t at = from; at < text.size(); ++at) {
    if (text[at] == what[0] && StandsAt(text, at, what)) return at;
  }
  return kNowhere;
}

std::string_view PlainBounded(std::string_view value, size_t bound) {
  return value.size() < bound ? value : std::string_view();
}

PlainToken ReadPlainToken(std::string_view tag, std::string_view reply, size_t bound,
                          bool skipBlank) {
  size_t from = 0;
  for (;;) {
    const size_t found = FindField(reply, tag, from);
    if (found == kNowhere) return {};
    const size_t begin = found + tag.size() + 2;
    const size_t end = PlainFind(reply, "|", begin);
    const bool closed = end != kNowhere;
    const std::string_view value = reply.substr(begin, closed ? end - begin : kNowhere);
    if (skipBlank && closed && (value.empty() || (value.size() == 1 && value[0] == ' '))) {
      from = end;
      continue;
    }
    return {PlainBounded(value, bound), value.size()};
  }
}

PlainRecord ReadPlainRecord(std::string_view reply, size_t pos, size_t bound) {
  const size_t opening = PlainFind(reply, "|00=", pos);
  const size_t closing = PlainFind(reply, "|01=", pos);
  if (opening == kNowhere || closing == kNowhere) return {"", reply.size()};
  if (closing < opening) return {"", closing + 1};
  return {PlainBounded(reply.substr(opening, closing - opening), bound), closing + 1};
}

bool PlainNextRecord(std::string_view reply, size_t bound, size_t& pos, std::string_view& record) {
  const size_t closing = PlainFind(reply, "|01=", pos);
  if (closing == kNowhere) return false;
  const size_t opening = PlainFind(reply.substr(0, closing), "|00=", pos);
  record = {};
  if (opening != kNowhere) {
    record = PlainBounded(reply.substr(opening, closing - opening), bound);
  }
  pos = closing + 1;
  return true;
}

PlainTransport JudgePlainTransport(std::string_view reply) {
  if (PlainFind(reply, "[GATEWAY]error", 0) != kNowhere) return PlainTransport::kGatewayDown;
  if (reply.empty() || PlainFind(reply, "[BROKER]timeout", 0) != kNowhere) {
    return PlainTransport::kBrokerDown;
  }
  return PlainTransport::kOk;
}

PlainField ReadPlainField(std::string_view text, std::string_view separator) {
  const size_t found = PlainFind(text, separator, 0);
  if (found == kNowhere) return {text, ""};
  return {text.substr(0, found), text.substr(found + separator.size())};
}

}  // namespace gateway_fuzz
