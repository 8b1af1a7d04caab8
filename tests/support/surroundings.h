#ifndef TESTS_SUPPORT_SURROUNDINGS_H_
#define TESTS_SUPPORT_SURROUNDINGS_H_

#include <ctime>
#include <string_view>

// What the library finds around itself: the clock of the C library and the Android log. This
// program defines `time` and `__android_log_write`; because it exports them, the library's own
// references are answered here.

namespace gateway_tests {

// Sets the time zone of the market. To be called first in main, before any thread exists.
void EnterMarketTimeZone();

// Stops the clock of the calling thread at `when`. Threads that never do so have the real time.
void SetClock(std::time_t when);

// Stops the clock at a local time "2024-01-15 13:45:21"; false when the text is no such time.
bool SetClock(std::string_view localTime);

// Receives each line that the calling thread logs. `text` may be null.
class CLogListener {
 public:
  virtual ~CLogListener() = default;
  virtual void OnLog(int priority, const char* tag, const char* text) = 0;
};

// Names the listener of the calling thread (null for none: lines are dropped).
void ListenToLog(CLogListener* listener);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_SURROUNDINGS_H_
