// No list writes behind its blocks, also where it fills them to the last byte.

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "tests/heap/counting_heap.h"
#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"
#include "tests/support/sample_replies.h"

namespace gateway_tests {
namespace {

Outcome Play(std::string_view operation, const Arguments& arguments) {
  SetClock("2024-01-15 13:45:21");
  CRecordingHost host;
  const CGuardedHeap heap;
  return host.Call(*FindExport(operation), arguments);
}

Outcome Decode(std::string_view decoder, const std::string& reply) {
  const bool takesMarket = FindExport(decoder)->shape.front() == 'i';
  return takesMarket ? Play(decoder, {Argument::Int(0), Argument::Text(reply)})
                     : Play(decoder, {Argument::Text(reply)});
}

TEST(GuardedHeap, GoldenCasesWriteNothingBehindTheirBlocks) {
  for (const GoldenCase& golden : ReadGoldenCases(TEST_VECTORS).cases) {
    EXPECT_TRUE(Play(golden.operation, golden.arguments).IsSound()) << golden.Where();
  }
}

class GuardedList : public testing::TestWithParam<std::string_view> {};

TEST_P(GuardedList, WritesNothingBehindItsBlocks) {
  for (const size_t records : {1U, 20U, 1000U}) {
    EXPECT_TRUE(Decode(GetParam(), SampleList(GetParam(), records)).IsSound()) << records;
  }
}

INSTANTIATE_TEST_SUITE_P(Heap, GuardedList, testing::ValuesIn(kListDecoders),
                         [](const auto& list) { return std::string(list.param); });

// Lists of records that show more than they hold, so that they outgrow a block made for the reply.
// A field that shows nothing, a byte longer each time, moves the block's end through each byte of a
// record and of what follows it.
class FilledBlock : public testing::TestWithParam<std::string_view> {};

constexpr std::string_view kOutgrowing[] = {"QueryOrderDecode", "FutQueryOrderDecode",
                                            "FutQueryReplyDecode", "FutQueryInventoryDecode"};

std::string DenseReply(size_t unseen, size_t records) {
  std::string reply = "|00=1|67=1|68=0000|M3=|ZZ=" + std::string(unseen, '-');
  for (size_t i = 0; i < records; ++i) reply += "|00=|68=0000|01=";
  return reply;
}

TEST_P(FilledBlock, IsFilledToItsLastByteAndNoFurther) {
  constexpr size_t kRecordAtMost = 120;  // characters that a record shows
  constexpr size_t kRecords = 3000;
  const std::string result = *Decode(GetParam(), DenseReply(0, kRecords)).result;
  ASSERT_GT(result.size(), DenseReply(0, kRecords).size() + 4096) << "it must outgrow its block";
  for (size_t unseen = 1; unseen <= kRecordAtMost; ++unseen) {
    EXPECT_EQ(*Decode(GetParam(), DenseReply(unseen, kRecords)).result, result) << unseen;
  }
}

INSTANTIATE_TEST_SUITE_P(Heap, FilledBlock, testing::ValuesIn(kOutgrowing),
                         [](const auto& list) { return std::string(list.param); });

}  // namespace
}  // namespace gateway_tests
