// Two pieces of code measured beside each other: they take turns of a tenth of a millisecond, and
// the median of the turns' ratios counts, so that what other programs do to the machine meanwhile
// meets both alike.
#ifndef QUORVANE_BENCH_PAIRS_H_
#define QUORVANE_BENCH_PAIRS_H_

#include <cstddef>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include "bench/surroundings.h"

namespace bench {

// Code to be measured, as a loop of so many repeats, and the clock that it reads.
struct Body {
  std::function<void(size_t repeats)> loop;
  Clock clock = Clock::kFree;
};

template <typename TCall>
Body MakeBody(TCall call, Clock clock = Clock::kFree) {
  const auto loop = [call](size_t repeats) mutable {
    for (size_t i = 0; i < repeats; ++i) call();
  };
  return {loop, clock};
}

// Nanoseconds of CPU time of one repeat each, and their ratio; 0 where nothing was measured.
// `spread` is the distance of the ratios' quartiles as a part of their median.
struct PairMedians {
  double measured, against, ratio, spread;
};

// The pairs of a run and what their turns took.
class PairTimes {
 public:
  // Registers the benchmark `name`. The bodies and this object outlive the run.
  void Register(const std::string& name, const Body& measured, const Body& against);

  PairMedians Medians(const std::string& name) const;

 private:
  struct Pair {
    const Body* measured;
    const Body* against;
    size_t measuredRepeats = 0;
    size_t againstRepeats = 0;
    std::vector<double> measuredTimes;
    std::vector<double> againstTimes;
  };

  std::map<std::string, Pair> m_pairs;
};

}  // namespace bench

#endif  // QUORVANE_BENCH_PAIRS_H_
