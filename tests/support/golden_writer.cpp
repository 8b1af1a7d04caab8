#include "tests/support/golden_writer.h"

#include <algorithm>
#include <sstream>
#include <string_view>

#include "tests/support/golden_answer.h"
#include "tests/support/golden_text.h"
#include "tests/support/recording_host.h"

namespace gateway_tests {
namespace {

using Lines = std::vector<std::string>;

std::string_view KeyOf(std::string_view line) {
  return line.substr(0, line.find(' '));
}

bool IsAnswer(std::string_view line) {
  return KeyOf(line) == "status" || KeyOf(line) == "result" || KeyOf(line) == "log";
}

// A line of `key` and `text`, in which the name of an edition is left open.
std::string AnswerLine(const char* key, std::string text, const std::string& platform) {
  const bool isEdition = platform.find(' ') == std::string::npos;
  const std::string field = "|11=" + platform + "|";
  const size_t at = isEdition ? text.find(field) : std::string::npos;
  if (at != std::string::npos) text.replace(at, field.size(), "|11={11}|");
  const std::string escaped = Escape(text);
  return escaped.empty() ? key : std::string(key).append(" ").append(escaped);
}

Lines AnswerLines(const GoldenCase& golden, const Outcome& outcome, const std::string& platform) {
  Lines lines;
  if (outcome.status.value_or(1) != 1) lines.push_back("status " + std::to_string(*outcome.status));
  lines.push_back(AnswerLine("result", outcome.result.value_or(""), platform));
  if (!golden.logLines.has_value()) return lines;
  for (const std::string& line : outcome.logLines) {
    lines.push_back(AnswerLine("log", line, platform));
  }
  return lines;
}

// The lines of one case, with answers that hold.
Lines CaseWithAnswers(Lines lines, const GoldenCase& golden, Rewrite which) {
  SetClockOf(golden);
  CRecordingHost host;
  const Outcome outcome = host.Call(*FindExport(golden.operation), golden.arguments);
  const std::string platform = PlatformName(golden.PlatformRow());
  const bool answered = std::any_of(
      lines.begin(), lines.end(), [](const std::string& line) { return KeyOf(line) == "result"; });
  const bool holds = answered && TellDifference(golden, outcome, platform).empty();
  if (holds != (which == Rewrite::kGoodCases)) return lines;
  lines.erase(std::remove_if(lines.begin(), lines.end(), IsAnswer), lines.end());
  const Lines answers = AnswerLines(golden, outcome, platform);
  lines.insert(lines.end(), answers.begin(), answers.end());
  return lines;
}

}  // namespace

std::string WithAnswers(const std::string& text, const std::vector<GoldenCase>& cases,
                        Rewrite which) {
  std::istringstream in(text);
  Lines file;
  for (std::string line; std::getline(in, line);) file.push_back(line);
  std::string out;
  auto golden = cases.begin();
  for (size_t at = 0; at < file.size();) {
    size_t end = at + 1;
    Lines lines = {file[at]};
    if (KeyOf(file[at]) == "==" && golden != cases.end()) {
      while (end < file.size() && !file[end].empty() && file[end][0] != '#') ++end;
      lines.assign(file.begin() + static_cast<ptrdiff_t>(at),
                   file.begin() + static_cast<ptrdiff_t>(end));
      lines = CaseWithAnswers(std::move(lines), *golden++, which);
    }
    for (const std::string& line : lines) out.append(line).append("\n");
    at = end;
  }
  return out;
}

}  // namespace gateway_tests
