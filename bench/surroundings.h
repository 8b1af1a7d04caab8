// What the library finds around itself while it is measured: a log that drops every line, and a
// clock that costs nothing or is the machine's own.
#ifndef QUORVANE_BENCH_SURROUNDINGS_H_
#define QUORVANE_BENCH_SURROUNDINGS_H_

namespace bench {

enum class Clock { kFree, kReal };

// What `time` and `localtime_r` are from now on.
void UseClock(Clock clock);

// One reading of the machine's own clock as an encoder reads it: `time` and `localtime_r`.
void ReadRealClock();

}  // namespace bench

#endif  // QUORVANE_BENCH_SURROUNDINGS_H_
