// The outcome of a run: ratios of medians, each with what is asked of it.
#ifndef QUORVANE_BENCH_RATIO_TABLE_H_
#define QUORVANE_BENCH_RATIO_TABLE_H_

#include <string>
#include <vector>

#include "bench/pairs.h"

namespace bench {

// A ratio of the times of two bodies by name, each time divided by its number of parts (records,
// say). `target` 0 asks nothing; `aim` 0 likewise.
struct Ratio {
  enum class Sense { kAtMost, kAtLeast };

  std::string group;
  std::string label;
  std::string measured;
  std::string against;
  double measuredParts = 1;
  double againstParts = 1;
  Sense sense = Sense::kAtMost;
  double target = 0;
  double aim = 0;

  std::string Name() const { return group + ": " + label; }
};

// Prints the table, and writes it as JSON to `file` unless that is empty. Ratios that were not
// measured are left out. Returns whether every target was met.
bool Report(const std::vector<Ratio>& ratios, const PairTimes& times, const std::string& file);

}  // namespace bench

#endif  // QUORVANE_BENCH_RATIO_TABLE_H_
