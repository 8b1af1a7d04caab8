// quorvane_bench [--ratios=FILE] [Google Benchmark's options]: measures the library beside the
// machine's limits and prints ratios; FILE receives them as JSON.
#include <benchmark/benchmark.h>
#include <malloc.h>

#include <cstdlib>
#include <cstring>
#include <ctime>
#include <map>
#include <string>
#include <vector>

#include "bench/cases.h"

namespace {

// The table tells all at the end.
class Silence : public benchmark::BenchmarkReporter {
 public:
  bool ReportContext(const Context&) override { return true; }
  void ReportRuns(const std::vector<Run>&) override {}
};

// Takes "--ratios=FILE" out of the arguments.
std::string TakeRatiosFile(std::vector<char*>& arguments) {
  constexpr char kOption[] = "--ratios=";
  for (size_t i = 1; i < arguments.size(); ++i) {
    if (strncmp(arguments[i], kOption, strlen(kOption)) != 0) continue;
    const std::string file = arguments[i] + strlen(kOption);
    arguments.erase(arguments.begin() + static_cast<std::ptrdiff_t>(i));
    return file;
  }
  return {};
}

}  // namespace

int main(int argc, char** argv) {
  setenv("TZ", "Asia/Taipei", 1);
  tzset();

  // Blocks stay with the program: what fresh pages cost is the system's, and comes and goes.
  mallopt(M_MMAP_THRESHOLD, 1 << 30);
  mallopt(M_TRIM_THRESHOLD, 1 << 30);

  // Short repetitions in changing order: a burst of foreign load then meets a few repetitions of
  // many pairs, and no pair as a whole.
  char repetitions[] = "--benchmark_repetitions=11";
  char interleaving[] = "--benchmark_enable_random_interleaving=true";
  char minTime[] = "--benchmark_min_time=0.02";
  std::vector<char*> arguments = {argv[0], repetitions, interleaving, minTime};
  arguments.insert(arguments.end(), argv + 1, argv + argc);
  const std::string file = TakeRatiosFile(arguments);

  int count = static_cast<int>(arguments.size());
  benchmark::Initialize(&count, arguments.data());
  if (benchmark::ReportUnrecognizedArguments(count, arguments.data())) return 2;
  if (!bench::BaselinesAgree()) return 2;

  const std::map<std::string, bench::Body> bodies = bench::AllBodies();
  const std::vector<bench::Ratio> ratios = bench::AllRatios();
  bench::PairTimes times;
  for (const bench::Ratio& ratio : ratios) {
    times.Register(ratio.Name(), bodies.at(ratio.measured), bodies.at(ratio.against));
  }
  Silence silence;
  benchmark::RunSpecifiedBenchmarks(&silence);
  return bench::Report(ratios, times, file) ? 0 : 1;
}
