#include "tests/fuzz/coverage_map.h"

namespace gateway_fuzz {
namespace {

struct Counters {
  uint8_t* begin;
  uint8_t* end;
};

constexpr size_t kMaxRegions = 16;
constexpr size_t kMaxCounters = size_t{1} << 16;

// One region for each module that was compiled with counters.
Counters s_regions[kMaxRegions];
size_t s_nRegions = 0;

// What has been seen of each counter: one bit for each size class.
uint8_t s_chSeen[kMaxCounters];

// How often a place was passed, as coarsely as it tells something new: 1, 2, 3, 4-7, 8-15,
// 16-31, 32-63, 64 and more.
uint8_t SizeClass(uint8_t count) {
  if (count < 4) return static_cast<uint8_t>(1U << (count - 1));
  const int log = 31 - __builtin_clz(count);  // 2 to 7
  return static_cast<uint8_t>(1U << (log + 1 < 7 ? log + 1 : 7));
}

// Most places are not passed by a call; they are looked at in blocks.
constexpr int kBlock = 64;

bool Passed(const uint8_t* block) {
  uint64_t words[kBlock / sizeof(uint64_t)];
  __builtin_memcpy(words, block, kBlock);
  uint64_t any = 0;
  for (const uint64_t word : words) any |= word;
  return any != 0;
}

bool TakeCounter(uint8_t& counter, uint8_t& seen) {
  if (counter == 0) return false;
  const uint8_t before = seen;
  seen = static_cast<uint8_t>(seen | SizeClass(counter));
  counter = 0;
  return seen != before;
}

}  // namespace

bool TakeCoverage() {
  bool found = false;
  uint8_t* seen = s_chSeen;
  for (size_t region = 0; region < s_nRegions; ++region) {
    uint8_t* at = s_regions[region].begin;
    uint8_t* const end = s_regions[region].end;
    for (; end - at >= kBlock; at += kBlock, seen += kBlock) {
      if (!Passed(at)) continue;
      for (int i = 0; i < kBlock; ++i) found |= TakeCounter(at[i], seen[i]);
    }
    for (; at < end; ++at, ++seen) found |= TakeCounter(*at, *seen);
  }
  return found;
}

size_t CountedPlaces() {
  size_t count = 0;
  for (size_t i = 0; i < s_nRegions; ++i) {
    count += static_cast<size_t>(s_regions[i].end - s_regions[i].begin);
  }
  return count;
}

}  // namespace gateway_fuzz

// The compiler calls this for each module before main.
extern "C" void __sanitizer_cov_8bit_counters_init(char* begin, char* end) {
  using namespace gateway_fuzz;
  const auto size = static_cast<size_t>(end - begin);
  if (s_nRegions == kMaxRegions || CountedPlaces() + size > kMaxCounters) return;
  s_regions[s_nRegions++] = {reinterpret_cast<uint8_t*>(begin), reinterpret_cast<uint8_t*>(end)};
}
