// abi_digest [--without-log] DIRECTORY [CALLS]: plays the golden cases of a directory and a drawn
// load of CALLS calls for each export, and prints one digest for each export and one over all:
// every byte of each result, status and log line counts. It prints the same on every machine,
// whatever its word size, sign of `char` or compiler. Each export gets texts with bytes above 0x7F
// and with characters that are cut, or it fails. --without-log is for a library with a log of its
// own, whose lines do not come by here.

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "tests/abi/load.h"
#include "tests/support/golden_answer.h"
#include "tests/support/golden_file.h"
#include "tests/support/modified_utf8.h"
#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

constexpr size_t kDefaultCalls = 300;

// FNV-1a over 64 bits; texts are ended, so that no two sequences of texts run into the same bytes.
class CDigest {
 public:
  void Add(std::string_view text) {
    for (char c : text) AddByte(static_cast<unsigned char>(c));
    AddByte(0);
  }
  void Add(const Outcome& outcome) {
    Add(outcome.result.has_value() ? "result" : "no result");
    Add(outcome.result.value_or(""));
    Add(outcome.status.has_value() ? std::to_string(*outcome.status) : "none");
    for (const std::string& line : outcome.logLines) Add(line);
    Add("end");
  }
  std::string Text() const {
    char text[17];
    std::snprintf(text, sizeof(text), "%016llx", static_cast<unsigned long long>(m_nValue));
    return text;
  }

 private:
  void AddByte(unsigned char byte) { m_nValue = (m_nValue ^ byte) * 0x100000001B3U; }

  uint64_t m_nValue = 0xCBF29CE484222325U;
};

// What the arguments of calls held: where the sign of char could tell, and what lies behind.
struct Held {
  size_t foreign = 0;  // a byte above 0x7F
  size_t cut = 0;      // a byte that belongs to no whole character

  void Add(const Arguments& arguments) {
    bool anyForeign = false;
    bool anyCut = false;
    for (const Argument& argument : arguments) {
      if (!argument.text.has_value()) continue;
      for (const char c : *argument.text) {
        anyForeign = anyForeign || static_cast<unsigned char>(c) > 0x7F;
      }
      anyCut = anyCut || !IsModifiedUtf8(argument.text->c_str());
    }
    foreign += anyForeign ? 1 : 0;
    cut += anyCut ? 1 : 0;
  }
};

class CAbiRun {
 public:
  explicit CAbiRun(bool withLog) : m_bWithLog(withLog) {}

  bool Golden(const GoldenCases& golden) {
    for (const std::string& error : golden.errors) Fault(error, "is not well formed");
    for (const GoldenCase& one : golden.cases) PlayGolden(one);
    return m_nFaults == 0;
  }

  // Calls `row` as its golden cases do and as often as asked with disturbed arguments.
  void Load(const Export& row, const std::vector<const GoldenCase*>& cases, size_t calls) {
    if (cases.empty()) return Fault(std::string(row.name), "has no golden case");
    CDraw draw(cases.size());
    CRecordingHost host;
    Held held;
    for (size_t call = 0; call < calls; ++call) {
      const GoldenCase& golden = *cases[draw.Below(cases.size())];
      SetClockOf(golden);
      const Arguments arguments = Disturb(golden.arguments, draw);
      held.Add(arguments);
      const Outcome outcome = host.Call(row, arguments);
      if (!outcome.IsSound()) Fault(golden.Where(), "disturbed, is not answered soundly");
      Count(row, outcome);
    }
    if (held.foreign == 0) Fault(std::string(row.name), "had no text with a byte above 0x7F");
    if (held.cut == 0) Fault(std::string(row.name), "had no text with a cut character");
    m_held.foreign += held.foreign;
    m_held.cut += held.cut;
  }

  // Prints the digests; the exit status of the program.
  int Finish() const {
    CDigest all;
    for (const auto& [name, digest] : m_digests) {
      std::printf("%-24.*s %s\n", static_cast<int>(name.size()), name.data(),
                  digest.Text().c_str());
      all.Add(digest.Text());
    }
    std::printf("%zu calls with a byte above 0x7F, %zu with a cut character\n", m_held.foreign,
                m_held.cut);
    std::printf("all %zu exports, %zu calls %s\n", m_digests.size(), m_nCalls, all.Text().c_str());
    return m_nFaults == 0 && m_digests.size() == kExportCount ? EXIT_SUCCESS : EXIT_FAILURE;
  }

 private:
  void PlayGolden(GoldenCase golden) {
    if (!m_bWithLog) golden.logLines.reset();
    const Export& row = *FindExport(golden.operation);
    const std::string platform = PlatformName(golden.PlatformRow());
    if (!SetClockOf(golden)) Fault(golden.Where(), "has an odd clock");
    CRecordingHost host(Placement::kBeforeUnreadable);
    const Outcome outcome = host.Call(row, golden.arguments);
    const std::string difference = TellDifference(golden, outcome, platform);
    if (!difference.empty()) Fault(golden.Where(), difference);
    Count(row, outcome);
  }

  void Count(const Export& row, Outcome outcome) {
    if (!m_bWithLog) outcome.logLines.clear();
    m_digests[row.name].Add(outcome);
    ++m_nCalls;
  }

  void Fault(const std::string& where, const std::string& what) {
    std::fprintf(stderr, "%s: %s\n", where.c_str(), what.c_str());
    ++m_nFaults;
  }

  bool m_bWithLog;
  std::map<std::string_view, CDigest> m_digests;
  Held m_held;
  size_t m_nCalls = 0;
  size_t m_nFaults = 0;
};

int Run(const char* directory, size_t calls, bool withLog) {
  EnterMarketTimeZone();
  const GoldenCases golden = ReadGoldenCases(directory);
  CAbiRun run(withLog);
  if (!run.Golden(golden)) return EXIT_FAILURE;
  for (const Export& row : AllExports()) {
    std::vector<const GoldenCase*> cases;
    for (const GoldenCase& one : golden.cases) {
      if (one.operation == row.name && !one.arguments.empty()) cases.push_back(&one);
    }
    run.Load(row, cases, calls);
  }
  return run.Finish();
}

}  // namespace
}  // namespace gateway_tests

int main(int argc, char** argv) {
  const bool withLog = argc < 2 || std::strcmp(argv[1], "--without-log") != 0;
  char** arguments = withLog ? argv + 1 : argv + 2;
  const auto count = argv + argc - arguments;
  if (count != 1 && count != 2) {
    std::fprintf(stderr, "usage: abi_digest [--without-log] DIRECTORY [CALLS]\n");
    return EXIT_FAILURE;
  }
  const size_t calls =
      count == 2 ? std::strtoul(arguments[1], nullptr, 10) : gateway_tests::kDefaultCalls;
  return gateway_tests::Run(arguments[0], calls, withLog);
}
