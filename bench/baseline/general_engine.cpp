#include "bench/baseline/general_engine.h"

#include <quickfix/Message.h>

namespace bench {
namespace {

constexpr char kEnd = '\001';  // closes a field of the engine's format

// Fields of the user's own begin at 5000, so that none is taken for one of the engine's header.
std::string NumericTag(const std::string& tag) {
  const bool digits = tag.find_first_not_of("0123456789") == std::string::npos;
  if (digits) return std::to_string(5000 + std::stoi(tag));
  return std::to_string(10000 + 256 * tag.front() + tag.back());
}

std::string Frame(const std::string& body) {
  const std::string typed = std::string("35=8") + kEnd + "34=1" + kEnd + "49=GATEWAY" + kEnd +
                            "52=20240115-05:45:21" + kEnd + "56=APP" + kEnd + body;
  std::string message =
      std::string("8=FIX.4.2") + kEnd + "9=" + std::to_string(typed.size()) + kEnd + typed;
  unsigned sum = 0;
  for (char c : message) sum += static_cast<unsigned char>(c);
  char trailer[8];
  snprintf(trailer, sizeof trailer, "10=%03u", sum % 256);
  return message + trailer + kEnd;
}

}  // namespace

std::vector<std::string> EngineMessages(const std::string& reply) {
  std::vector<std::string> messages;
  std::string body;
  for (size_t at = reply.find('|'); at != std::string::npos;) {
    const size_t next = reply.find('|', at + 1);
    const std::string field = reply.substr(at + 1, next - at - 1);
    const size_t equals = field.find('=');
    const std::string tag = field.substr(0, equals);
    const std::string value = field.substr(equals + 1);
    if (tag == "01") {
      messages.push_back(Frame(body));
      body.clear();
    } else if (!value.empty()) {  // the format has no empty values
      body.append(NumericTag(tag)).append("=").append(value).push_back(kEnd);
    }
    at = next;
  }
  return messages;
}

size_t ParseByEngine(const std::vector<std::string>& messages) {
  size_t fields = 0;
  for (const std::string& text : messages) {
    const FIX::Message message(text, false);
    fields += static_cast<size_t>(message.totalFields());
  }
  return fields;
}

}  // namespace bench
