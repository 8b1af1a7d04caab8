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
bool ClosesRecord(const char* bar, const char* replyEnd) {
  return bar != replyEnd && TagKeyOf(bar + 1, replyEnd) == kClosing;
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

int32_t CRecord::Number(int row, size_t bound) const {
  return ReadInt32(Text(row, bound));
}

inline void CRecord::Index(TagKey key, const char* field, const char* end, const char* replyEnd) {
  const int row = m_tags.Find(key);
  if (row == CTagTable::kNone || (m_nPresent >> row & 1) != 0) return;
  const std::string_view value = Slice(field + TagSize(key), end);
  if (m_tags.SkipsBlanks(row) && IsSkippable(value, !ClosesRecord(end, replyEnd))) return;
  m_values[row] = value;
  m_nPresent |= 1U << row;
}

bool CRecordWalker::Next(CRecord& record) {
  CBarScanner bars = m_bars;  // a copy of this function's own stays in registers
  const char* bar = m_pBar;
  const char* opening = nullptr;
  bool closed = false;
  record.Clear();
  while (!closed && bar != bars.End()) {
    const char* const start = bar;
    const char* const field = start + 1;
    bar = bars.Next();
    const TagKey key = TagKeyOf(field, bar);
    if (key == kClosing) {
      closed = true;
      record.m_bEmpty = opening == nullptr || static_cast<size_t>(start - opening) >= m_nBound;
    } else if (opening != nullptr) {
      record.Index(key, field, bar, bars.End());
    } else if (key == kOpening) {
      opening = start;
    }
  }
  if (record.m_bEmpty) record.Clear();
  m_bars = bars;
  m_pBar = bar;
  return closed;
}
