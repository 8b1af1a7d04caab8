// What the replies that list something have in common, whatever their records hold:
//
//   reply    record* end
//   record   |00=...|67=sequence|68=code|M2=refusal|...|01=
//   end      a record whose sequence is the end mark, or no further complete record: a reply that
//            was cut short ends its list with what there is
//
// The first record's code speaks for the reply: data, no data, or a refusal.
#ifndef QUORVANE_GATEWAY_CORE_LIST_FRAME_H_
#define QUORVANE_GATEWAY_CORE_LIST_FRAME_H_

#include "gateway/core/reply_reader.h"

// The rows that every list's tag table begins with: {"67"}, {"68"}, {"M2"}. A list numbers its own
// tags from kOwnFields on.
enum ListField { kListSequence, kListCode, kListMessage, kOwnFields };

constexpr bool OpensListTable(const CTagTable& tags) {
  return tags.Find(MakeTagKey("67")) == kListSequence && tags.Find(MakeTagKey("68")) == kListCode &&
         tags.Find(MakeTagKey("M2")) == kListMessage;
}

// What a list lays down for its frame: sizes of buffers in bytes, and where it ends.
struct ListShape {
  size_t record;    // of one record; a longer one reads as empty
  size_t sequence;  // of tag 67
  size_t code;      // of tag 68
  size_t message;   // of tag M2, read where the reply is refused
  bool endsAtEmptyRecord = false;
  int endMark = 900000;  // the lowest sequence that is no record's
};

enum class ListVerdict { kData, kNoData, kRefused };

// Walks the records of one list reply:
//
//   CReplyList list(reply, kTags, kShape);   // holds the first record
//   if (list.Verdict() ...)                  // where the first record speaks for the reply
//   while (list.NextData()) ...Record()...
class CReplyList {
 public:
  // `tags` satisfies OpensListTable; the reply, `tags` and `shape` outlive the list.
  CReplyList(std::string_view reply, const CTagTable& tags, const ListShape& shape)
      : m_walker(reply, shape.record), m_record(tags), m_shape(shape) {
    m_bFound = m_walker.Next(m_record);
  }

  // The first record's judgement, code and message; ask before the walk. Without a first record
  // the reply counts as refused, with no code.
  ListVerdict Verdict() const {
    if (Code() == "0000") return ListVerdict::kData;
    return Code() == "5001" ? ListVerdict::kNoData : ListVerdict::kRefused;
  }
  std::string_view Code() const { return m_record.Text(kListCode, m_shape.code); }
  std::string_view Message() const { return m_record.Text(kListMessage, m_shape.message); }

  // Goes on to the next record, at the start to the first. False at the end of the list, for good.
  bool Next() {
    if (m_bStarted && m_bFound) m_bFound = m_walker.Next(m_record);
    m_bStarted = true;
    if (m_record.Number(kListSequence, m_shape.sequence) >= m_shape.endMark) m_bFound = false;
    if (m_shape.endsAtEmptyRecord && m_record.Empty()) m_bFound = false;
    return m_bFound;
  }

  // As Next, passing over the records that carry no data.
  bool NextData() {
    while (Next()) {
      if (Code() == "0000") return true;
    }
    return false;
  }

  const CRecord& Record() const { return m_record; }

 private:
  CRecordWalker m_walker;
  CRecord m_record;
  const ListShape& m_shape;
  bool m_bFound;
  bool m_bStarted = false;
};

#endif  // QUORVANE_GATEWAY_CORE_LIST_FRAME_H_
