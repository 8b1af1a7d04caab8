// What calls ask of the heap: nothing for a request, at most two blocks for a list of any size, and
// three for the two lists of futures positions.

#include <gtest/gtest.h>

#include <cstdlib>
#include <initializer_list>
#include <new>
#include <string>
#include <vector>

#include "tests/heap/counting_heap.h"
#include "tests/support/bare_host.h"
#include "tests/support/call_table.h"
#include "tests/support/golden_file.h"
#include "tests/support/sample_replies.h"

namespace gateway_tests {
namespace {

// The blocks that one call takes from the heap.
int AllocationsOf(const Export& row, const Arguments& arguments) {
  jint status = 0;
  std::vector<jvalue> values;
  for (const Argument& argument : arguments) {
    jvalue value{};
    switch (argument.letter) {
      case 'S':
        value.l = argument.text ? BareText(argument.text->c_str()) : nullptr;
        break;
      case 'b':
        value.b = static_cast<jbyte>(argument.number);
        break;
      case 'c':
        value.c = static_cast<jchar>(argument.number);
        break;
      default:
        value.i = static_cast<jint>(argument.number);
    }
    values.push_back(value);
  }
  values.emplace_back().l = BareStatus(&status);
  void* const entryPoint = row.EntryPoint();
  JNIEnv* const env = BareHost();
  EXPECT_NE(entryPoint, nullptr) << row.name;
  if (entryPoint == nullptr) return 0;

  const CHeapCount count;
  row.call(entryPoint, env, values.data());
  return count.Allocations();
}

int AllocationsOfReply(std::string_view decoder, const std::string& reply) {
  const Export* const row = FindExport(decoder);
  Arguments arguments = {Argument::Text(reply)};
  if (row->shape.front() == 'i') arguments.insert(arguments.begin(), Argument::Int(0));
  return AllocationsOf(*row, arguments);
}

// The most blocks that a call may take; futures positions are two lists and their result.
int MostOf(const Export& row) {
  if (row.name == "FutQueryInventoryDecode") return 3;
  if (row.IsDecoder()) return 2;
  return row.name == "RegisterCertEncode" ? 2 : 0;  // a message of any length
}
int MostOf(std::string_view operation) {
  return MostOf(*FindExport(operation));
}

TEST(Heap, CountsWhatIsAskedOfIt) {
  const CHeapCount count;
  void* volatile block = malloc(1);
  block = realloc(block, 100000);
  free(block);
  block = calloc(1, 1);
  free(block);
  ::operator delete(::operator new(7));
  EXPECT_EQ(count.Allocations(), 4);
}

TEST(Heap, CountsWhatTheLibraryAsksOfIt) {
  EXPECT_GT(AllocationsOfReply("QueryOrderDecode", SampleList("QueryOrderDecode", 20)), 0);
}

TEST(Heap, IsLeftAloneByRequestsAndHardlyUsedByAnswers) {
  const GoldenCases golden = ReadGoldenCases(TEST_VECTORS);
  ASSERT_FALSE(golden.cases.empty());
  for (const GoldenCase& one : golden.cases) {
    const Export* const row = FindExport(one.operation);
    ASSERT_NE(row, nullptr) << one.Where();
    EXPECT_LE(AllocationsOf(*row, one.arguments), MostOf(*row)) << one.Where();
  }
}

class HeapOfList : public testing::TestWithParam<std::string_view> {};

TEST_P(HeapOfList, GrowsInFewBlocksWhateverTheSize) {
  for (size_t records : std::initializer_list<size_t>{0, 1, 2, 20, 100, 1000, 20000}) {
    EXPECT_LE(AllocationsOfReply(GetParam(), SampleList(GetParam(), records)), MostOf(GetParam()))
        << records << " records";
  }
}

INSTANTIATE_TEST_SUITE_P(Heap, HeapOfList, testing::ValuesIn(kListDecoders),
                         [](const auto& list) { return std::string(list.param); });

TEST(Heap, IsHardlyUsedByAnswersWithoutAList) {
  int answers = 0;
  for (const Export& row : AllExports()) {
    const std::string reply = SampleAnswer(row.name);
    if (reply.empty()) continue;
    ++answers;
    EXPECT_LE(AllocationsOfReply(row.name, reply), MostOf(row)) << row.name;
  }
  EXPECT_EQ(answers, 16);  // with the lists, every decoder
}

TEST(Heap, TakesNoFurtherBlockForRecordsLongerThanTheirReply) {
  // Each of these records of a few bytes shows ten characters and more.
  std::string reply = "|00=1|67=1|68=0000|M3=";
  for (int i = 0; i < 5000; ++i) reply += "|00=|68=0000|01=";
  for (const char* decoder : {"AuthDecode", "QueryOrderDecode", "FutQueryOrderDecode",
                              "FutQueryReplyDecode", "FutQueryInventoryDecode"}) {
    EXPECT_LE(AllocationsOfReply(decoder, reply), MostOf(decoder)) << decoder;
  }
}

}  // namespace
}  // namespace gateway_tests
