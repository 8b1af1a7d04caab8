// How deep calls reach into the stack. Measured with the recording host's own frames above and
// below the library's, so that the library alone needs less.

#include <gtest/gtest.h>
#include <pthread.h>
#include <sys/mman.h>

#include <algorithm>
#include <cstdint>
#include <iostream>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/golden_file.h"
#include "tests/support/recording_host.h"

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define FRAMES_ARE_AS_SHIPPED 0
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define FRAMES_ARE_AS_SHIPPED 0
#endif
#endif
#ifndef FRAMES_ARE_AS_SHIPPED
#define FRAMES_ARE_AS_SHIPPED 1
#endif

namespace gateway_tests {
namespace {

constexpr size_t kMost = 32 * 1024;
constexpr size_t kStack = 1 << 20;
constexpr size_t kPainted = kStack / 2;
constexpr uint64_t kPaint = 0xa5c3a5c3a5c3a5c3;

struct Call {
  const Export* row = nullptr;
  Arguments arguments;
};

// A thread's stack, painted to see how far down a call wrote.
class CPaintedStack {
 public:
  CPaintedStack()
      : m_pBottom(static_cast<uint64_t*>(mmap(nullptr, kStack, PROT_READ | PROT_WRITE,
                                              MAP_PRIVATE | MAP_ANONYMOUS | MAP_STACK, -1, 0))) {
    std::fill(m_pBottom, m_pBottom + kPainted / sizeof kPaint, kPaint);
  }
  CPaintedStack(const CPaintedStack&) = delete;
  CPaintedStack& operator=(const CPaintedStack&) = delete;
  ~CPaintedStack() { munmap(m_pBottom, kStack); }

  // Bytes of stack that one call needs from its caller's frame on.
  size_t DepthOf(const Call& call) {
    m_call = call;
    pthread_attr_t attributes;
    pthread_attr_init(&attributes);
    pthread_attr_setstack(&attributes, m_pBottom, kStack);
    pthread_t thread{};
    EXPECT_EQ(pthread_create(&thread, &attributes, &Run, this), 0);
    pthread_join(thread, nullptr);
    pthread_attr_destroy(&attributes);
    return m_nDepth;
  }

 private:
  static void* Run(void* self) {
    static_cast<CPaintedStack*>(self)->MeasureCall();
    return nullptr;
  }

  // The paint ends where this frame begins, or nearly.
  __attribute__((noinline)) void MeasureCall() {
    CRecordingHost host;
    host.KeepRecord(false);
    host.Call(*m_call.row, m_call.arguments);  // what is done once is done
    auto* const frame = static_cast<uint64_t*>(__builtin_frame_address(0));
    uint64_t* const edge = frame - 128;
    Paint(m_pBottom, edge);
    const Outcome outcome = host.Call(*m_call.row, m_call.arguments);
    const uint64_t* const lowest =
        std::find_if(m_pBottom, edge, [](uint64_t word) { return word != kPaint; });
    EXPECT_TRUE(outcome.IsSound()) << m_call.row->name;
    m_nDepth = static_cast<size_t>(frame - lowest) * sizeof(uint64_t);
  }

  // Paints everything below its own frame.
  __attribute__((noinline)) static void Paint(uint64_t* from, const uint64_t* edge) {
    const auto* const own = static_cast<uint64_t*>(__builtin_frame_address(0)) - 64;
    for (volatile uint64_t* at = from; at < edge && at < own; ++at) *at = kPaint;
  }

  uint64_t* m_pBottom;
  Call m_call;
  size_t m_nDepth = 0;
};

// The golden cases, and for each export long texts in every place.
std::vector<Call> AllCalls() {
  std::vector<Call> calls;
  for (GoldenCase& golden : ReadGoldenCases(TEST_VECTORS).cases) {
    calls.push_back({FindExport(golden.operation), std::move(golden.arguments)});
  }
  for (const Export& row : AllExports()) {
    Call call{&row, {}};
    for (const char letter : row.shape) {
      if (letter == 'S') call.arguments.push_back(Argument::Text(std::string(65536, '7')));
      if (letter == 'i' || letter == 'b' || letter == 'c') {
        call.arguments.push_back({letter, 49, {}});
      }
    }
    calls.push_back(std::move(call));
  }
  return calls;
}

TEST(Stack, DeepestCallNeedsAtMost32KiB) {
  if (!FRAMES_ARE_AS_SHIPPED) GTEST_SKIP() << "sanitizers make frames many times as large";
  SetClock("2024-01-15 13:45:21");
  CPaintedStack stack;
  size_t deepest = 0;
  size_t shallowest = kStack;
  std::string_view where;
  for (const Call& call : AllCalls()) {
    const size_t depth = stack.DepthOf(call);
    shallowest = std::min(shallowest, depth);
    if (depth > deepest) where = call.row->name;
    deepest = std::max(deepest, depth);
  }
  std::cout << "deepest stack: " << deepest << " bytes, in " << where << "\n"
            << "shallowest: " << shallowest << " bytes\n";
  EXPECT_LE(deepest, kMost) << where;
  // Every call holds a gateway object with its request buffer: less was not measured right.
  EXPECT_GE(shallowest, 4096U);
}

}  // namespace
}  // namespace gateway_tests
