#include "gateway/core/reply_reader.h"

#include "gateway/core/decimal.h"

namespace {

constexpr std::string_view kGatewayError = "[GATEWAY]error";
constexpr std::string_view kBrokerTimeout = "[BROKER]timeout";

constexpr TagKey kOpening = MakeTagKey("00");
constexpr TagKey kClosing = MakeTagKey("01");

bool StartsWith(std::string_view text, std::string_view start) {
  return text.size() >= start.size() && memcmp(text.data(), start.data(), start.size()) == 0;
}

std::string_view Slice(const char* from, const char* to) {
  return {from, static_cast<size_t>(to - from)};
}

// Whether the bar at `bar` opens the field that ends a record: a record stops before that bar, so
// the record's last field is not closed by it.
bool ClosesRecord(const char* bar, const CTagReader& tags) {
  return tags.KeyBehind(bar) == kClosing;
}

bool IsSkippable(std::string_view value, bool closed) {
  return closed && (value.empty() || value == " ");
}

}  // namespace

Transport JudgeTransport(std::string_view reply) {
  if (reply.empty()) return Transport::kBrokerDown;
  const char* const end = reply.data() + reply.size();
  Transport found = Transport::kOk;
  for (const char* at = reply.data();; ++at) {
    at = static_cast<const char*>(memchr(at, '[', static_cast<size_t>(end - at)));
    if (at == nullptr) return found;
    if (StartsWith(Slice(at, end), kGatewayError)) return Transport::kGatewayDown;
    if (StartsWith(Slice(at, end), kBrokerTimeout)) found = Transport::kBrokerDown;
  }
}

std::string_view FindField(std::string_view text, std::string_view tag, Blanks blanks) {
  CBarScanner bars(text.data(), text.size());
  const char* bar = bars.Next();
  while (bar != bars.End()) {
    const char* const field = bar + 1;
    bar = bars.Next();
    const std::string_view whole = Slice(field, bar);
    if (!StartsWith(whole, tag) || whole.size() == tag.size() || field[tag.size()] != '=') continue;
    const std::string_view value = Slice(field + tag.size() + 1, bar);
    if (blanks == Blanks::kSkipped && IsSkippable(value, bar != bars.End())) continue;
    return value;
  }
  return {};
}

int32_t CRecord::Number(int field) const {
  return ReadInt32(Text(field));
}

bool CRecordWalker::Next(CRecord& record) {
  CBarScanner bars = m_bars;  // copies of this function's own stay in registers
  const CTagReader keys = m_tags;
  const char* bar = m_pBar;
  const char* const end = bars.End();
  const char* opening = nullptr;
  const char* closing = nullptr;
  while (opening == nullptr && closing == nullptr && bar != end) {
    const char* const start = bar;
    bar = bars.Next();
    const TagKey key = keys.KeyBehind(start);
    if (key == kOpening) opening = start;
    if (key == kClosing) closing = start;
  }
  const CTagTable& tags = record.m_tags;
  const uint64_t skips = tags.Skips();
  uint64_t present = 0;
  while (opening != nullptr && Mostly(bar != end)) {
    const char* const start = bar;
    bar = bars.Next();
    const TagKey key = keys.KeyBehind(start);
    const int row = tags.Find(key);
    if (Rarely(row == CTagTable::kNone)) {
      if (key != kClosing) continue;
      closing = start;
      break;
    }
    const std::string_view value = Slice(start + 1 + TagSize(key), bar);
    if (Rarely(((present | skips) >> row & 1) != 0)) {
      if ((present >> row & 1) != 0 || IsSkippable(value, !ClosesRecord(bar, keys))) continue;
    }
    record.m_values[static_cast<uint8_t>(row)] = value;
    present |= uint64_t{1} << row;
  }
  const bool whole = opening != nullptr && closing != nullptr;
  record.m_bEmpty = !whole || static_cast<size_t>(closing - opening) >= m_nBound;
  record.m_nPresent = record.m_bEmpty ? 0 : present;
  m_bars = bars;
  m_pBar = bar;
  return closing != nullptr;
}
