// dictionary_answers: answers calls of the native methods, one a line of standard input:
//
//   AuthEncode<tab>0<tab>0<tab>7<tab>SN0001...     arguments in Java order, without the status
//   array 1<tab>F=7|KIND=S...<tab>first log line<tab>... status ("none" without one), result, log
//   lines
//
// `\t`, `\n`, `\r` and `\\` stand for the characters. The clock stands at 2024-01-15 13:45:21.

#include <cstdlib>
#include <iostream>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/recording_host.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

constexpr std::string_view kPlain = "\t\n\r\\";
constexpr std::string_view kEscaped = "tnr\\";

std::string Escape(std::string_view text) {
  std::string escaped;
  for (const char c : text) {
    const size_t which = kPlain.find(c);
    if (which == std::string_view::npos) {
      escaped += c;
    } else {
      escaped.append({'\\', kEscaped[which]});
    }
  }
  return escaped;
}

// The fields of a line, unescaped.
std::vector<std::string> Fields(std::string_view line) {
  std::vector<std::string> fields(1);
  for (size_t i = 0; i < line.size(); ++i) {
    if (line[i] == '\t') {
      fields.emplace_back();
    } else if (line[i] == '\\' && i + 1 < line.size()) {
      fields.back() += kPlain[kEscaped.find(line[++i])];
    } else {
      fields.back() += line[i];
    }
  }
  return fields;
}

// One line's answer; empty when the line is no call.
std::string Answer(const std::vector<std::string>& fields) {
  const Export* row = FindExport(fields.front());
  const size_t status = row != nullptr && row->HasStatus() ? 1 : 0;
  if (row == nullptr || fields.size() != row->shape.size() - status + 1) return {};
  Arguments arguments;
  for (size_t i = 1; i < fields.size(); ++i) {
    const char letter = row->shape[i - 1];
    const bool text = letter == 'S';
    arguments.push_back(text ? Argument::Text(fields[i])
                             : Argument{letter, std::atoll(fields[i].c_str()), std::nullopt});
  }
  CRecordingHost host;
  const Outcome outcome = host.Call(*row, arguments);
  if (!outcome.violations.empty()) return {};
  std::string line = outcome.status.has_value() ? std::to_string(*outcome.status) : "none";
  line += "\t" + Escape(outcome.result.value_or(""));
  for (const std::string& text : outcome.logLines) line += "\t" + Escape(text);
  return line;
}

int Run() {
  EnterMarketTimeZone();
  SetClock("2024-01-15 13:45:21");
  std::ios::sync_with_stdio(false);
  for (std::string line; std::getline(std::cin, line);) {
    const std::string answer = Answer(Fields(line));
    if (answer.empty()) {
      std::cerr << "no call: " << line << "\n";
      return EXIT_FAILURE;
    }
    std::cout << answer << std::endl;
  }
  return EXIT_SUCCESS;
}

}  // namespace
}  // namespace gateway_tests

int main() {
  return gateway_tests::Run();
}
