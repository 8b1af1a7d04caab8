#include "gateway/core/reply_reader.h"

#include "gateway/core/byte_scan.h"
#include "gateway/core/decimal.h"

namespace {

constexpr std::string_view kGatewayError = "[GATEWAY]error";
constexpr std::string_view kBrokerTimeout = "[BROKER]timeout";

constexpr uint32_t kOpening = CTagTable::Key("00");
constexpr uint32_t kClosing = CTagTable::Key("01");

bool StartsWith(std::string_view text, std::string_view start) {
  return text.size() >= start.size() && memcmp(text.data(), start.data(), start.size()) == 0;
}

std::string_view Slice(const char* from, const char* to) {
  return {from, static_cast<size_t>(to - from)};
}

// Whether the bar at `bar` opens the field that ends a record: a record stops before that bar, so
// the record's last field is not closed by it.
bool ClosesRecord(const char* bar, const char* replyEnd) {
  size_t tagSize = 0;
  return bar != replyEnd && CTagTable::KeyOfField(bar + 1, replyEnd, tagSize) == kClosing;
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
  const char* const end = text.data() + text.size();
  const char* bar = FindBar(text.data(), end);
  while (bar != end) {
    const char* const field = bar + 1;
    bar = FindBar(field, end);
    const std::string_view whole = Slice(field, bar);
    if (!StartsWith(whole, tag) || whole.size() == tag.size() || field[tag.size()] != '=') continue;
    const std::string_view value = Slice(field + tag.size() + 1, bar);
    if (blanks == Blanks::kSkipped && IsSkippable(value, bar != end)) continue;
    return value;
  }
  return {};
}

int32_t CRecord::Number(int row, size_t bound) const {
  return ReadInt32(Text(row, bound));
}

void CRecord::Clear() {
  m_nPresent = 0;
  m_bEmpty = true;
}

void CRecord::Index(const char* field, const char* end, const char* replyEnd) {
  size_t tagSize = 0;
  const int row = m_tags.Find(CTagTable::KeyOfField(field, end, tagSize));
  if (row == CTagTable::kNone || (m_nPresent >> row & 1) != 0) return;
  const std::string_view value = Slice(field + tagSize + 1, end);
  if (m_tags.SkipsBlanks(row) && IsSkippable(value, !ClosesRecord(end, replyEnd))) return;
  m_values[row] = value;
  m_nPresent |= 1U << row;
}

bool CRecordWalker::Next(CRecord& record) {
  record.Clear();
  const char* opening = nullptr;
  const char* bar = FindBar(m_pAt, m_pEnd);
  while (bar != m_pEnd) {
    const char* const start = bar;
    const char* const field = bar + 1;
    bar = FindBar(field, m_pEnd);
    size_t tagSize = 0;
    const uint32_t key = CTagTable::KeyOfField(field, bar, tagSize);
    if (key == kClosing) {
      m_pAt = field;
      const bool fits = opening != nullptr && static_cast<size_t>(start - opening) < m_nBound;
      if (!fits) record.Clear();
      record.m_bEmpty = !fits;
      return true;
    }
    if (opening != nullptr) record.Index(field, bar, m_pEnd);
    if (key == kOpening && opening == nullptr) opening = start;
  }
  m_pAt = m_pEnd;
  record.Clear();
  return false;
}
