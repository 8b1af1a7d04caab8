#include "bench/surroundings.h"

#include <android/log.h>
#include <benchmark/benchmark.h>
#include <dlfcn.h>

#include <ctime>

namespace bench {
namespace {

using TimeFunction = time_t (*)(time_t*);
using LocalTimeFunction = tm* (*)(const time_t*, tm*);

template <typename TFunction>
TFunction FindNext(const char* name) {
  return reinterpret_cast<TFunction>(dlsym(RTLD_NEXT, name));
}

// The C library's own, which this program's hide.
const TimeFunction g_realTime = FindNext<TimeFunction>("time");
const LocalTimeFunction g_realLocalTime = FindNext<LocalTimeFunction>("localtime_r");

Clock g_clock = Clock::kReal;

constexpr time_t kFreeTime = 1705297521;  // 2024-01-15 13:45:21 in Taipei

}  // namespace

void UseClock(Clock clock) {
  g_clock = clock;
}

void ReadRealClock() {
  const time_t now = g_realTime(nullptr);
  tm parts;
  benchmark::DoNotOptimize(g_realLocalTime(&now, &parts));
}

}  // namespace bench

extern "C" {

time_t time(time_t* out) noexcept {
  const time_t now =
      bench::g_clock == bench::Clock::kReal ? bench::g_realTime(nullptr) : bench::kFreeTime;
  if (out != nullptr) *out = now;
  return now;
}

tm* localtime_r(const time_t* when, tm* out) noexcept {
  if (bench::g_clock == bench::Clock::kReal) return bench::g_realLocalTime(when, out);
  out->tm_year = 124;
  out->tm_mon = 0;
  out->tm_mday = 15;
  out->tm_hour = 13;
  out->tm_min = 45;
  out->tm_sec = 21;
  return out;
}

int __android_log_write(int, const char*, const char*) {
  return 1;
}

}  // extern "C"
