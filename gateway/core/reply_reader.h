// Reading a gateway reply: one line of fields, "tag=value" separated by '|'. A field counts only
// behind a '|'. Records run from the field "00" to the next field "01".
//
// Nothing here copies: values are slices of the reply, which outlives them.
#ifndef QUORVANE_GATEWAY_CORE_REPLY_READER_H_
#define QUORVANE_GATEWAY_CORE_REPLY_READER_H_

#include <cstddef>
#include <cstdint>
#include <string_view>

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

// The tags that one decoder reads from its records, numbered by their place in the table: declare
// an enum of meanings in the same order. At most kMaxTags.
class CTagTable {
 public:
  static constexpr size_t kMaxTags = 32;
  static constexpr int kNone = -1;

  template <size_t N>
  constexpr explicit CTagTable(const TagRow (&rows)[N]) {
    static_assert(N <= kMaxTags, "a table holds at most kMaxTags tags");
    for (size_t row = 0; row < N; ++row) {
      m_skips[row] = rows[row].blanks == Blanks::kSkipped;
      size_t place = Place(Key(rows[row].tag));
      while (m_entries[place].key != 0) place = (place + 1) % kPlaces;
      m_entries[place].key = Key(rows[row].tag);
      m_entries[place].row = static_cast<int>(row);
    }
  }

  // The row of the tag with this key, or kNone.
  int Find(uint32_t key) const {
    size_t place = Place(key);
    while (m_entries[place].key != 0) {
      if (m_entries[place].key == key) return m_entries[place].row;
      place = (place + 1) % kPlaces;
    }
    return kNone;
  }

  bool SkipsBlanks(int row) const { return m_skips[row]; }

  // A tag and its '=' as a number, first character lowest; the text has 2 or 3 characters.
  static constexpr uint32_t Key(const char* tag) {
    uint32_t key = Byte(tag[0]) | Byte(tag[1]) << 8;
    if (tag[2] == '\0') return key | Byte('=') << 16;
    return key | Byte(tag[2]) << 16 | Byte('=') << 24;
  }

  // The key of the field that starts at `field` and ends at `end`, 0 when its tag has another
  // length; `tagSize` is then the number of characters before the '='.
  static uint32_t KeyOfField(const char* field, const char* end, size_t& tagSize) {
    const auto size = static_cast<size_t>(end - field);
    if (size >= 3 && field[2] == '=') {
      tagSize = 2;
      return Byte(field[0]) | Byte(field[1]) << 8 | Byte('=') << 16;
    }
    if (size >= 4 && field[3] == '=') {
      tagSize = 3;
      return Byte(field[0]) | Byte(field[1]) << 8 | Byte(field[2]) << 16 | Byte('=') << 24;
    }
    return 0;
  }

 private:
  static constexpr size_t kPlaces = 128;  // sparse, so that a look-up meets its tag at once

  struct Entry {
    uint32_t key = 0;
    int row = kNone;
  };

  static constexpr uint32_t Byte(char c) { return static_cast<unsigned char>(c); }

  static constexpr size_t Place(uint32_t key) { return (key * 0x9e3779b1U) >> 25; }

  Entry m_entries[kPlaces] = {};
  bool m_skips[kMaxTags] = {};
};

// One record's fields, indexed once. A tag that stands several times counts where it stands first.
class CRecord {
 public:
  explicit CRecord(const CTagTable& tags) : m_tags(tags) {}

  // No record was there, or one that does not fit the record buffer.
  bool Empty() const { return m_bEmpty; }

  // Whether the field is there and not empty, even if its value is too long to be read.
  bool Has(int row) const { return (m_nPresent >> row & 1) != 0 && m_values[row].size() > 0; }

  // The value as a buffer of `bound` bytes holds it; empty when absent or dropped.
  std::string_view Text(int row, size_t bound) const {
    if ((m_nPresent >> row & 1) == 0) return {};
    return Bounded(m_values[row], bound);
  }

  // The value's decimal number, 0 when absent or dropped.
  int32_t Number(int row, size_t bound) const;

 private:
  friend class CRecordWalker;

  void Clear();
  void Index(const char* field, const char* end, const char* replyEnd);

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
      : m_pAt(reply.data()), m_pEnd(reply.data() + reply.size()), m_nBound(bound) {}

  // Indexes the next record. A closing field before any opening one, like a dropped record, gives
  // an empty record. Returns false, with an empty record, when no complete record is left.
  bool Next(CRecord& record);

 private:
  const char* m_pAt;
  const char* m_pEnd;
  size_t m_nBound;
};

#endif  // QUORVANE_GATEWAY_CORE_REPLY_READER_H_
