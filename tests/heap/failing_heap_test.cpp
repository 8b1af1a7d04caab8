// What a call answers when memory runs out: each request for memory refused in turn, once and for
// good, in every golden case.

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <set>
#include <string>
#include <string_view>

#include "tests/heap/counting_heap.h"
#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"

namespace gateway_tests {
namespace {

struct Answer {
  Outcome outcome;
  size_t requests = 0;
  long unreleased = 0;
};

Answer Play(const GoldenCase& golden, size_t first, size_t last) {
  SetClock(golden.clock.empty() ? "2024-01-15 13:45:21" : golden.clock);
  CRecordingHost host;
  Answer answer;
  const CFailingHeap heap(first, last);
  answer.outcome = host.Call(*FindExport(golden.operation), golden.arguments);
  answer.requests = heap.Requests();
  answer.unreleased = heap.Unreleased();
  return answer;
}

// What a call did last before it gave anything back: most log their result.
std::string LastBeforeRelease(const Outcome& outcome) {
  const auto release =
      std::find_if(outcome.events.begin(), outcome.events.end(),
                   [](const std::string& event) { return event.rfind("Release", 0) == 0; });
  return release == outcome.events.begin() ? "" : *std::prev(release);
}

bool LogsItsResult(const Outcome& outcome) {
  return LastBeforeRelease(outcome) == "log " + *outcome.result;
}

// Nothing, with status -1; a reply that is refused for a reason of its own may still say so.
void ExpectFailure(const Answer& answer, const Outcome& whole, const std::string& where) {
  const Outcome& outcome = answer.outcome;
  const bool refused = whole.status == -1 && outcome.result == whole.result;
  EXPECT_TRUE(outcome.IsSound()) << where << testing::PrintToString(outcome.violations);
  EXPECT_TRUE(outcome.result == "" || refused) << where << ": " << *outcome.result;
  EXPECT_EQ(outcome.status, -1) << where;
  if (LogsItsResult(whole)) {
    EXPECT_TRUE(LogsItsResult(outcome)) << where << ": " << LastBeforeRelease(outcome);
  }
  EXPECT_EQ(answer.unreleased, 0) << where;
}

TEST(FailingHeap, EachRefusalIsAnsweredByNothingAndStatusMinusOne) {
  std::set<std::string> asking;
  for (const GoldenCase& golden : ReadGoldenCases(TEST_VECTORS).cases) {
    const Answer whole = Play(golden, CFailingHeap::kNever, 0);
    EXPECT_EQ(whole.unreleased, 0) << golden.Where();
    if (whole.requests > 0) asking.insert(golden.operation);
    for (size_t nth = 1; nth <= whole.requests; ++nth) {
      const std::string where = golden.Where() + ", request " + std::to_string(nth);
      ExpectFailure(Play(golden, nth, nth), whole.outcome, where + " alone");
      ExpectFailure(Play(golden, nth, CFailingHeap::kNever), whole.outcome,
                    where + " and all after it");
    }
  }
  // Those whose answers have no bound.
  for (const std::string_view operation :
       {"AuthDecode", "GetTotalAccountDecode", "RegisterCertEncode", "ApplyCertDecode",
        "QueryOrderDecode", "QueryReplyDecode", "QueryInventoryDecode", "QueryInventoryDecodeJZG",
        "PaymentDecode", "PaymentDecodeJZG", "FutQueryOrderDecode", "FutQueryReplyDecode",
        "FutQueryInventoryDecode"}) {
    EXPECT_EQ(asking.count(std::string(operation)), 1U) << operation;
  }
}

// A list that outgrows its first block, refused the second one.
TEST(FailingHeap, ListThatCannotGrowIsAnsweredByNothing) {
  GoldenCase golden;
  golden.operation = "QueryOrderDecode";
  std::string reply = "|00=1|67=1|68=0000";
  for (int i = 0; i < 5000; ++i) reply += "|00=|68=0000|01=";
  golden.arguments = {Argument::Int(0), Argument::Text(reply)};
  const Answer whole = Play(golden, CFailingHeap::kNever, 0);
  EXPECT_EQ(whole.outcome.status, 1);
  EXPECT_EQ(whole.requests, 2U);
  EXPECT_EQ(whole.unreleased, 0);
  for (const size_t nth : {1U, 2U}) {
    ExpectFailure(Play(golden, nth, nth), whole.outcome, std::to_string(nth));
    ExpectFailure(Play(golden, nth, CFailingHeap::kNever), whole.outcome,
                  std::to_string(nth) + " and after");
  }
}

}  // namespace
}  // namespace gateway_tests
