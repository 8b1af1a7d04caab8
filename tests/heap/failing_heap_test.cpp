// What a call answers when memory runs out: each request for memory refused in turn, once and for
// good, in every golden case.

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <string_view>

#include "tests/heap/counting_heap.h"
#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"

namespace gateway_tests {
namespace {

struct TAnswer {
  TOutcome m_Outcome;
  size_t m_nRequests = 0;
  long m_nUnreleased = 0;
};

TAnswer Play(const TGoldenCase& golden, size_t first, size_t last) {
  SetClock(golden.m_Clock.empty() ? "2024-01-15 13:45:21" : golden.m_Clock);
  CRecordingHost host;
  TAnswer answer;
  const CFailingHeap heap(first, last);
  answer.m_Outcome = host.Call(*FindExport(golden.m_Operation), golden.m_Arguments);
  answer.m_nRequests = heap.Requests();
  answer.m_nUnreleased = heap.Unreleased();
  return answer;
}

/// Nothing, with status -1; a reply that is refused for a reason of its own may still say so.
void ExpectFailure(const TAnswer& answer, const TOutcome& whole, const std::string& where) {
  const TOutcome& outcome = answer.m_Outcome;
  const bool refused = whole.m_Status == -1 && outcome.m_Result == whole.m_Result;
  EXPECT_TRUE(outcome.IsSound()) << where << testing::PrintToString(outcome.m_Violations);
  EXPECT_TRUE(outcome.m_Result == "" || refused) << where << ": " << *outcome.m_Result;
  EXPECT_EQ(outcome.m_Status, -1) << where;
  EXPECT_EQ(answer.m_nUnreleased, 0) << where;
}

TEST(FailingHeap, EachRefusalIsAnsweredByNothingAndStatusMinusOne) {
  std::set<std::string> asking;
  for (const TGoldenCase& golden : ReadGoldenCases(TEST_VECTORS).m_Cases) {
    const TAnswer whole = Play(golden, CFailingHeap::kNever, 0);
    EXPECT_EQ(whole.m_nUnreleased, 0) << golden.Where();
    if (whole.m_nRequests > 0) asking.insert(golden.m_Operation);
    for (size_t nth = 1; nth <= whole.m_nRequests; ++nth) {
      const std::string where = golden.Where() + ", request " + std::to_string(nth);
      ExpectFailure(Play(golden, nth, nth), whole.m_Outcome, where + " alone");
      ExpectFailure(Play(golden, nth, CFailingHeap::kNever), whole.m_Outcome,
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
  TGoldenCase golden;
  golden.m_Operation = "QueryOrderDecode";
  std::string reply = "|00=1|67=1|68=0000";
  for (int i = 0; i < 5000; ++i) reply += "|00=|68=0000|01=";
  golden.m_Arguments = {TArgument::Int(0), TArgument::Text(reply)};
  const TAnswer whole = Play(golden, CFailingHeap::kNever, 0);
  EXPECT_EQ(whole.m_Outcome.m_Status, 1);
  EXPECT_EQ(whole.m_nRequests, 2U);
  EXPECT_EQ(whole.m_nUnreleased, 0);
  for (const size_t nth : {1U, 2U}) {
    ExpectFailure(Play(golden, nth, nth), whole.m_Outcome, std::to_string(nth));
    ExpectFailure(Play(golden, nth, CFailingHeap::kNever), whole.m_Outcome,
                  std::to_string(nth) + " and after");
  }
}

}  // namespace
}  // namespace gateway_tests
