// What holds for every reply that lists, through the exports.

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "tests/support/recording_host.h"
#include "tests/support/sample_replies.h"

namespace gateway_tests {
namespace {

// A reply of two records, the first of which has `sequence` where its sequence stands.
Outcome DecodeWithSequence(std::string_view decoder, std::string_view sequence) {
  std::string reply = SampleList(decoder, 2);
  const size_t begin = reply.find("|67=");
  EXPECT_NE(begin, std::string::npos) << decoder;
  reply.replace(begin, reply.find('|', begin + 1) - begin, sequence);
  const Export& row = *FindExport(decoder);
  Arguments arguments = {Argument::Text(reply)};
  if (row.shape.front() == 'i') arguments.insert(arguments.begin(), Argument::Int(0));  // a market
  Outcome outcome = CRecordingHost().Call(row, arguments);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
  return outcome;
}

TEST(ListReplies, BlankSequenceIsTakenAndEndsNoList) {
  for (const std::string_view decoder : kListDecoders) {
    const Outcome blank = DecodeWithSequence(decoder, "|67= ");
    const Outcome ended = DecodeWithSequence(decoder, "|67=900001");
    EXPECT_NE(blank.result, ended.result) << decoder;
    EXPECT_EQ(DecodeWithSequence(decoder, "|67= |67=900001").result, blank.result) << decoder;
  }
}

}  // namespace
}  // namespace gateway_tests
