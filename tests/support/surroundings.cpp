#include "tests/support/surroundings.h"

#include <cstdlib>
#include <string>

namespace gateway_tests {
namespace {

constexpr std::time_t kClockNotSet = -1;
thread_local std::time_t t_tClock = kClockNotSet;
thread_local CLogListener* t_pListener = nullptr;

}  // namespace

void EnterMarketTimeZone() {
  // The rule of Asia/Taipei since 1980, spelled out: needs no zone files on the machine.
  setenv("TZ", "CST-8", 1);
  tzset();
}

void SetClock(std::time_t when) {
  t_tClock = when;
}

bool SetClock(std::string_view localTime) {
  std::tm fields{};
  const std::string text(localTime);
  const char* end = strptime(text.c_str(), "%Y-%m-%d %H:%M:%S", &fields);
  if (end == nullptr || *end != '\0') return false;
  SetClock(std::mktime(&fields));
  return true;
}

void ListenToLog(CLogListener* listener) {
  t_pListener = listener;
}

}  // namespace gateway_tests

extern "C" {

__attribute__((visibility("default"))) std::time_t time(std::time_t* out) noexcept {
  std::time_t now = gateway_tests::t_tClock;
  if (now == gateway_tests::kClockNotSet) {
    std::timespec real{};
    clock_gettime(CLOCK_REALTIME, &real);
    now = real.tv_sec;
  }
  if (out != nullptr) *out = now;
  return now;
}

__attribute__((visibility("default"))) int __android_log_write(int priority, const char* tag,
                                                               const char* text) {
  if (gateway_tests::t_pListener != nullptr) {
    gateway_tests::t_pListener->OnLog(priority, tag, text);
  }
  return 1;
}

}  // extern "C"
