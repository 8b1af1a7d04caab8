#ifndef TESTS_SUPPORT_GOLDEN_FILE_H_
#define TESTS_SUPPORT_GOLDEN_FILE_H_

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "tests/support/recording_host.h"

namespace gateway_tests {

// One golden case: a call with all that it must answer. The format is described in
// tests/vectors/README.md.
struct GoldenCase {
  std::string file;
  int line = 0;
  std::string title;
  std::string operation;
  std::string clock;
  Arguments arguments;
  std::optional<int32_t> status;
  std::string result;
  // None when the case says nothing about log lines.
  std::optional<std::vector<std::string>> logLines;

  // "login.txt:12: title".
  std::string Where() const;
  // The title as a test name: letters, digits and '_'.
  std::string TestName() const;
  // The platform row that the case passes; 0 for a decoder.
  int64_t PlatformRow() const;
};

// All cases of a directory's *.txt files in order, and what is wrong with the files.
struct GoldenCases {
  std::vector<GoldenCase> cases;
  std::vector<std::string> errors;
};

// Whether a case without a result is an error, or one that is still to be answered.
enum class Unanswered { kError, kTaken };

GoldenCases ReadGoldenCases(const std::string& directory,
                            Unanswered unanswered = Unanswered::kError);

// Stops the clock where the case has it; false when it names no such time.
bool SetClockOf(const GoldenCase& golden);

// The name that the library sends for a platform row, read from a header that it builds.
std::string PlatformName(int64_t row);

// `text` with each "{11}" replaced by the platform name.
std::string FillPlatformName(std::string text, const std::string& platformName);

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_GOLDEN_FILE_H_
