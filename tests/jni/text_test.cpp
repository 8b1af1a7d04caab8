// Long and hostile texts: bounds of requests and replies, and the time that hostile replies take.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <ctime>
#include <string>
#include <vector>

#include "tests/support/hostile_replies.h"
#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

constexpr size_t kRequestCapacity = 4095;  // the buffer's 4096 bytes and their terminator
const std::string kParameterError = "[CLIENT]傳入的參數錯誤";

TArguments LoginWithPassword(const std::string& password) {
  return {TArgument::Int(0),           TArgument::Int(0),           TArgument::Int(7),
          TArgument::Text("SN0001"),   TArgument::Text("10.0.0.1"), TArgument::Text("9A00"),
          TArgument::Text("1234567&"), TArgument::Text(password)};
}

TEST(RequestBounds, RequestThatFitsIsWholeAndOneByteMoreIsAParameterError) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  for (const char* operation : {"AuthEncode", "GetTotalAccountEncode"}) {
    for (EPlacement placement : {EPlacement::kHeap, EPlacement::kBeforeUnreadable}) {
      CRecordingHost host(placement);
      const TExport& row = *FindExport(operation);
      const size_t bare = host.Call(row, LoginWithPassword("")).m_Result.value().size();
      const std::string longest(kRequestCapacity - bare, 'p');

      const TOutcome fits = host.Call(row, LoginWithPassword(longest));
      EXPECT_EQ(fits.m_Result.value().size(), kRequestCapacity);
      EXPECT_NE(fits.m_Result.value().find("|PWD=" + longest + "|FUNC="), std::string::npos);
      EXPECT_EQ(fits.m_Status, 1);

      for (size_t more : {1U, 2U, 20U, 65536U}) {
        const TOutcome over = host.Call(row, LoginWithPassword(longest + std::string(more, 'p')));
        EXPECT_TRUE(over.IsSound()) << testing::PrintToString(over.m_Violations);
        EXPECT_EQ(over.m_Result, kParameterError) << operation << ", over by " << more;
        EXPECT_EQ(over.m_Status, -1) << operation << ", over by " << more;
      }
    }
  }
}

/// The longest run of `c` in `text`.
size_t LongestRun(const std::string& text, char c) {
  size_t longest = 0;
  size_t run = 0;
  for (const char one : text) {
    run = one == c ? run + 1 : 0;
    longest = std::max(longest, run);
  }
  return longest;
}

// Texts of 64 KiB in each argument of each request in turn: a message with status -1, or a request
// that carries the text whole or, where it is not sent or kept at its field's size, not at all.
TEST(RequestBounds, HugeTextsAreSentWholeOrNotAtAll) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  constexpr size_t kHuge = 65536;
  constexpr size_t kKept = 64;  // of the address; the serial number keeps less
  const std::string message = "傳入的參數錯誤";
  CRecordingHost host(EPlacement::kBeforeUnreadable);
  for (const TExport& row : AllExports()) {
    if (row.IsDecoder()) continue;
    for (size_t target = 0; target < row.m_szShape.size(); ++target) {
      if (row.m_szShape[target] != 'S') continue;
      TArguments arguments;
      for (char letter : row.m_szShape) {
        if (letter == 'S') arguments.push_back(TArgument::Text("1234567&"));
        if (letter == 'i' || letter == 'b' || letter == 'c') arguments.push_back({letter, 1, {}});
      }
      arguments[target] = TArgument::Text(std::string(kHuge, '~'));
      const TOutcome outcome = host.Call(row, arguments);
      const std::string where =
          std::string(row.m_szName) + ", argument " + std::to_string(target + 1);
      ASSERT_TRUE(outcome.IsSound()) << where << testing::PrintToString(outcome.m_Violations);
      const std::string& result = *outcome.m_Result;
      const bool request = result.substr(0, 2) == "F=";
      EXPECT_TRUE(request || outcome.m_Status != 1) << where << ": " << result;
      EXPECT_TRUE(request || result.find("[CLIENT]") == 0 ||
                  result.find(message) != std::string::npos)
          << where << ": " << result;
      const size_t run = LongestRun(result, '~');
      EXPECT_TRUE(run <= kKept || run == kHuge) << where << ": " << run;
    }
  }
}

TEST(ReplyBounds, MessageOf4095BytesIsWholeAndOf4096IsDropped) {
  for (const char* operation : {"AuthDecode", "GetTotalAccountDecode"}) {
    CRecordingHost host(EPlacement::kBeforeUnreadable);
    const TExport& row = *FindExport(operation);
    const std::string longest(4095, 'm');
    for (const char* end : {"", "|", "|x=1"}) {
      const TOutcome whole = host.Call(row, {TArgument::Text("|68=1|M2=" + longest + end)});
      EXPECT_EQ(whole.m_Result, longest) << operation;
      EXPECT_EQ(whole.m_Status, -1);
      const TOutcome dropped = host.Call(row, {TArgument::Text("|68=1|M2=" + longest + "m" + end)});
      EXPECT_EQ(dropped.m_Result, "") << operation;
      EXPECT_EQ(dropped.m_Status, -1);
    }
  }
}

TEST(ReplyBounds, ThousandsOfAccountsAreAllListed) {
  constexpr int kAccounts = 20000;
  std::string reply = "F=7|68=0000";
  std::string lines;
  for (int i = 0; i < kAccounts; ++i) {
    const std::string number = std::to_string(1000000 + i);
    reply += "|00=1|67=1|68=0000|07=S|M5=name|16=9A00|17=" + number + "|18=|69=1|01=";
    lines += "<S>@name@" + number + "@9A00@1!";
  }
  CRecordingHost host(EPlacement::kBeforeUnreadable);
  const TOutcome list = host.Call(*FindExport("GetTotalAccountDecode"), {TArgument::Text(reply)});
  EXPECT_EQ(list.m_Result, std::to_string(kAccounts) + "!" + lines);
  const TOutcome login =
      host.Call(*FindExport("AuthDecode"), {TArgument::Text(reply + "|M3=note|")});
  EXPECT_EQ(login.m_Result, std::to_string(kAccounts + 1) + "!" + lines + "<M>@note!");
}

class HostileReply : public testing::TestWithParam<THostileReply> {
 protected:
  /// Processor seconds of the fastest of a few calls.
  static double Seconds(CRecordingHost& host, const TExport& row, const TArguments& arguments) {
    double best = 1e9;
    for (int round = 0; round < 4 && best > 1e-4; ++round) {
      const std::clock_t begin = std::clock();
      const TOutcome outcome = host.Call(row, arguments);
      best = std::min(best, static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC);
      EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.m_Violations);
    }
    return best;
  }

  static TArguments Reply(const TExport& row, size_t length) {
    const THostileReply& hostile = GetParam();
    TArguments arguments;
    if (row.m_szShape[0] == 'i') arguments.push_back(TArgument::Int(0));
    arguments.push_back(TArgument::Text(MakeReply(hostile, length)));
    return arguments;
  }
};

std::string NameOf(const testing::TestParamInfo<THostileReply>& info) {
  return info.param.m_szName;
}

INSTANTIATE_TEST_SUITE_P(Arrangements, HostileReply, testing::ValuesIn(kHostileReplies), NameOf);

// Four times the reply may take four times as long; where each record or mark costs a look at the
// whole reply it takes sixteen times as long. The bound lies between, with room for a busy machine.
TEST_P(HostileReply, TakesTimeInProportionToItsLength) {
  constexpr size_t kWhole = 1U << 20;
  constexpr double kFactor = 8.0;
  constexpr double kNoise = 0.02;
  CRecordingHost host(EPlacement::kBeforeUnreadable);
  host.KeepRecord(false);
  for (const TExport& row : AllExports()) {
    if (!row.IsDecoder() || row.EntryPoint() == nullptr) continue;
    SCOPED_TRACE(std::string(row.m_szName));
    const double quarter = Seconds(host, row, Reply(row, kWhole / 4));
    const double whole = Seconds(host, row, Reply(row, kWhole));
    EXPECT_LE(whole, quarter * kFactor + kNoise) << "a quarter took " << quarter << " s";
  }
}

}  // namespace
}  // namespace gateway_tests
