#include "tests/fuzz/plain_reader.h"

namespace gateway_fuzz {

std::string PlainBounded(const std::string& value, size_t bound) {
  return value.size() < bound ? value : std::string();
}

TPlainToken PlainToken(const std::string& tag, const std::string& reply, size_t bound,
                       bool skipBlank) {
  const std::string pattern = "|" + tag + "=";
  size_t from = 0;
  for (;;) {
    const size_t found = reply.find(pattern, from);
    if (found == std::string::npos) return {};
    const size_t begin = found + pattern.size();
    const size_t end = reply.find('|', begin);
    const bool closed = end != std::string::npos;
    const std::string value = reply.substr(begin, closed ? end - begin : std::string::npos);
    if (skipBlank && closed && (value.empty() || value == " ")) {
      from = end;
      continue;
    }
    return {PlainBounded(value, bound), value.size()};
  }
}

TPlainRecord PlainRecord(const std::string& reply, size_t pos, size_t bound) {
  const size_t opening = reply.find("|00=", pos);
  const size_t closing = reply.find("|01=", pos);
  if (opening == std::string::npos || closing == std::string::npos) return {"", reply.size()};
  if (closing < opening) return {"", closing + 1};
  return {PlainBounded(reply.substr(opening, closing - opening), bound), closing + 1};
}

std::vector<std::string> PlainRecords(const std::string& reply, size_t bound) {
  std::vector<std::string> records;
  size_t pos = 0;
  for (;;) {
    const size_t closing = reply.find("|01=", pos);
    if (closing == std::string::npos) return records;
    const size_t opening = reply.find("|00=", pos);
    const bool opened = opening != std::string::npos && opening < closing;
    records.push_back(opened ? PlainBounded(reply.substr(opening, closing - opening), bound) : "");
    pos = closing + 1;
  }
}

EPlainTransport PlainTransport(const std::string& reply) {
  if (reply.find("[GATEWAY]error") != std::string::npos) return EPlainTransport::kGatewayDown;
  if (reply.empty() || reply.find("[BROKER]timeout") != std::string::npos) {
    return EPlainTransport::kBrokerDown;
  }
  return EPlainTransport::kOk;
}

TPlainField PlainField(const std::string& text, const std::string& separator) {
  const size_t found = text.find(separator);
  if (found == std::string::npos) return {text, ""};
  return {text.substr(0, found), text.substr(found + separator.size())};
}

}  // namespace gateway_fuzz
