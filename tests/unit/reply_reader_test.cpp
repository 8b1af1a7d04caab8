// The record reader: tag tables, and records against a plain reading of the same reply.

#include "gateway/core/reply_reader.h"

#include <ctime>
#include <random>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/list_frame.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

enum Field { kCode = kResultCode, kBalance = kOwnFields, kHead, kChange, kOpening, kTail };

constexpr TagRow kRows[] = {{kSequence, "67", 7},
                            {kCode, "68", 5},
                            {kMessage, "M2", 20},
                            {kBalance, "PN", 5},
                            {kHead, "17", 5, Blanks::kSkipped},
                            {kChange, "751", 5},
                            {kOpening, "75", 5},
                            {kTail, "18", 5, Blanks::kSkipped}};
constexpr CTagTable kTags(kRows);
constexpr int kRowCount = static_cast<int>(std::size(kRows));

// Whether a constant table of these rows builds.
template <const auto& kTable, int = (static_cast<void>(CTagTable(kTable)), 0)>
constexpr bool Builds(int) {
  return true;
}
template <const auto& kTable>
constexpr bool Builds(...) {
  return false;
}

constexpr TagRow kSwapped[] = {{kCode, "68", 5}, {kSequence, "67", 6}};
constexpr TagRow kLacking[] = {{kSequence, "67", 6}, {kMessage, "M2", 20}};
constexpr TagRow kTwice[] = {{kSequence, "67", 6}, {kSequence, "68", 5}};
static_assert(Builds<kRows>(0));
static_assert(!Builds<kSwapped>(0));
static_assert(!Builds<kLacking>(0));
static_assert(!Builds<kTwice>(0));

// As many tags as a table holds; the first, the 33rd and the last skip blanks.
constexpr int kFull = static_cast<int>(CTagTable::kMaxTags);

struct FullRows {
  char tags[kFull][4] = {};
  TagRow rows[kFull] = {};

  constexpr FullRows() {
    for (int i = 0; i < kFull; ++i) {
      char* const tag = tags[i];
      tag[0] = i < 30 ? static_cast<char>('A' + i / 10) : '7';
      tag[1] = i < 30 ? static_cast<char>('0' + i % 10) : '5';
      if (i >= 31) tag[2] = static_cast<char>('A' + i - 31);  // behind a bare 75
      rows[i] = {i, tag, 20};
    }
    for (int i : {0, 32, kFull - 1}) rows[i].blanks = Blanks::kSkipped;
  }
};

constexpr FullRows kFullRows;
constexpr CTagTable kFullTable(kFullRows.rows);

std::string TagOfFullTable(int row) {
  return kFullRows.tags[row];
}

// The key of a reply of this one field.
TagKey KeyOf(const std::string& field) {
  const std::string reply = "|" + field;
  const CGuardedBlock block(Placement::kBeforeUnreadable, reply.data(), reply.size());
  const CTagReader tags(block.Data(), block.Data() + reply.size());
  return tags.KeyBehind(block.Data());
}

TEST(ReplyReader, KeysOfFieldsBehindTheFirst) {
  const std::string reply = "|68=0000|751=5|29=";
  const CTagReader tags(reply.data(), reply.data() + reply.size());
  EXPECT_EQ(tags.KeyBehind(reply.data()), MakeTagKey("68"));
  EXPECT_EQ(tags.KeyBehind(reply.data() + 8), MakeTagKey("751"));
  EXPECT_EQ(tags.KeyBehind(reply.data() + 14), MakeTagKey("29"));
  EXPECT_EQ(tags.KeyBehind(reply.data() + reply.size()), kNoTag);
}

TEST(ReplyReader, FieldsAreToldByTagsOfTwoAndThreeCharacters) {
  EXPECT_EQ(KeyOf("68="), MakeTagKey("68"));
  EXPECT_EQ(KeyOf("68=0"), MakeTagKey("68"));
  EXPECT_EQ(KeyOf("68=0000"), MakeTagKey("68"));
  EXPECT_EQ(KeyOf("68=="), MakeTagKey("68"));
  EXPECT_EQ(KeyOf("751="), MakeTagKey("751"));
  EXPECT_EQ(KeyOf("751=5"), MakeTagKey("751"));
  EXPECT_NE(KeyOf("751=5"), MakeTagKey("75"));
  for (const char* field : {"", "6", "68", "=68", "6=8", "68 =", "7511=5", "751", "7511",
                            "\xff\xff\xff\xff", "\xff\xff\xff\xff=5"}) {
    EXPECT_NE(KeyOf(field), MakeTagKey("68")) << field;
    EXPECT_NE(KeyOf(field), MakeTagKey("751")) << field;
    EXPECT_EQ(kTags.Find(KeyOf(field)), CTagTable::kNone) << field;
  }
  EXPECT_EQ(TagSize(MakeTagKey("68")), 3U);
  EXPECT_EQ(TagSize(MakeTagKey("751")), 4U);
}

TEST(ReplyReader, FieldThatEndsWithItsTagIsNotReadFurther) {
  const std::string_view reply = "|39=5";
  EXPECT_EQ(FindField(reply, "39", Blanks::kTaken), "5");
  EXPECT_EQ(FindField(reply.substr(0, 4), "39", Blanks::kTaken), "");
  EXPECT_EQ(FindField(reply.substr(0, 3), "39", Blanks::kTaken), "");
}

TEST(ReplyReader, FullTableFindsEachOfItsTagsAndNoOther) {
  std::string known;
  for (int row = 0; row < kFull; ++row) {
    EXPECT_EQ(kFullTable.Find(KeyOf(TagOfFullTable(row) + "=1")), row);
    EXPECT_EQ(kFullTable.Skips() >> row & 1, row == 0 || row == 32 || row == kFull - 1 ? 1U : 0U)
        << row;
    known += "|" + TagOfFullTable(row) + "|";
  }
  for (int first = 1; first < 256; ++first) {
    for (int second = 1; second < 256; ++second) {
      const std::string tag = {static_cast<char>(first), static_cast<char>(second)};
      const bool listed = first != '|' && known.find("|" + tag + "|") != std::string::npos;
      const TagKey key = MakeTagKey(tag[0], tag[1], '=');
      ASSERT_TRUE(listed || kFullTable.Find(key) == CTagTable::kNone) << tag;
    }
  }
  EXPECT_EQ(kFullTable.Find(kNoTag), CTagTable::kNone);
}

TEST(ReplyReader, UnknownFieldsAreKeptNowhere) {
  struct {
    CRecord record{kTags};
    char behind[8192];
  } host;
  memset(host.behind, '#', sizeof host.behind);
  const std::string_view reply = "|00=1|Zz=7|x|Zzz=8|=|68=0000|01=";
  CRecordWalker walker(reply, 300);
  ASSERT_TRUE(walker.Next(host.record));
  EXPECT_EQ(std::string_view(host.behind, sizeof host.behind), std::string(8192, '#'));
}

TEST(ReplyReader, RecordOfAFullTableHoldsEveryField) {
  std::string reply = "|00=";
  for (int row = kFull - 1; row >= 0; --row)
    reply += "|" + TagOfFullTable(row) + "=v" + std::to_string(row);
  reply += "|01=";
  CRecord record(kFullTable);
  CRecordWalker walker(reply, 1024);
  ASSERT_TRUE(walker.Next(record));
  for (int row = 0; row < kFull; ++row) {
    EXPECT_TRUE(record.Has(row));
    EXPECT_EQ(record.Text(row), "v" + std::to_string(row));
  }
  EXPECT_FALSE(walker.Next(record));
  for (int row = 0; row < kFull; ++row) EXPECT_FALSE(record.Has(row));
}

TEST(ReplyReader, ValuesAreReadAsTheirRowsBoundThem) {
  CRecord record(kTags);
  CRecordWalker walker("|00=|67=900000|68=00000|17= 12x|75=|01=", 200);
  ASSERT_TRUE(walker.Next(record));
  EXPECT_EQ(record.Text(kSequence), "900000");
  EXPECT_EQ(record.Number(kSequence), 900000);
  EXPECT_EQ(record.Text(kCode), "");
  EXPECT_EQ(record.Number(kCode), 0);
  EXPECT_TRUE(record.Has(kCode)) << "too long to be read, but there";
  EXPECT_EQ(record.Number(kHead), 12);
  EXPECT_FALSE(record.Has(kOpening)) << "there, but empty";
  EXPECT_EQ(record.Text(kOpening), "");
  EXPECT_FALSE(record.Has(kChange));
  EXPECT_EQ(record.Number(kChange), 0);
  EXPECT_EQ(Bounded("abc", 3), "");
  EXPECT_EQ(Bounded("abc", 4), "abc");
  EXPECT_EQ(Bounded("", 0), "");
}

TEST(ReplyReader, FieldOfAWholeReplyIsReadAsItIsBound) {
  constexpr ReplyField kShort = {"68", 5}, kSkipping = {"17", 3, Blanks::kSkipped};
  EXPECT_EQ(ReadField("|68=0000|", kShort), "0000");
  EXPECT_EQ(ReadField("|68=00000|", kShort), "");
  EXPECT_EQ(ReadField("|68=|68=0000", kShort), "") << "the first counts";
  EXPECT_EQ(ReadField("68=0000", kShort), "");
  EXPECT_EQ(ReadField("|17= |17=12|", kSkipping), "12");
}

TEST(ReplyReader, FieldsTooShortForATagHideNoOther) {
  CRecord record(kTags);
  CRecordWalker walker("|00=|6|8=1|68|=2|=|||75|1=3|0|1=|68=0000|01|=|01=", 200);
  ASSERT_TRUE(walker.Next(record));
  EXPECT_EQ(record.Text(kCode), "0000");
  for (int row : {0, 2, 3, 4, 5}) EXPECT_FALSE(record.Has(row)) << row;
  EXPECT_FALSE(walker.Next(record));
}

TEST(ReplyReader, LastFieldOfARecordIsNotClosed) {
  CRecord record(kTags);
  CRecordWalker walker("|00=|17= |01=|00=|17=|17= |18= |17=5|01=|00=|17= |010=|01=", 200);
  ASSERT_TRUE(walker.Next(record));
  EXPECT_EQ(record.Text(kHead), " ") << "taken as found";
  ASSERT_TRUE(walker.Next(record));
  EXPECT_EQ(record.Text(kHead), "5");
  EXPECT_FALSE(record.Has(kTail));
  ASSERT_TRUE(walker.Next(record));
  EXPECT_FALSE(record.Has(kHead)) << "a bar that only looks like the end closes it";
}

TEST(ReplyReader, RecordOfItsBoundIsDroppedAndTheWalkGoesOn) {
  const std::string reply = "|00=1234|01=|00=|68=1|01=";  // a record of 8 characters
  for (size_t bound : {7U, 8U, 9U}) {
    CRecord record(kTags);
    CRecordWalker walker(reply, bound);
    ASSERT_TRUE(walker.Next(record));
    EXPECT_EQ(record.Empty(), bound <= 8) << bound;
    ASSERT_TRUE(walker.Next(record));
    EXPECT_TRUE(record.Empty());
    EXPECT_FALSE(walker.Next(record));
    EXPECT_FALSE(walker.Next(record));
  }
}

// One reply read by the buffer-copying tokenizers and by the walker: the same records, the same
// values, the same lengths.
void ExpectReadAlike(CGatewayPub& gateway, const std::string& reply, int bound) {
  const CTextAtPageEnd text(reply);
  CRecord record(kTags);
  CRecordWalker walker({text, reply.size()}, static_cast<size_t>(bound));
  int position = 0;
  bool more = true;
  while (static_cast<size_t>(position) < reply.size()) {
    char copy[64];
    gateway.GetSubString(text, position, copy, bound);
    if (more) more = walker.Next(record);
    ASSERT_EQ(record.Empty(), copy[0] == '\0') << reply;
    for (int row = 0; row < kRowCount; ++row) {
      const bool skips = kRows[row].blanks == Blanks::kSkipped;
      char value[20];
      const int size = static_cast<int>(kRows[row].bound);
      const int length = gateway.GetToken(kRows[row].tag, copy, value, size, skips);
      ASSERT_EQ(record.Has(row), length > 0) << reply << ", " << kRows[row].tag;
      ASSERT_EQ(record.Text(row), value) << reply << ", " << kRows[row].tag;
    }
  }
  while (more) {  // closing fields without a record behind the last one
    more = walker.Next(record);
    ASSERT_TRUE(record.Empty()) << reply;
  }
}

TEST(ReplyReader, WalkerAgreesWithTheTokenizersOnGeneratedReplies) {
  const char* const pieces[] = {"|00=", "|01=", "|17=", "|18=",  "|67=",  "|68=", "|75=",  "|751=",
                                "|M2=", "|",    "||",   "=",     " ",     "0000", "1",     "23456",
                                "00=",  "01=",  "68",   "|010=", "|001=", "|75",  "|17= ", "密"};
  std::mt19937 random(20240115);
  CGatewayPub gateway;
  for (int round = 0; round < 15000; ++round) {
    std::string reply;
    for (size_t count = random() % 24; count > 0; --count) {
      // Markers stand often enough for whole records.
      const size_t piece = random() % 3 == 0 ? random() % 2 : random() % std::size(pieces);
      reply += pieces[piece];
    }
    const int bound = 8 + static_cast<int>(random() % 56);
    ExpectReadAlike(gateway, reply, bound);
    if (HasFatalFailure()) return;
  }
}

TEST(ReplyReader, WalkerAgreesWithTheTokenizersOnWellFormedReplies) {
  std::mt19937 random(9);
  CGatewayPub gateway;
  for (int round = 0; round < 3000; ++round) {
    std::string reply = random() % 2 == 0 ? "F=7" : "";
    for (size_t records = random() % 6; records > 0; --records) {
      reply += "|00=" + std::string(random() % 3, 'r');
      for (size_t fields = random() % 6; fields > 0; --fields) {
        const char* const values[] = {"", " ", "0000", "42", "12345", "123456789"};
        reply += std::string("|") + kRows[random() % std::size(kRows)].tag + "=" +
                 values[random() % std::size(values)];
      }
      reply += "|01=";
    }
    ExpectReadAlike(gateway, reply, 64);
    if (HasFatalFailure()) return;
  }
}

// Total time over replies in hostile order grows with their size, not with its square: sixteen
// times the reply may take at most sixty-four times as long.
TEST(ReplyReader, HostileArrangementsOfMarkersAreWalkedInLinearTime) {
  for (const std::string piece : {"|01=", "|00=", "|01=|00=", "|", "x", "|17=", "|17= ", "|68=0000",
                                  "|00=|17=|01=", "|00=|01=|01="}) {
    double seconds[2] = {1e9, 1e9};
    for (int attempt = 0; attempt < 3; ++attempt) {
      for (size_t scale : {0U, 1U}) {
        std::string reply;
        while (reply.size() < (scale == 0 ? 65536U : 1048576U)) reply += piece;
        CRecord record(kTags);
        const std::clock_t start = std::clock();
        CRecordWalker walker(reply, 200);
        while (walker.Next(record)) {
        }
        for (const Blanks blanks : {Blanks::kTaken, Blanks::kSkipped}) {
          EXPECT_EQ(FindField(reply, "99", blanks), "");
          FindField(reply, "17", blanks);
        }
        const auto ticks = static_cast<double>(std::clock() - start);
        seconds[scale] = std::min(seconds[scale], ticks / CLOCKS_PER_SEC);
      }
    }
    EXPECT_LT(seconds[1], 64 * seconds[0] + 0.05) << piece;
  }
}

constexpr CListTable kPlain(kRows, {64});
constexpr CListTable kStopping(kRows, {64, true, 900001});

struct VerdictCase {
  const char* reply;
  ListVerdict verdict;
  const char* code;
  const char* message;
};

constexpr VerdictCase kVerdictCases[] = {
    {"|00=|68=0000|01=", ListVerdict::kData, "0000", ""},
    {"|00=|68=5001|M2=none|01=", ListVerdict::kNoData, "5001", "none"},
    {"|00=|68=5002|M2=no|01=", ListVerdict::kRefused, "5002", "no"},
    {"|00=|M2=no|01=", ListVerdict::kRefused, "", "no"},
    {"|00=|68=00000|01=", ListVerdict::kRefused, "", ""},
    {"|00=|68=000|01=", ListVerdict::kRefused, "000", ""},
    {"|68=0000|00=|01=", ListVerdict::kRefused, "", ""},
    {"|00=|68=0000", ListVerdict::kRefused, "", ""},
    {"|01=|00=|68=0000|01=", ListVerdict::kRefused, "", ""},
    {"", ListVerdict::kRefused, "", ""}};

TEST(ReplyReader, FirstRecordSpeaksForTheList) {
  for (const VerdictCase& row : kVerdictCases) {
    const CReplyList list(row.reply, kPlain);
    EXPECT_EQ(list.Verdict(), row.verdict) << row.reply;
    EXPECT_EQ(list.Code(), row.code) << row.reply;
    EXPECT_EQ(list.Message(), row.message) << row.reply;
  }
}

// The values of tag 75 that a list of this table shows.
std::string ListOf(const std::string& reply, const CListTable& tags) {
  std::string values;
  CReplyList list(reply, tags);
  while (list.NextData()) values += std::string(list.Record().Text(kOpening)) + ",";
  EXPECT_FALSE(list.NextData()) << "at its end for good";
  return values;
}

std::string RecordText(const std::string& fields) {
  return "|00=" + fields + "|01=";
}

TEST(ReplyReader, ListEndsAtItsMarkOrWithTheReply) {
  const std::string one = RecordText("|67=1|68=0000|75=a"), two = RecordText("|67=2|68=0000|75=b");
  const std::string refused = RecordText("|67=3|68=1|75=x");
  const std::string last = RecordText("|67=899999|68=0000|75=l");
  const std::string edge = RecordText("|67=900000|68=0000|75=e");
  const std::string over = RecordText("|67=900001|68=0000|75=o");
  const std::string dropped = RecordText("|68=0000|75=" + std::string(64, 'd'));
  const struct {
    std::string reply;
    const char* plain;
    const char* stopping;
  } rows[] = {{one + two, "a,b,", "a,b,"},
              {one + refused + two, "a,b,", "a,b,"},
              {one + last + edge + two, "a,l,", "a,l,e,b,"},
              {one + over + two, "a,", "a,"},
              {over + one, "", ""},
              {one + dropped + two, "a,b,", "a,"},
              {one + "|01=" + two, "a,b,", "a,"},
              {"|01=" + one, "a,", ""},
              {one + "|00=|68=0000|75=c", "a,", "a,"},
              {refused, "", ""},
              {"", "", ""}};
  for (const auto& row : rows) {
    EXPECT_EQ(ListOf(row.reply, kPlain), row.plain) << row.reply;
    EXPECT_EQ(ListOf(row.reply, kStopping), row.stopping) << row.reply;
  }
}

}  // namespace
}  // namespace gateway_tests
