// A reply of 100 MB: the memory that it takes is bounded, its time is told.

#include <gtest/gtest.h>

#include <chrono>
#include <fstream>
#include <iostream>
#include <string>
#include <string_view>
#include <vector>

#include "tests/heap/counting_heap.h"
#include "tests/support/bare_host.h"
#include "tests/support/call_table.h"
#include "tests/support/sample_replies.h"

namespace gateway_tests {
namespace {

constexpr size_t kMega = size_t{1} << 20;
constexpr size_t kReply = 100 * kMega;

// The most memory that the process held since the last call, in bytes; 0 where the system does not
// tell.
size_t TakePeak() {
  std::ifstream status("/proc/self/status");
  size_t kilobytes = 0;
  for (std::string line; std::getline(status, line);) {
    if (line.rfind("VmHWM:", 0) == 0) kilobytes = std::stoul(line.substr(6));
  }
  std::ofstream("/proc/self/clear_refs") << 5;
  return kilobytes * 1024;
}

struct Cost {
  size_t bytes;     // asked for
  size_t resident;  // held at most beyond what was held before
  double seconds;
};

Cost Decode(std::string_view decoder, const std::string& reply) {
  const Export* const row = FindExport(decoder);
  jint status = 0;
  std::vector<jvalue> values;
  if (row->shape.front() == 'i') values.emplace_back().i = 0;
  values.emplace_back().l = BareText(reply.c_str());
  values.emplace_back().l = BareStatus(&status);
  void* const entryPoint = row->EntryPoint();
  TakePeak();
  const size_t before = TakePeak();
  const auto start = std::chrono::steady_clock::now();
  const CHeapCount count;
  row->call(entryPoint, BareHost(), values.data());
  const Cost cost = {
      count.Bytes(), TakePeak() - before,
      std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count()};
  EXPECT_EQ(status, 1) << decoder;
  std::cout << decoder << ": " << reply.size() / kMega << " MB in " << cost.seconds << " s, "
            << cost.bytes / kMega << " MB asked for, " << cost.resident / kMega << " MB held\n";
  return cost;
}

// How much a decoder asks for, as a multiple of its reply.
struct Row {
  std::string_view decoder;
  size_t replies;
};

void PrintTo(const Row& row, std::ostream* out) {
  *out << row.decoder;
}

constexpr Row kRows[] = {
    {"QueryOrderDecode", 1},
    {"AuthDecode", 1},
    {"PaymentDecode", 1},
    {"FutQueryOrderDecode", 1},
    {"QueryInventoryDecode", 5},     // a room for each of four
                                     // sections, and the result
    {"FutQueryInventoryDecode", 5},  // two rooms for each of two sections, and the result
};

class LargeReply : public testing::TestWithParam<Row> {};

// A list as gateways send it holds about as much as its reply at most, whatever it
// asks for.
TEST_P(LargeReply, TakesAsMuchMemoryAsItsListAndNoMore) {
  const Row& row = GetParam();
  const std::string sample = SampleList(row.decoder, 1000);
  const size_t end = sample.rfind("|00=");
  std::string reply;
  reply.reserve(kReply + 2 * sample.size());
  while (reply.size() < kReply) reply.append(sample, 0, end);
  reply.append(sample, end);
  const Cost cost = Decode(row.decoder, reply);
  EXPECT_LE(cost.bytes, row.replies * (reply.size() + 8192));
  EXPECT_LE(cost.resident, reply.size() / 4 * 5);
}

INSTANTIATE_TEST_SUITE_P(Heap, LargeReply, testing::ValuesIn(kRows),
                         [](const auto& row) { return std::string(row.param.decoder); });

// Records that show more than they hold: a second block of eight times the first, of which no more
// than the list is ever touched.
TEST(LargeReplyOfBareRecords, HoldsNoMoreThanItsList) {
  std::string reply = "|00=1|67=1|68=0000|M3=";
  while (reply.size() < kReply) reply += "|00=|68=0000|01=";
  const Cost cost = Decode("QueryOrderDecode", reply);
  EXPECT_LE(cost.bytes, 9 * (reply.size() + 8192));
  EXPECT_LE(cost.resident, 3 * reply.size());
}

}  // namespace
}  // namespace gateway_tests
