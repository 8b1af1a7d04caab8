// What the replies that list something have in common, whatever their records hold:
//
//   reply    record* end
//   record   |00=...|67=sequence|68=code|M2=refusal|...|01=
//   end      a record whose sequence is the end mark, or no further complete record: a reply that
//            was cut short ends its list with what there is
//
// In most lists the first record's code speaks for the reply: data, no data, or a refusal. The
// lists of accounts, and those of futures fills and positions, ask the reply as a whole.
#ifndef QUORVANE_GATEWAY_CORE_LIST_FRAME_H_
#define QUORVANE_GATEWAY_CORE_LIST_FRAME_H_

#include "gateway/core/reply_reader.h"

// The rows that every list's tag table begins with; a list numbers its own fields from kOwnFields
// on.
enum ListField { kSequence, kResultCode, kMessage, kOwnFields };

// What a list lays down for its frame.
struct ListShape {
  size_t record;  // size of the record buffer: a longer record reads as empty
  bool endsAtEmptyRecord = false;
  int endMark = 900000;  // the lowest sequence that is no record's
};

// The tag table of a list: one that does not begin with the rows of the frame does not build.
class CListTable : public CTagTable {
 public:
  template <size_t kRows>
  constexpr CListTable(const TagRow (&rows)[kRows], const ListShape& shape)
      : CTagTable(rows), m_shape(shape) {
    if (!OpensList(*this)) RowsDoNotOpenAList();
  }

  static constexpr bool OpensList(const CTagTable& tags) {
    return tags.Find(MakeTagKey("67")) == kSequence && tags.Find(MakeTagKey("68")) == kResultCode &&
           tags.Find(MakeTagKey("M2")) == kMessage;
  }

  const ListShape& Shape() const { return m_shape; }

 private:
  static void RowsDoNotOpenAList();  // never defined, as the one of CTagTable

  ListShape m_shape;
};

enum class ListVerdict { kData, kNoData, kRefused };

// Walks the records of one list reply:
//
//   CReplyList list(reply, kTags);   // holds the first record
//   if (list.Verdict() ...)          // where the first record speaks for the reply
//   while (list.NextData()) ...Record()...
class CReplyList {
 public:
  // The reply and `tags` outlive the list.
  CReplyList(std::string_view reply, const CListTable& tags)
      : m_walker(reply, tags.Shape().record), m_record(tags), m_shape(tags.Shape()) {
    m_bFound = m_walker.Next(m_record);
  }

  // The first record's judgement, code and message; ask before the walk. Without a first record
  // the reply counts as refused, with no code.
  ListVerdict Verdict() const {
    if (Code() == kDoneCode) return ListVerdict::kData;
    return Code() == kNoDataCode ? ListVerdict::kNoData : ListVerdict::kRefused;
  }
  std::string_view Code() const { return m_record.Text(kResultCode); }
  std::string_view Message() const { return m_record.Text(kMessage); }

  // Goes on to the next record, at the start to the first. False at the end of the list, for good.
  bool Next() {
    if (m_bStarted && m_bFound) m_bFound = m_walker.Next(m_record);
    m_bStarted = true;
    if (m_record.Number(kSequence) >= m_shape.endMark) m_bFound = false;
    if (m_shape.endsAtEmptyRecord && m_record.Empty()) m_bFound = false;
    return m_bFound;
  }

  // As Next, passing over the records that carry no data.
  bool NextData() {
    while (Next()) {
      if (Code() == kDoneCode) return true;
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
