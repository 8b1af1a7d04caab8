#include "bench/pairs.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <ctime>

namespace bench {
namespace {

constexpr double kTurn = 100e3;  // nanoseconds

double Now() {
  timespec now;
  clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
  return static_cast<double>(now.tv_sec) * 1e9 + static_cast<double>(now.tv_nsec);
}

double Time(const Body& body, size_t repeats) {
  UseClock(body.clock);
  const double start = Now();
  body.loop(repeats);
  return Now() - start;
}

// How many repeats make a turn; warms the code up meanwhile.
size_t RepeatsOfTurn(const Body& body) {
  size_t repeats = 1;
  double time = Time(body, repeats);
  while ((time = Time(body, repeats)) < kTurn / 2) repeats *= 2;
  return std::max<size_t>(1, static_cast<size_t>(static_cast<double>(repeats) * kTurn / time));
}

double Quantile(std::vector<double> values, double part) {
  std::sort(values.begin(), values.end());
  return values[static_cast<size_t>(part * static_cast<double>(values.size() - 1))];
}

}  // namespace

void PairTimes::Register(const std::string& name, const Body& measured, const Body& against) {
  Pair& pair = m_pairs[name];
  pair.measured = &measured;
  pair.against = &against;
  benchmark::RegisterBenchmark(name.c_str(), [&pair](benchmark::State& state) {
    if (pair.measuredRepeats == 0) {
      pair.measuredRepeats = RepeatsOfTurn(*pair.measured);
      pair.againstRepeats = RepeatsOfTurn(*pair.against);
    }
    for ([[maybe_unused]] auto _ : state) {
      const double measuredTime = Time(*pair.measured, pair.measuredRepeats);
      const double againstTime = Time(*pair.against, pair.againstRepeats);
      pair.measuredTimes.push_back(measuredTime / static_cast<double>(pair.measuredRepeats));
      pair.againstTimes.push_back(againstTime / static_cast<double>(pair.againstRepeats));
    }
  });
}

PairMedians PairTimes::Medians(const std::string& name) const {
  const Pair& pair = m_pairs.at(name);
  if (pair.measuredTimes.empty()) return {};
  std::vector<double> ratios;
  for (size_t i = 0; i < pair.measuredTimes.size(); ++i) {
    ratios.push_back(pair.measuredTimes[i] / pair.againstTimes[i]);
  }
  const double ratio = Quantile(ratios, 0.5);
  const double spread = (Quantile(ratios, 0.75) - Quantile(ratios, 0.25)) / ratio;
  return {Quantile(pair.measuredTimes, 0.5), Quantile(pair.againstTimes, 0.5), ratio, spread};
}

}  // namespace bench
