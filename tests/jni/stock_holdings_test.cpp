// Settlement's type codes cell by cell, and lists of positions and settlement of any length.

#include <gtest/gtest.h>

#include <string>

#include "tests/support/recording_host.h"

namespace gateway_tests {
namespace {

const std::string kKindError = "[CLIENT] 委託種類錯誤";
const std::string kEnd = "|00=|67=900000|01=";

Outcome Decode(const char* operation, const std::string& reply) {
  CRecordingHost host(Placement::kBeforeUnreadable);
  Outcome outcome = host.Call(*FindExport(operation), {Argument::Text(reply)});
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
  return outcome;
}

// The rows that trade type and side decide: codes for side "B" and any other, 0 for none.
struct TypeRow {
  int kind;
  int tradeType;
  int buy;
  int other;
};

constexpr TypeRow kTypeRows[] = {
    {0, -1, 0, 0}, {0, 0, 1, 2}, {0, 1, 1, 2}, {0, 2, 7, 8}, {0, 3, 9, 10},  {0, 4, 0, 0},
    {1, -1, 0, 0}, {1, 0, 3, 4}, {1, 1, 3, 4}, {1, 2, 0, 0}, {1, 3, 11, 12}, {1, 4, 0, 0},
    {2, -1, 0, 0}, {2, 0, 5, 6}, {2, 1, 5, 6}, {2, 2, 0, 0}, {2, 3, 13, 14}, {2, 4, 0, 0},
    {3, -1, 0, 0}, {3, 0, 3, 4}, {3, 1, 3, 4}, {3, 2, 0, 0}, {3, 3, 11, 12}, {3, 4, 0, 0},
    {4, -1, 0, 0}, {4, 0, 5, 6}, {4, 1, 5, 6}, {4, 2, 0, 0}, {4, 3, 13, 14}, {4, 4, 0, 0},
};

// The kinds that decide alone.
struct KindRow {
  int kind;
  int code;
};

constexpr KindRow kKindRows[] = {
    {-2147483647, 0}, {-1, 0},  {5, 19},  {6, 20},  {7, 21},  {8, 22},  {9, 23},
    {10, 24},         {11, 25}, {12, 26}, {13, 27}, {14, 28}, {15, 29}, {16, 30},
    {17, 31},         {18, 0},  {19, 0},  {20, 32}, {21, 33}, {22, 34}, {23, 35},
    {24, 36},         {25, 37}, {26, 39}, {27, 0},  {31, 0},  {32, 0},  {2147483647, 0},
};

std::string SettlementReply(int kind, int tradeType, const std::string& side) {
  return "|00=1|67=1|68=0000|29=1|27=" + std::to_string(kind) + "|28=" + std::to_string(tradeType) +
         "|32=" + side + "|01=" + kEnd;
}

void ExpectTypeCode(int kind, int tradeType, const std::string& side, int code) {
  SCOPED_TRACE("kind " + std::to_string(kind) + ", type " + std::to_string(tradeType) + ", side " +
               side);
  const Outcome outcome = Decode("PaymentDecode", SettlementReply(kind, tradeType, side));
  if (code == 0) {
    EXPECT_EQ(outcome.result, kKindError);
    EXPECT_EQ(outcome.status, -1);
    return;
  }
  const std::string start = "1!@@" + std::to_string(code) + "@1@";
  EXPECT_EQ(outcome.result.value().substr(0, start.size()), start);
  EXPECT_EQ(outcome.status, 1);
}

TEST(SettlementTypeCode, OfKinds0To4GoesByTradeTypeAndSide) {
  for (const TypeRow& row : kTypeRows) {
    ExpectTypeCode(row.kind, row.tradeType, "B", row.buy);
    for (const char* side : {"S", "", "b", "BB", "B "}) {
      ExpectTypeCode(row.kind, row.tradeType, side, row.other);
    }
  }
}

TEST(SettlementTypeCode, OfLaterKindsGoesByTheKindAlone) {
  for (const KindRow& row : kKindRows) {
    for (int tradeType : {-1, 0, 1, 2, 3, 4, 99}) {
      ExpectTypeCode(row.kind, tradeType, "B", row.code);
      ExpectTypeCode(row.kind, tradeType, "S", row.code);
    }
  }
}

TEST(SettlementTypeCode, OfJzgIsNoMatterOfKindsAtAll) {
  for (const KindRow& row : kKindRows) {
    const Outcome outcome = Decode("PaymentDecodeJZG", SettlementReply(row.kind, 2, "S"));
    EXPECT_EQ(outcome.result, "1!@@@1@@0@@@@@0@0@0@0@0@@!") << row.kind;
    EXPECT_EQ(outcome.status, 1) << row.kind;
  }
}

TEST(SettlementList, TwentyThousandRecordsAreAllListed) {
  constexpr int kCount = 20000;
  std::string reply;
  std::string lines;
  for (int i = 0; i < kCount; ++i) {
    const std::string code = std::to_string(100000 + i);
    reply += "|00=1|67=1|68=0000|29=" + code + "|27=5|KT=19|01=";
    lines += "@@19@" + code + "@@0@@@@@0@0@0@0@0@@!";
  }
  for (const std::string& end : {kEnd, std::string()}) {
    for (const char* operation : {"PaymentDecode", "PaymentDecodeJZG"}) {
      EXPECT_TRUE(Decode(operation, reply + end).result == std::to_string(kCount) + "!" + lines)
          << operation;
    }
  }
}

// Records that give as much as they can for their length, `count` of them.
struct DenseReply {
  const char* name;
  std::string record;
  std::string sections[4];
  std::string jzgSections[3];
};
void PrintTo(const DenseReply& reply, std::ostream* out) {
  *out << reply.name;
}

const std::string kLongCode(19, 'C');
const std::string kOpen = "|00=|68=0000";

const DenseReply kDenseReplies[] = {
    {"ShortestRecords", kOpen + "|PS=1|01=", {"", "", "", "@1|0|0!"}, {"", "", ""}},
    {"AllSectionsWithoutACode",
     kOpen + "|75=1|76=1|77=1|PS=1|01=",
     {"@1|0!", "@1|0@@@@@!", "@1|0@@@@!", "@1|0|0!"},
     {"@1|0|0!", "@1|0|0@@@@@!", "@1|0|0@@@@!"}},
    {"AllSectionsWithTheLongestCode",
     kOpen + "|29=" + kLongCode + "|75=1|76=1|77=1|PS=1|01=",
     {kLongCode + "@1|0!", kLongCode + "@1|0@@@@@!", kLongCode + "@1|0@@@@!",
      kLongCode + "@1|0|0!"},
     {kLongCode + "@1|0|0!", kLongCode + "@1|0|0@@@@@!", kLongCode + "@1|0|0@@@@!"}},
    {"NumbersThatGrowBySigns",
     kOpen + "|29=" + kLongCode +
         "|75=2147483649|751=2147483650|752=2147483651|76=2147483648|761=2147483650|"
         "762=2147483648|PS=2147483648|01=",
     {kLongCode + "@-2147483647|-2147483646!", kLongCode + "@-2147483648|-2147483646@@@@@!", "",
      kLongCode + "@-2147483648|0|0!"},
     {kLongCode + "@-2147483647|-2147483646|-2147483645!",
      kLongCode + "@-2147483648|-2147483646|-2147483648@@@@@!", ""}},
};

class DensePositions : public testing::TestWithParam<DenseReply> {
 protected:
  template <size_t N>
  static std::string Expected(const std::string (&sections)[N], int count) {
    std::string text;
    for (size_t i = 0; i < N; ++i) {
      text += "<" + std::to_string(i) + ">!";
      text += std::to_string(sections[i].empty() ? 0 : count) + "!";
      for (int n = 0; n < count; ++n) text += sections[i];
    }
    return text;
  }
};

std::string NameOf(const testing::TestParamInfo<DenseReply>& info) {
  return info.param.name;
}

INSTANTIATE_TEST_SUITE_P(Replies, DensePositions, testing::ValuesIn(kDenseReplies), NameOf);

TEST_P(DensePositions, LoseNoRecordHoweverManyThereAre) {
  for (int count : {1, 2, 100, 20000}) {
    std::string reply;
    for (int n = 0; n < count; ++n) reply += GetParam().record;
    const Outcome plain = Decode("QueryInventoryDecode", reply);
    EXPECT_TRUE(plain.result == Expected(GetParam().sections, count)) << count;
    EXPECT_EQ(plain.status, 1);
    const Outcome jzg = Decode("QueryInventoryDecodeJZG", reply);
    EXPECT_TRUE(jzg.result == Expected(GetParam().jzgSections, count)) << count;
    EXPECT_EQ(jzg.status, 1);
  }
}

}  // namespace
}  // namespace gateway_tests
