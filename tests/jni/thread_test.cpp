// Calls from many threads side by side answer as one after the other.

#include <gtest/gtest.h>

#include <algorithm>
#include <atomic>
#include <cstdlib>
#include <string>
#include <thread>
#include <vector>

#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"

namespace gateway_tests {
namespace {

constexpr size_t kThreads = 16;

// Calls of each thread; longer runs ask for more by the environment.
size_t CallsPerThread() {
  const char* const asked = std::getenv("QUORVANE_THREAD_CALLS");
  return asked != nullptr ? std::strtoul(asked, nullptr, 10) : 2000;
}

Outcome Play(CRecordingHost& host, const GoldenCase& golden) {
  SetClockOf(golden);
  return host.Call(*FindExport(golden.operation), golden.arguments);
}

TEST(Threads, MixedCallsAnswerAsOneAfterTheOther) {
  GoldenCases golden = ReadGoldenCases(TEST_VECTORS);
  std::vector<GoldenCase>& cases = golden.cases;
  cases.erase(std::remove_if(cases.begin(), cases.end(),
                             [](const GoldenCase& one) {
                               const Export* const row = FindExport(one.operation);
                               return row == nullptr || row->EntryPoint() == nullptr;
                             }),
              cases.end());
  ASSERT_FALSE(cases.empty());

  std::vector<Outcome> serial;
  CRecordingHost serialHost;
  for (const GoldenCase& one : cases) serial.push_back(Play(serialHost, one));

  const size_t calls = CallsPerThread();
  std::atomic<size_t> answered{0};
  std::atomic<size_t> different{0};
  std::vector<std::thread> threads;
  for (size_t thread = 0; thread < kThreads; ++thread) {
    threads.emplace_back([&, thread] {
      CRecordingHost host;
      // A stride of its own takes each thread through the cases in another order.
      const size_t stride = 2 * thread + 1;
      for (size_t call = 0; call < calls; ++call) {
        const size_t at = (thread + call * stride) % cases.size();
        const Outcome outcome = Play(host, cases[at]);
        const bool same = outcome.events == serial[at].events &&
                          outcome.result == serial[at].result &&
                          outcome.status == serial[at].status && outcome.IsSound();
        if (!same) ++different;
        ++answered;
      }
    });
  }
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(answered, kThreads * calls);
  EXPECT_EQ(different, 0U);
}

}  // namespace
}  // namespace gateway_tests
