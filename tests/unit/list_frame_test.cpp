// The frame of list replies: the first record's verdict, the walk and its end.

#include "gateway/core/list_frame.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace gateway_tests {
namespace {

enum Field { kName = kOwnFields };

constexpr TagRow kRows[] = {
    {kSequence, "67", 8}, {kResultCode, "68", 6}, {kMessage, "M2", 10}, {kName, "46", 60}};
constexpr TagRow kSwappedTags[] = {
    {kSequence, "68", 8}, {kResultCode, "67", 6}, {kMessage, "M2", 10}};
constexpr TagRow kNoMessage[] = {{kSequence, "67", 8}, {kResultCode, "68", 6}, {2, "46", 10}};

// Whether a constant table of these rows builds.
template <const auto& kTable, int = (static_cast<void>(CListTable(kTable, {60})), 0)>
constexpr bool Builds(int) {
  return true;
}
template <const auto& kTable>
constexpr bool Builds(...) {
  return false;
}

static_assert(Builds<kRows>(0));
static_assert(!Builds<kSwappedTags>(0));
static_assert(!Builds<kNoMessage>(0));

constexpr CListTable kTags(kRows, {60});
constexpr CListTable kToEmpty(kRows, {60, true});
constexpr CListTable kToLaterEnd(kRows, {60, false, 900001});

std::string Record(const std::string& sequence, const std::string& code, const std::string& name) {
  return "|00=|67=" + sequence + "|68=" + code + "|46=" + name + "|01=";
}

struct VerdictCase {
  const char* label;
  std::string reply;
  ListVerdict verdict;
  std::string code, message;
};

TEST(ListFrame, FirstRecordSpeaksForTheReply) {
  const VerdictCase rows[] = {
      {"data", Record("1", "0000", "a"), ListVerdict::kData, "0000", ""},
      {"no data", Record("1", "5001", ""), ListVerdict::kNoData, "5001", ""},
      {"refused", "|00=|68=E001|M2=closed|01=", ListVerdict::kRefused, "E001", "closed"},
      {"a longer code", Record("1", "00000", ""), ListVerdict::kRefused, "00000", ""},
      {"a code with a blank", Record("1", " 0000", ""), ListVerdict::kRefused, " 0000", ""},
      {"a code that fills its buffer", Record("1", "500100", ""), ListVerdict::kRefused, "", ""},
      {"an empty code", "|00=|68=|M2=closed|01=", ListVerdict::kRefused, "", "closed"},
      {"no code", "|00=|M2=closed|01=", ListVerdict::kRefused, "", "closed"},
      {"a message of the longest size", "|00=|68=E1|M2=123456789|01=", ListVerdict::kRefused, "E1",
       "123456789"},
      {"a message too long", "|00=|68=E1|M2=1234567890|01=", ListVerdict::kRefused, "E1", ""},
      {"code and message before the record", "|68=0000|M2=no|00=|01=", ListVerdict::kRefused, "",
       ""},
      {"no record", "|68=0000|67=1", ListVerdict::kRefused, "", ""},
      {"a record without its end", "|00=|67=1|68=0000", ListVerdict::kRefused, "", ""},
      {"an empty reply", "", ListVerdict::kRefused, "", ""},
      {"a record too long", Record("1", "0000", std::string(60, 'a')), ListVerdict::kRefused, "",
       ""},
      {"the second record is not asked", Record("1", "E001", "") + Record("2", "0000", ""),
       ListVerdict::kRefused, "E001", ""},
  };
  for (const VerdictCase& row : rows) {
    const CReplyList list(row.reply, kTags);
    EXPECT_EQ(list.Verdict(), row.verdict) << row.label;
    EXPECT_EQ(list.Code(), row.code) << row.label;
    EXPECT_EQ(list.Message(), row.message) << row.label;
  }
}

std::string NamesOf(const std::string& reply, const CListTable& tags) {
  std::string names;
  for (CReplyList list(reply, tags); list.NextData();) {
    names += std::string(list.Record().Text(kName)) + ".";
  }
  return names;
}

struct WalkCase {
  const char* label;
  std::string reply, names, namesToEmpty;
};

TEST(ListFrame, WalkEndsAtTheEndMarkOrWithTheReply) {
  const std::string a = Record("1", "0000", "a"), b = Record("2", "0000", "b");
  const std::string end = Record("900000", "0000", "end");
  const std::string dropped = Record("3", "0000", std::string(60, 'x'));
  const WalkCase rows[] = {
      {"with an end mark", a + b + end + a, "a.b.", "a.b."},
      {"the end mark first", end + a, "", ""},
      {"the last number before it", Record("899999", "0000", "a") + end, "a.", "a."},
      {"a higher end mark", a + Record("999999", "", ""), "a.", "a."},
      {"an end mark without a code", a + Record("900000", "", "") + b, "a.", "a."},
      {"cut off behind a record", a + b, "a.b.", "a.b."},
      {"cut off within a record", a + "|00=|67=2|68=0000|46=b", "a.", "a."},
      {"records without data", Record("1", "E1", "x") + a + Record("2", "", "y") + b, "a.b.",
       "a.b."},
      {"a record too long", a + dropped + b, "a.b.", "a."},
      {"an end before a beginning", "|01=" + a + "|01=" + b, "a.b.", ""},
      {"a sequence that is no number", Record("x", "0000", "a") + b, "a.b.", "a.b."},
      {"a sequence too long for its buffer", Record("90000000", "0000", "a") + b, "a.b.", "a.b."},
      {"a negative sequence", Record("-900000", "0000", "a") + b, "a.b.", "a.b."},
      {"nothing", "", "", ""},
  };
  for (const WalkCase& row : rows) {
    EXPECT_EQ(NamesOf(row.reply, kTags), row.names) << row.label;
    EXPECT_EQ(NamesOf(row.reply, kToEmpty), row.namesToEmpty) << row.label;
  }
}

TEST(ListFrame, EndMarkIsTheLists) {
  const std::string reply = Record("900000", "0000", "a") + Record("900001", "0000", "b");
  EXPECT_EQ(NamesOf(reply, kTags), "");
  EXPECT_EQ(NamesOf(reply, kToLaterEnd), "a.");
}

TEST(ListFrame, NextShowsRecordsWithoutDataToo) {
  const std::string reply = Record("1", "E1", "a") + Record("2", "0000", "b");
  CReplyList list(reply, kTags);
  ASSERT_TRUE(list.Next());
  EXPECT_EQ(list.Code(), "E1");
  ASSERT_TRUE(list.Next());
  EXPECT_EQ(list.Code(), "0000");
  EXPECT_FALSE(list.Next());
}

TEST(ListFrame, EndIsForGood) {
  const std::string reply = Record("900000", "0000", "end") + Record("1", "0000", "a");
  CReplyList list(reply, kTags);
  for (int i = 0; i < 3; ++i) EXPECT_FALSE(list.Next());
}

}  // namespace
}  // namespace gateway_tests
