// The golden cases, one test each, run natively.

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <string_view>
#include <utility>

#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {

// GoogleTest prints parameters; the title says all.
void PrintTo(const TGoldenCase& golden, std::ostream* out) {
  *out << golden.Where();
}

namespace {

constexpr EPlacement kPlacements[] = {EPlacement::kHeap, EPlacement::kBeforeUnreadable,
                                      EPlacement::kAfterUnreadable};

const TGoldenCases& AllGolden() {
  static const TGoldenCases s_Cases = ReadGoldenCases(TEST_VECTORS);
  return s_Cases;
}

class Golden : public testing::TestWithParam<TGoldenCase> {};

TEST(GoldenFiles, AreWellFormed) {
  for (const std::string& error : AllGolden().m_Errors) ADD_FAILURE() << error;
}

// What is tried on all golden cases is tried on every export.
TEST(GoldenFiles, HaveCasesOfEveryExport) {
  std::set<std::string_view> missing;
  for (const TExport& row : AllExports()) missing.insert(row.m_szName);
  for (const TGoldenCase& golden : AllGolden().m_Cases) missing.erase(golden.m_Operation);
  EXPECT_EQ(missing, std::set<std::string_view>());
}

TEST_P(Golden, Case) {
  const TGoldenCase& golden = GetParam();
  const TExport* const row = FindExport(golden.m_Operation);
  ASSERT_NE(row, nullptr) << golden.m_Operation;
  ASSERT_TRUE(SetClockOf(golden)) << golden.m_Clock;
  const std::string platform = PlatformName(golden.PlatformRow());

  for (EPlacement placement : kPlacements) {
    SCOPED_TRACE(golden.Where() + ", placement " + std::to_string(static_cast<int>(placement)));
    CRecordingHost host(placement);
    const TOutcome outcome = host.Call(*row, golden.m_Arguments);
    EXPECT_EQ(outcome.m_Violations, std::vector<std::string>());
    ASSERT_TRUE(outcome.m_Result.has_value());
    EXPECT_EQ(*outcome.m_Result, FillPlatformName(golden.m_Result, platform));
    EXPECT_EQ(outcome.m_Status, golden.m_Status);
    if (!golden.m_LogLines.has_value()) continue;
    std::vector<std::string> expected = *golden.m_LogLines;
    for (std::string& line : expected) line = FillPlatformName(line, platform);
    EXPECT_EQ(outcome.m_LogLines, expected);
  }
}

std::string NameOf(const testing::TestParamInfo<TGoldenCase>& info) {
  const std::string file = info.param.m_File;
  return file.substr(0, file.find('.')) + "_" + info.param.TestName();
}

INSTANTIATE_TEST_SUITE_P(Vectors, Golden, testing::ValuesIn(AllGolden().m_Cases), NameOf);

// A reply may end anywhere: each beginning of each golden reply, its last byte the last readable
// one, is answered.
TEST(GoldenReplies, EachPrefixIsAnswered) {
  CRecordingHost host(EPlacement::kBeforeUnreadable);
  for (const TGoldenCase& golden : AllGolden().m_Cases) {
    const TExport* const row = FindExport(golden.m_Operation);
    if (row == nullptr || !row->IsDecoder() || row->EntryPoint() == nullptr) continue;
    TArguments arguments = golden.m_Arguments;
    if (!arguments.back().m_Text.has_value()) continue;
    for (std::string& reply = *arguments.back().m_Text; !reply.empty(); reply.pop_back()) {
      const TOutcome outcome = host.Call(*row, arguments);
      ASSERT_TRUE(outcome.IsSound()) << golden.Where() << "\nreply " << reply << "\n"
                                     << testing::PrintToString(outcome.m_Violations);
    }
  }
}

// Whatever the machine refuses, nothing is leaked, nothing is built on top, null comes back.
TEST(GoldenCalls, EachRefusedVmCallIsSurvived) {
  for (const TGoldenCase& golden : AllGolden().m_Cases) {
    const TExport* const row = FindExport(golden.m_Operation);
    if (row == nullptr || row->EntryPoint() == nullptr || !SetClockOf(golden)) continue;
    CRecordingHost host;
    const int calls = host.Call(*row, golden.m_Arguments).m_nFallibleCalls;
    for (int failing = 1; failing <= calls; ++failing) {
      host.FailCall(failing);
      const TOutcome outcome = host.Call(*row, golden.m_Arguments);
      EXPECT_EQ(outcome.m_Violations, std::vector<std::string>())
          << golden.Where() << ", VM call " << failing;
      EXPECT_FALSE(outcome.m_Result.has_value()) << golden.Where() << ", VM call " << failing;
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
  for (const TGoldenCase& golden : AllGolden().m_Cases) {
    const TExport* const row = FindExport(golden.m_Operation);
    const std::string field = "PWD=pw";
    const size_t at = golden.m_Result.find(field);
    const bool sent = golden.m_Status.value_or(1) == 1 && at != std::string::npos;
    if (!sent || golden.m_Arguments.size() <= kPassword ||
        golden.m_Arguments[kPassword].m_Text != "pw" || !SetClockOf(golden)) {
      continue;
    }
    const std::string result =
        FillPlatformName(golden.m_Result, PlatformName(golden.PlatformRow()));
    const std::string password(2 + kRequestCapacity - result.size(), 'p');
    TArguments arguments = golden.m_Arguments;
    arguments[kPassword] = TArgument::Text(password);
    const TOutcome whole = host.Call(*row, arguments);
    std::string expected = result;
    expected.replace(result.find(field), field.size(), "PWD=" + password);
    EXPECT_EQ(whole.m_Result, expected) << golden.Where();
    EXPECT_EQ(whole.m_Status, golden.m_Status) << golden.Where();
    arguments[kPassword] = TArgument::Text(password + "p");
    EXPECT_EQ(host.Call(*row, arguments).m_Result, "[CLIENT]傳入的參數錯誤") << golden.Where();
    ++tried;
  }
  EXPECT_GT(tried, 50);
}

// Every length of every text around the size of a request's buffer: whichever piece is the one that
// does not fit, nothing is written behind the buffer, and the request is sent whole or not at all.
TEST(GoldenRequests, TextsOfEveryLengthAroundTheBufferAreWholeOrNotSent) {
  CRecordingHost host;
  std::set<std::pair<std::string_view, size_t>> tried;  // an export, with so many texts
  for (const TGoldenCase& golden : AllGolden().m_Cases) {
    const TExport* const row = FindExport(golden.m_Operation);
    const auto texts = static_cast<size_t>(
        std::count_if(golden.m_Arguments.begin(), golden.m_Arguments.end(),
                      [](const TArgument& a) { return !a.m_Text.value_or("").empty(); }));
    if (row->IsDecoder() || golden.m_Status.value_or(1) != 1 || !SetClockOf(golden) ||
        !tried.emplace(row->m_szName, texts).second) {
      continue;
    }
    for (size_t i = 0; i < golden.m_Arguments.size(); ++i) {
      if (golden.m_Arguments[i].m_chLetter != 'S') continue;
      TArguments arguments = golden.m_Arguments;
      for (size_t length = 3700; length < 4100; ++length) {
        arguments[i] = TArgument::Text(std::string(length, 'x'));
        const TOutcome outcome = host.Call(*row, arguments);
        ASSERT_TRUE(outcome.IsSound()) << golden.Where() << ", argument " << i + 1;
        const std::string& result = outcome.m_Result.value();
        const bool refused = result.find("[CLIENT]") != std::string::npos ||
                             result.find("傳入的參數錯誤") != std::string::npos;
        ASSERT_NE(refused, result.substr(0, 2) == "F=") << golden.Where() << ": " << result;
        ASSERT_EQ(refused, outcome.m_Status.value_or(refused ? -1 : 1) == -1) << golden.Where();
      }
    }
  }
}

// Each string null in turn is answered as an empty one is.
TEST(GoldenCalls, EachNullStringReadsAsAnEmptyOne) {
  CRecordingHost host;
  for (const TGoldenCase& golden : AllGolden().m_Cases) {
    const TExport* const row = FindExport(golden.m_Operation);
    if (row == nullptr || row->EntryPoint() == nullptr || !SetClockOf(golden)) continue;
    for (size_t i = 0; i < golden.m_Arguments.size(); ++i) {
      if (golden.m_Arguments[i].m_chLetter != 'S') continue;
      TArguments arguments = golden.m_Arguments;
      arguments[i] = TArgument::Null();
      const TOutcome withNull = host.Call(*row, arguments);
      arguments[i] = TArgument::Text("");
      const TOutcome withEmpty = host.Call(*row, arguments);
      const std::string where = golden.Where() + ", argument " + std::to_string(i + 1);
      EXPECT_TRUE(withNull.IsSound()) << where << testing::PrintToString(withNull.m_Violations);
      EXPECT_EQ(withNull.m_Result, withEmpty.m_Result) << where;
      EXPECT_EQ(withNull.m_Status, withEmpty.m_Status) << where;
      EXPECT_EQ(withNull.m_LogLines, withEmpty.m_LogLines) << where;
    }
  }
}

}  // namespace
}  // namespace gateway_tests
