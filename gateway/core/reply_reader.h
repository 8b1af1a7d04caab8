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

// Result codes, in tag 68: done, and done with nothing to show. Any other is a refusal.
inline constexpr std::string_view kDoneCode = "0000";
inline constexpr std::string_view kNoDataCode = "5001";

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

// The bounds of a value that nothing bounds, and of one that a record has and its decoder leaves.
inline constexpr uint32_t kUnbounded = UINT32_MAX;
inline constexpr uint32_t kNotRead = 0;

// A field that a decoder reads from the whole reply: its tag and the bound of its value.
struct ReplyField {
  const char* tag;
  uint32_t bound;
  Blanks blanks = Blanks::kTaken;
};

// The field's value, empty when it is absent or does not fit.
inline std::string_view ReadField(std::string_view reply, const ReplyField& field) {
  return Bounded(FindField(reply, field.tag, field.blanks), field.bound);
}

// One row of a decoder's tag table: a field of its records by its number in the decoder's enum, its
// tag of two or three characters, and the bound of its value.
struct TagRow {
  int field;
  const char* tag;
  uint32_t bound;
  Blanks blanks = Blanks::kTaken;
};

// Whether every row stands in the place that its field's number names.
template <size_t kRows>
constexpr bool AreInFieldOrder(const TagRow (&rows)[kRows]) {
  for (size_t i = 0; i < kRows; ++i) {
    if (rows[i].field != static_cast<int>(i)) return false;
  }
  return true;
}

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

 private:
  static constexpr TagKey kShortTag = 0x00ffffff;

  const char* m_pEnd;
  const char* m_pLong;  // four characters follow any bar before it
};

// Number of characters before the value of a field with this key.
constexpr size_t TagSize(TagKey key) {
  return key >> 24 == 0 ? 3 : 4;
}

// The fields that one decoder reads from its records. Declare an enum of the fields and a row for
// each, in the same order: another order does not build, nor does a tag that stands twice.
class CTagTable {
 public:
  static constexpr size_t kMaxTags = 36;  // more cost read-only data in each decoder
  static constexpr int kNone = -1;

  template <size_t kRows>
  constexpr explicit CTagTable(const TagRow (&rows)[kRows]) {
    static_assert(kRows <= kMaxTags, "a table holds at most kMaxTags tags");
    if (!AreInFieldOrder(rows)) RowsAreNotInFieldOrder();
    for (size_t row = 0; row < kRows; ++row) {
      m_keys[row] = MakeTagKey(rows[row].tag);
      m_bounds[row] = rows[row].bound;
      if (rows[row].blanks == Blanks::kSkipped) m_nSkips |= uint64_t{1} << row;
    }
    while (!HaveOwnPlaces(kRows)) m_nFactor = m_nFactor * 747796405 + 2;  // odd, far from the last
    for (uint8_t& row : m_rows) row = kMaxTags;
    m_keys[kMaxTags] = kVacant;
    for (size_t row = 0; row < kRows; ++row) {
      m_rows[PlaceOf(m_keys[row])] = static_cast<uint8_t>(row);
    }
  }

  // The row of the tag with this key, or kNone.
  constexpr int Find(TagKey key) const {
    const int row = m_rows[PlaceOf(key)];
    return m_keys[row] == key ? row : kNone;
  }

  uint32_t BoundOf(int row) const { return m_bounds[row]; }

  // The rows that skip blanks, bit per row.
  uint64_t Skips() const { return m_nSkips; }

 private:
  static constexpr size_t kPlaces = 128;
  static constexpr TagKey kVacant = 0xffffffff;  // no field has this key

  // Never defined: a constant table cannot call it.
  static void RowsAreNotInFieldOrder();

  constexpr size_t PlaceOf(TagKey key) const { return key * m_nFactor >> 25; }

  // Whether the present factor gives each of the first `count` keys a place of its own.
  constexpr bool HaveOwnPlaces(size_t count) const {
    uint64_t taken[kPlaces / 64] = {};
    for (size_t row = 0; row < count; ++row) {
      const size_t place = PlaceOf(m_keys[row]);
      const uint64_t bit = uint64_t{1} << place % 64;
      if ((taken[place / 64] & bit) != 0) return false;
      taken[place / 64] |= bit;
    }
    return true;
  }

  uint8_t m_rows[kPlaces] = {};      // by place; kMaxTags where no tag has it
  TagKey m_keys[kMaxTags + 1] = {};  // by row; the last is nobody's
  uint32_t m_bounds[kMaxTags] = {};
  uint64_t m_nSkips = 0;
  uint32_t m_nFactor = 0x9e3779b1;
};

// One record's fields, indexed once. A tag that stands several times counts where it stands first.
class CRecord {
 public:
  explicit CRecord(const CTagTable& tags) : m_tags(tags) {}

  // No record was there, or one that does not fit the record buffer.
  bool Empty() const { return m_bEmpty; }

  // Whether the field is there and not empty, even if its value is too long to be read.
  bool Has(int field) const { return (m_nPresent >> field & 1) != 0 && !m_values[field].empty(); }

  // The value as its row bounds it; empty when absent or dropped.
  std::string_view Text(int field) const {
    if ((m_nPresent >> field & 1) == 0) return {};
    return Bounded(m_values[field], m_tags.BoundOf(field));
  }

  // The value's decimal number, 0 when absent or dropped.
  int32_t Number(int field) const;

 private:
  friend class CRecordWalker;

  const CTagTable& m_tags;
  bool m_bEmpty = true;
  uint64_t m_nPresent = 0;  // bit per row; values of other rows are not valid
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
