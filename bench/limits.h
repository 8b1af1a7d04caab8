// What the machine does at best with the same bytes; every figure is told relative to these.
#ifndef QUORVANE_BENCH_LIMITS_H_
#define QUORVANE_BENCH_LIMITS_H_

#include <cstddef>
#include <string>

namespace bench {

// Copies `text` to `out`, which has room for it, by one memcpy.
void CopyBytes(const std::string& text, char* out);

// Visits every bar of `text` by one memchr each; returns their number.
size_t ScanBars(const std::string& text);

}  // namespace bench

#endif  // QUORVANE_BENCH_LIMITS_H_
