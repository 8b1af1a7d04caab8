#include "bench/ratio_table.h"

#include <cstdio>

namespace bench {
namespace {

enum class Verdict { kNone, kAim, kTarget, kMissed };

bool Holds(const Ratio& ratio, double value, double bound) {
  return ratio.sense == Ratio::Sense::kAtMost ? value <= bound : value >= bound;
}

Verdict Judge(const Ratio& ratio, double value) {
  if (ratio.target == 0) return Verdict::kNone;
  if (!Holds(ratio, value, ratio.target)) return Verdict::kMissed;
  return ratio.aim != 0 && Holds(ratio, value, ratio.aim) ? Verdict::kAim : Verdict::kTarget;
}

const char* Word(Verdict verdict) {
  switch (verdict) {
    case Verdict::kAim:
      return "aim met";
    case Verdict::kTarget:
      return "met";
    case Verdict::kMissed:
      return "MISSED";
    default:
      return "";
  }
}

std::string Bound(const Ratio& ratio, double bound) {
  if (bound == 0) return "";
  char text[32];
  snprintf(text, sizeof text, "%s %.4g", ratio.sense == Ratio::Sense::kAtMost ? "<=" : ">=", bound);
  return text;
}

// 12.3 ns, 4.56 us, 7.89 ms.
std::string Time(double nanoseconds) {
  char text[32];
  if (nanoseconds < 1e3) {
    snprintf(text, sizeof text, "%.1f ns", nanoseconds);
  } else if (nanoseconds < 1e6) {
    snprintf(text, sizeof text, "%.2f us", nanoseconds / 1e3);
  } else {
    snprintf(text, sizeof text, "%.2f ms", nanoseconds / 1e6);
  }
  return text;
}

struct Line {
  const Ratio* ratio;
  double value, measured, against, spread;
  Verdict verdict;
};

void PrintLine(const Line& line) {
  const Ratio& ratio = *line.ratio;
  printf("  %-52s %9.2f  %-8s %-8s %-8s %11s %11s %5.0f%%\n", ratio.label.c_str(), line.value,
         Bound(ratio, ratio.target).c_str(), Bound(ratio, ratio.aim).c_str(), Word(line.verdict),
         Time(line.measured).c_str(), Time(line.against).c_str(), 100 * line.spread);
}

void WriteJson(const std::vector<Line>& lines, const std::string& name) {
  FILE* const file = fopen(name.c_str(), "w");
  if (file == nullptr) {
    perror(name.c_str());
    return;
  }
  fprintf(file, "[");
  const char* separator = "\n";
  for (const Line& line : lines) {
    const Ratio& ratio = *line.ratio;
    fprintf(file,
            "%s  {\"group\": \"%s\", \"case\": \"%s\", \"ratio\": %.4f, \"sense\": \"%s\", "
            "\"target\": %.4g, \"aim\": %.4g, \"verdict\": \"%s\", \"measured_ns\": %.2f, "
            "\"against_ns\": %.2f, \"spread\": %.3f}",
            separator, ratio.group.c_str(), ratio.label.c_str(), line.value,
            ratio.sense == Ratio::Sense::kAtMost ? "at most" : "at least", ratio.target, ratio.aim,
            Word(line.verdict), line.measured, line.against, line.spread);
    separator = ",\n";
  }
  fprintf(file, "\n]\n");
  fclose(file);
}

}  // namespace

bool Report(const std::vector<Ratio>& ratios, const PairTimes& times, const std::string& file) {
  std::vector<Line> lines;
  int asked = 0;
  int missed = 0;
  std::string group;
  for (const Ratio& ratio : ratios) {
    const PairMedians medians = times.Medians(ratio.Name());
    if (medians.ratio == 0) continue;
    const double value = medians.ratio * ratio.againstParts / ratio.measuredParts;
    const Verdict verdict = Judge(ratio, value);
    asked += verdict != Verdict::kNone;
    missed += verdict == Verdict::kMissed;
    if (ratio.group != group) {
      group = ratio.group;
      printf("\n%-54s %9s  %-8s %-8s %-8s %11s %11s %6s\n", group.c_str(), "ratio", "target", "aim",
             "", "measured", "against", "spread");
    }
    lines.push_back({&ratio, value, medians.measured / ratio.measuredParts,
                     medians.against / ratio.againstParts, medians.spread, verdict});
    PrintLine(lines.back());
  }
  printf("\n%d of %d targets met\n", asked - missed, asked);
  if (!file.empty()) WriteJson(lines, file);
  return missed == 0;
}

}  // namespace bench
