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

Arguments LoginWithPassword(const std::string& password) {
  return {Argument::Int(0),           Argument::Int(0),           Argument::Int(7),
          Argument::Text("SN0001"),   Argument::Text("10.0.0.1"), Argument::Text("9A00"),
          Argument::Text("1234567&"), Argument::Text(password)};
}

TEST(RequestBounds, RequestThatFitsIsWholeAndOneByteMoreIsAParameterError) {
  ASSERT_TRUE(SetClock("2024-01-15 13:45:21"));
  for (const char* operation : {"AuthEncode", "GetTotalAccountEncode"}) {
    for (Placement placement : {Placement::kHeap, Placement::kBeforeUnreadable}) {
      CRecordingHost host(placement);
      const Export& row = *FindExport(operation);
      const size_t bare = host.Call(row, LoginWithPassword("")).result.value().size();
      const std::string longest(kRequestCapacity - bare, 'p');

      const Outcome fits = host.Call(row, LoginWithPassword(longest));
      EXPECT_EQ(fits.result.value().size(), kRequestCapacity);
      EXPECT_NE(fits.result.value().find("|PWD=" + longest + "|FUNC="), std::string::npos);
      EXPECT_EQ(fits.status, 1);

      for (size_t more : {1U, 2U, 20U, 65536U}) {
        const Outcome over = host.Call(row, LoginWithPassword(longest + std::string(more, 'p')));
        EXPECT_TRUE(over.IsSound()) << testing::PrintToString(over.violations);
        EXPECT_EQ(over.result, kParameterError) << operation << ", over by " << more;
        EXPECT_EQ(over.status, -1) << operation << ", over by " << more;
      }
    }
  }
}

// The longest run of `c` in `text`.
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
  CRecordingHost host(Placement::kBeforeUnreadable);
  for (const Export& row : AllExports()) {
    if (row.IsDecoder()) continue;
    for (size_t target = 0; target < row.shape.size(); ++target) {
      if (row.shape[target] != 'S') continue;
      Arguments arguments;
      for (char letter : row.shape) {
        if (letter == 'S') arguments.push_back(Argument::Text("1234567&"));
        if (letter == 'i' || letter == 'b' || letter == 'c') arguments.push_back({letter, 1, {}});
      }
      arguments[target] = Argument::Text(std::string(kHuge, '~'));
      const Outcome outcome = host.Call(row, arguments);
      const std::string where = std::string(row.name) + ", argument " + std::to_string(target + 1);
      ASSERT_TRUE(outcome.IsSound()) << where << testing::PrintToString(outcome.violations);
      const std::string& result = *outcome.result;
      const bool request = result.substr(0, 2) == "F=";
      EXPECT_TRUE(request || outcome.status != 1) << where << ": " << result;
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
    CRecordingHost host(Placement::kBeforeUnreadable);
    const Export& row = *FindExport(operation);
    const std::string longest(4095, 'm');
    for (const char* end : {"", "|", "|x=1"}) {
      const Outcome whole = host.Call(row, {Argument::Text("|68=1|M2=" + longest + end)});
      EXPECT_EQ(whole.result, longest) << operation;
      EXPECT_EQ(whole.status, -1);
      const Outcome dropped = host.Call(row, {Argument::Text("|68=1|M2=" + longest + "m" + end)});
      EXPECT_EQ(dropped.result, "") << operation;
      EXPECT_EQ(dropped.status, -1);
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
  CRecordingHost host(Placement::kBeforeUnreadable);
  const Outcome list = host.Call(*FindExport("GetTotalAccountDecode"), {Argument::Text(reply)});
  EXPECT_EQ(list.result, std::to_string(kAccounts) + "!" + lines);
  const Outcome login = host.Call(*FindExport("AuthDecode"), {Argument::Text(reply + "|M3=note|")});
  EXPECT_EQ(login.result, std::to_string(kAccounts + 1) + "!" + lines + "<M>@note!");
}

class HostileReply : public testing::TestWithParam<HostilePattern> {
 protected:
  // Processor seconds of the fastest of a few calls.
  static double Seconds(CRecordingHost& host, const Export& row, const Arguments& arguments) {
    double best = 1e9;
    for (int round = 0; round < 4 && best > 1e-4; ++round) {
      const std::clock_t begin = std::clock();
      const Outcome outcome = host.Call(row, arguments);
      best = std::min(best, static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC);
      EXPECT_TRUE(outcome.IsSound()) << testing::PrintToString(outcome.violations);
    }
    return best;
  }

  static Arguments Reply(const Export& row, size_t length) {
    const HostilePattern& hostile = GetParam();
    Arguments arguments;
    if (row.shape[0] == 'i') arguments.push_back(Argument::Int(0));
    arguments.push_back(Argument::Text(MakeReply(hostile, length)));
    return arguments;
  }
};

std::string NameOf(const testing::TestParamInfo<HostilePattern>& info) {
  return info.param.name;
}

INSTANTIATE_TEST_SUITE_P(Arrangements, HostileReply, testing::ValuesIn(kHostileReplies), NameOf);

// Four times the reply may take four times as long; where each record or mark costs a look at the
// whole reply it takes sixteen times as long. The bound lies between, with room for a busy machine.
TEST_P(HostileReply, TakesTimeInProportionToItsLength) {
  constexpr size_t kWhole = 1U << 20;
  constexpr double kFactor = 8.0;
  constexpr double kNoise = 0.02;
  CRecordingHost host(Placement::kBeforeUnreadable);
  host.KeepRecord(false);
  for (const Export& row : AllExports()) {
    if (!row.IsDecoder() || row.EntryPoint() == nullptr) continue;
    SCOPED_TRACE(std::string(row.name));
    const double quarter = Seconds(host, row, Reply(row, kWhole / 4));
    const double whole = Seconds(host, row, Reply(row, kWhole));
    EXPECT_LE(whole, quarter * kFactor + kNoise) << "a quarter took " << quarter << " s";
  }
}

}  // namespace
}  // namespace gateway_tests
