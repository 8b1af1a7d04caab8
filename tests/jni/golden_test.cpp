// The golden cases, one test each, run natively.

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <string_view>
#include <utility>

#include "tests/support/golden_answer.h"
#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {

// GoogleTest prints parameters; the title says all.
void PrintTo(const GoldenCase& golden, std::ostream* out) {
  *out << golden.Where();
}

namespace {

struct GoldenPlacement {
  Placement placement;
  const char* remark;
};

// Each is tried when those before it hold.
constexpr GoldenPlacement kPlacements[] = {
    {Placement::kHeap, ""},
    {Placement::kBeforeUnreadable, " (with texts that end before an unreadable page)"},
    {Placement::kAfterUnreadable, " (with texts that begin behind an unreadable page)"},
};

const GoldenCases& AllGolden() {
  static const GoldenCases s_Cases = ReadGoldenCases(TEST_VECTORS);
  return s_Cases;
}

class Golden : public testing::TestWithParam<GoldenCase> {};

TEST(GoldenFiles, AreWellFormed) {
  for (const std::string& error : AllGolden().errors) ADD_FAILURE() << error;
}

// What is tried on all golden cases is tried on every export.
TEST(GoldenFiles, HaveCasesOfEveryExport) {
  std::set<std::string_view> missing;
  for (const Export& row : AllExports()) missing.insert(row.name);
  for (const GoldenCase& golden : AllGolden().cases) missing.erase(golden.operation);
  EXPECT_EQ(missing, std::set<std::string_view>());
}

TEST_P(Golden, Case) {
  const GoldenCase& golden = GetParam();
  const Export* const row = FindExport(golden.operation);
  ASSERT_NE(row, nullptr) << golden.operation;
  ASSERT_TRUE(SetClockOf(golden)) << golden.clock;
  const std::string platform = PlatformName(golden.PlatformRow());

  for (const GoldenPlacement& placement : kPlacements) {
    CRecordingHost host(placement.placement);
    const Outcome outcome = host.Call(*row, golden.arguments);
    const std::string difference = TellDifference(golden, outcome, platform);
    if (!difference.empty()) {
      FAIL() << golden.Where() << placement.remark << "\n  " << difference;
    }
  }
}

std::string NameOf(const testing::TestParamInfo<GoldenCase>& info) {
  const std::string file = info.param.file;
  return file.substr(0, file.find('.')) + "_" + info.param.TestName();
}

INSTANTIATE_TEST_SUITE_P(Vectors, Golden, testing::ValuesIn(AllGolden().cases), NameOf);

// A reply may end anywhere: each beginning of each golden reply, its last byte the last readable
// one, is answered.
TEST(GoldenReplies, EachPrefixIsAnswered) {
  CRecordingHost host(Placement::kBeforeUnreadable);
  for (const GoldenCase& golden : AllGolden().cases) {
    const Export* const row = FindExport(golden.operation);
    if (row == nullptr || !row->IsDecoder() || row->EntryPoint() == nullptr) continue;
    Arguments arguments = golden.arguments;
    if (!arguments.back().text.has_value()) continue;
    for (std::string& reply = *arguments.back().text; !reply.empty(); reply.pop_back()) {
      const Outcome outcome = host.Call(*row, arguments);
      ASSERT_TRUE(outcome.IsSound()) << golden.Where() << "\nreply " << reply << "\n"
                                     << testing::PrintToString(outcome.violations);
    }
  }
}

// Whatever the machine refuses, nothing is leaked, nothing is built on top, null comes back.
TEST(GoldenCalls, EachRefusedVmCallIsSurvived) {
  for (const GoldenCase& golden : AllGolden().cases) {
    const Export* const row = FindExport(golden.operation);
    if (row == nullptr || row->EntryPoint() == nullptr || !SetClockOf(golden)) continue;
    CRecordingHost host;
    const int calls = host.Call(*row, golden.arguments).fallibleCalls;
    for (int failing = 1; failing <= calls; ++failing) {
      host.FailCall(failing);
      const Outcome outcome = host.Call(*row, golden.arguments);
      EXPECT_EQ(outcome.violations, std::vector<std::string>())
          << golden.Where() << ", VM call " << failing;
      EXPECT_FALSE(outcome.result.has_value()) << golden.Where() << ", VM call " << failing;
    }
  }
}

// A request with a password that fills its 4095 characters to the last is whole, also where pieces
// are cut short by a NUL character; with one character more it is an error.
TEST(GoldenRequests, EachFillsItsBufferAndNoMore) {
  constexpr size_t kRequestCapacity = 4095;
  constexpr size_t kPassword = 7;
  int tried = 0;
  CRecordingHost host;
  for (const GoldenCase& golden : AllGolden().cases) {
    const Export* const row = FindExport(golden.operation);
    if (golden.arguments.size() <= kPassword || golden.arguments[kPassword].text != "pw" ||
        !SetClockOf(golden)) {
      continue;
    }
    const Outcome usual = host.Call(*row, golden.arguments);
    const std::string& result = usual.result.value();
    const std::string field = "PWD=pw";
    if (usual.status.value_or(1) != 1 || result.find(field) == std::string::npos) continue;
    const std::string password(2 + kRequestCapacity - result.size(), 'p');
    Arguments arguments = golden.arguments;
    arguments[kPassword] = Argument::Text(password);
    const Outcome whole = host.Call(*row, arguments);
    std::string expected = result;
    expected.replace(result.find(field), field.size(), "PWD=" + password);
    EXPECT_EQ(whole.result, expected) << golden.Where();
    EXPECT_EQ(whole.status, usual.status) << golden.Where();
    arguments[kPassword] = Argument::Text(password + "p");
    EXPECT_EQ(host.Call(*row, arguments).result, "[CLIENT]傳入的參數錯誤") << golden.Where();
    ++tried;
  }
  EXPECT_GT(tried, 50);
}

// Every length of every text around the size of a request's buffer: whichever piece is the one that
// does not fit, nothing is written behind the buffer, and the request is sent whole or not at all.
TEST(GoldenRequests, TextsOfEveryLengthAroundTheBufferAreWholeOrNotSent) {
  CRecordingHost host;
  std::set<std::pair<std::string_view, size_t>> tried;  // an export, with so many texts
  for (const GoldenCase& golden : AllGolden().cases) {
    const Export* const row = FindExport(golden.operation);
    const auto texts = static_cast<size_t>(
        std::count_if(golden.arguments.begin(), golden.arguments.end(),
                      [](const Argument& a) { return !a.text.value_or("").empty(); }));
    if (row->IsDecoder() || !SetClockOf(golden) ||
        host.Call(*row, golden.arguments).status.value_or(1) != 1 ||
        !tried.emplace(row->name, texts).second) {
      continue;
    }
    for (size_t i = 0; i < golden.arguments.size(); ++i) {
      if (golden.arguments[i].letter != 'S') continue;
      Arguments arguments = golden.arguments;
      for (size_t length = 3700; length < 4100; ++length) {
        arguments[i] = Argument::Text(std::string(length, 'x'));
        const Outcome outcome = host.Call(*row, arguments);
        ASSERT_TRUE(outcome.IsSound()) << golden.Where() << ", argument " << i + 1;
        const std::string& result = outcome.result.value();
        const bool refused = result.find("[CLIENT]") != std::string::npos ||
                             result.find("傳入的參數錯誤") != std::string::npos;
        ASSERT_NE(refused, result.substr(0, 2) == "F=") << golden.Where() << ": " << result;
        ASSERT_EQ(refused, outcome.status.value_or(refused ? -1 : 1) == -1) << golden.Where();
      }
    }
  }
}

// Each string null in turn is answered as an empty one is.
TEST(GoldenCalls, EachNullStringReadsAsAnEmptyOne) {
  CRecordingHost host;
  for (const GoldenCase& golden : AllGolden().cases) {
    const Export* const row = FindExport(golden.operation);
    if (row == nullptr || row->EntryPoint() == nullptr || !SetClockOf(golden)) continue;
    for (size_t i = 0; i < golden.arguments.size(); ++i) {
      if (golden.arguments[i].letter != 'S') continue;
      Arguments arguments = golden.arguments;
      arguments[i] = Argument::Null();
      const Outcome withNull = host.Call(*row, arguments);
      arguments[i] = Argument::Text("");
      const Outcome withEmpty = host.Call(*row, arguments);
      const std::string where = golden.Where() + ", argument " + std::to_string(i + 1);
      EXPECT_TRUE(withNull.IsSound()) << where << testing::PrintToString(withNull.violations);
      EXPECT_EQ(withNull.result, withEmpty.result) << where;
      EXPECT_EQ(withNull.status, withEmpty.status) << where;
      EXPECT_EQ(withNull.logLines, withEmpty.logLines) << where;
    }
  }
}

}  // namespace
}  // namespace gateway_tests
