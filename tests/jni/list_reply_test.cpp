// What holds for every reply that lists, through the exports.

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <string_view>

#include "tests/fuzz/reply_tables.h"
#include "tests/support/recording_host.h"
#include "tests/support/sample_replies.h"

namespace gateway_tests {
namespace {

Outcome Decode(std::string_view decoder, const std::string& reply) {
  const Export& row = *FindExport(decoder);
  Arguments arguments = {Argument::Text(reply)};
  if (row.shape.front() == 'i') arguments.insert(arguments.begin(), Argument::Int(0));  // a market
  Outcome outcome = CRecordingHost().Call(row, arguments);
  EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
  return outcome;
}

// A reply of two records, the first of which has `sequence` where its sequence stands.
Outcome DecodeWithSequence(std::string_view decoder, std::string_view sequence) {
  std::string reply = SampleList(decoder, 2);
  const size_t begin = reply.find("|67=");
  EXPECT_NE(begin, std::string::npos) << decoder;
  reply.replace(begin, reply.find('|', begin + 1) - begin, sequence);
  return Decode(decoder, reply);
}

TEST(ListReplies, BlankSequenceIsTakenAndEndsNoList) {
  for (const std::string_view decoder : kListDecoders) {
    EXPECT_EQ(DecodeWithSequence(decoder, "|67= |67=900001").result,
              DecodeWithSequence(decoder, "|67= ").result)
        << decoder;
  }
}

TEST(ListReplies, EndMarkIsTheFirstSequenceThatEndsAList) {
  for (const gateway_fuzz::Table& table : gateway_fuzz::kTables) {
    if (table.endMark == 0) continue;
    const auto decode = [&table](int sequence) {
      return DecodeWithSequence(table.decoder, "|67=" + std::to_string(sequence)).result;
    };
    EXPECT_EQ(decode(table.endMark - 1), decode(1)) << table.decoder;
    EXPECT_NE(decode(table.endMark), decode(1)) << table.decoder;
  }
}

// The second of three records is too long for its buffer, and so an empty one: the third is of no
// account to the lists that end there.
TEST(ListReplies, EmptyRecordEndsTheListsThatSaySo) {
  for (const gateway_fuzz::Table& table : gateway_fuzz::kTables) {
    if (table.endMark == 0) continue;
    const std::string sample = SampleList(table.decoder, 3);
    const size_t second = sample.find("|00=", sample.find("|01="));
    const size_t third = sample.find("|00=", second + 1);
    const size_t end = sample.find("|00=", third + 1);
    const std::string twoRecords = sample.substr(0, third - strlen("|01=")) +
                                   "|XX=" + std::string(table.recordSize, 'x') + "|01=";
    const Outcome whole = Decode(table.decoder, twoRecords + sample.substr(third));
    const Outcome withoutThird = Decode(table.decoder, twoRecords + sample.substr(end));
    EXPECT_EQ(whole.result == withoutThird.result, table.endsAtEmptyRecord) << table.decoder;
  }
}

}  // namespace
}  // namespace gateway_tests
