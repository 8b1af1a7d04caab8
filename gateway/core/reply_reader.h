// Reading a gateway reply: one line of fields, "tag=value" separated by '|'. A field counts only
// behind a '|'. Records run from the field "00" to the next field "01".
//
// Nothing here copies: values are slices of the reply, which outlives them.
#ifndef QUORVANE_GATEWAY_CORE_REPLY_READER_H_
#define QUORVANE_GATEWAY_CORE_REPLY_READER_H_

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "gateway/core/byte_scan.h"

// What the reply itself says of the transport.
enum class Transport { kOk, kGatewayDown, kBrokerDown };

// A gateway error or a broker time-out marker anywhere in the reply, or an empty reply.
Transport JudgeTransport(std::string_view reply);

// Blank skipping passes over a field that is closed by a '|' and empty or a single blank.
enum class Blanks { kTaken, kSkipped };

// The value of the first field `tag` in `text`, empty when there is none.
std::string_view FindField(std::string_view text, std::string_view tag, Blanks blanks);

// A value as a buffer of `bound` bytes (terminator included) would hold it: one that does not fit
// is dropped, never cut.
inline std::string_view Bounded(std::string_view value, size_t bound) {
  return value.size() < bound ? value : std::string_view();
}

// One row of a decoder's tag table: a tag of two or three characters, and how its field is read.
struct TagRow {
  const char* tag;
  Blanks blanks = Blanks::kTaken;
};

// A tag and its '=' as a number, first character lowest, so that a field is told by one comparison.
using TagKey = uint32_t;
inline constexpr TagKey kNoTag = 0;

constexpr TagKey MakeTagKey(char first, char second, char third, char fourth = '\0') {
  const char chars[] = {first, second, third, fourth};
  TagKey key = 0;
  for (int i = 0; i < 4; ++i) key |= TagKey{static_cast<unsigned char>(chars[i])} << (8 * i);
  return key;
}

constexpr TagKey MakeTagKey(const char* tag) {
  return tag[2] == '\0' ? MakeTagKey(tag[0], tag[1], '=') : MakeTagKey(tag[0], tag[1], tag[2], '=');
}

// The key of four characters at once.
inline TagKey LoadTagKey(const char* chars) {
  TagKey key;
  memcpy(&key, chars, sizeof key);
#if __BYTE_ORDER__ != __ORDER_LITTLE_ENDIAN__
  key = __builtin_bswap32(key);
#endif
  return key;
}

// Tells the fields of a reply by their keys. Reads nothing behind the reply.
class CTagReader {
 public:
  CTagReader(const char* reply, const char* replyEnd)
      : m_pEnd(replyEnd), m_pLong(replyEnd - reply < 4 ? reply : replyEnd - 4) {}

  // The key of the field behind `bar`; kNoTag when it has no tag of two or three characters. A
  // shorter field gives a key with a '|' in it, which is no tag's.
  TagKey KeyBehind(const char* bar) const {
    if (Mostly(bar < m_pLong)) {
      const TagKey key = LoadTagKey(bar + 1);
      if (Mostly((key >> 16 & 0xff) == '=')) return key & kShortTag;
      return key >> 24 == '=' ? key : kNoTag;
    }
    return m_pEnd - bar == 4 && bar[3] == '=' ? MakeTagKey(bar[1], bar[2], '=') : kNoTag;
  }

  // The same of a field whose tag has two characters; any other key says no more than that.
  TagKey ShortKeyBehind(const char* bar) const {
    return Mostly(bar < m_pLong) ? LoadTagKey(bar + 1) & kShortTag : KeyBehind(bar);
  }

 private:
  static constexpr TagKey kShortTag = 0x00ffffff;

  const char* m_pEnd;
  const char* m_pLong;  // four characters follow any bar before it
};

// Number of characters before the value of a field with this key.
constexpr size_t TagSize(TagKey key) {
  return key >> 24 == 0 ? 3 : 4;
}

// The tags that one decoder reads from its records, numbered by their place in the table: declare
// an enum of meanings in the same order. At most kMaxTags.
class CTagTable {
 public:
  static constexpr size_t kMaxTags = 32;
  static constexpr int kNone = -1;

  template <size_t N>
  constexpr explicit CTagTable(const TagRow (&rows)[N]) {
    static_assert(N <= kMaxTags, "a table holds at most kMaxTags tags");
    while (!Place(rows, N)) m_nFactor = m_nFactor * 747796405 + 2;  // odd, and far from the last
  }

  // The row of the tag with this key, or kNone.
  ALWAYS_INLINE constexpr int Find(TagKey key) const {
    const size_t place = PlaceOf(key);
    return m_keys[place] == key ? m_rows[place] : kNone;
  }

  // The rows that skip blanks, bit per row.
  uint32_t Skips() const { return m_nSkips; }

 private:
  static constexpr size_t kPlaces = 128;

  constexpr size_t PlaceOf(TagKey key) const { return key * m_nFactor >> 25; }

  // Whether every tag found a place of its own with the present factor.
  constexpr bool Place(const TagRow* rows, size_t count) {
    for (TagKey& key : m_keys) key = kVacant;
    for (size_t row = 0; row < count; ++row) {
      const TagKey key = MakeTagKey(rows[row].tag);
      const size_t place = PlaceOf(key);
      if (m_keys[place] != kVacant) return false;
      m_keys[place] = key;
      m_rows[place] = static_cast<uint8_t>(row);
      if (rows[row].blanks == Blanks::kSkipped) m_nSkips |= 1U << row;
    }
    return true;
  }

  static constexpr TagKey kVacant = 0xffffffff;  // no field has this key

  TagKey m_keys[kPlaces] = {};
  uint8_t m_rows[kPlaces] = {};
  uint32_t m_nFactor = 0x9e3779b1;
  uint32_t m_nSkips = 0;
};

// One record's fields, indexed once. A tag that stands several times counts where it stands first.
class CRecord {
 public:
  explicit CRecord(const CTagTable& tags) : m_tags(tags) {}

  // No record was there, or one that does not fit the record buffer.
  bool Empty() const { return m_bEmpty; }

  // Whether the field is there and not empty, even if its value is too long to be read.
  bool Has(int row) const { return (m_nPresent >> row & 1) != 0 && !m_values[row].empty(); }

  // The value as a buffer of `bound` bytes holds it; empty when absent or dropped.
  std::string_view Text(int row, size_t bound) const {
    if ((m_nPresent >> row & 1) == 0) return {};
    return Bounded(m_values[row], bound);
  }

  // The value's decimal number, 0 when absent or dropped.
  int32_t Number(int row, size_t bound) const;

 private:
  friend class CRecordWalker;

  const CTagTable& m_tags;
  bool m_bEmpty = true;
  uint32_t m_nPresent = 0;  // bit per row; values of other rows are not valid
  std::string_view m_values[CTagTable::kMaxTags];
};

// Cuts a reply into its records, in one pass over the reply whatever the order of the markers.
class CRecordWalker {
 public:
  // `bound` is the size of the record buffer: a record of that many characters or more is dropped
  // and comes out empty.
  CRecordWalker(std::string_view reply, size_t bound)
      : m_bars(reply.data(), reply.size()),
        m_tags(reply.data(), reply.data() + reply.size()),
        m_pBar(m_bars.Next()),
        m_nBound(bound) {}

  // Indexes the next record. A closing field before any opening one, like a dropped record, gives
  // an empty record. Returns false, with an empty record, when no complete record is left.
  bool Next(CRecord& record);

 private:
  CBarScanner m_bars;
  CTagReader m_tags;
  const char* m_pBar;  // the first bar that was not looked behind
  size_t m_nBound;
};

#endif  // QUORVANE_GATEWAY_CORE_REPLY_READER_H_
