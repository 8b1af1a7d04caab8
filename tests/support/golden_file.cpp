#include "tests/support/golden_file.h"

#include <algorithm>
#include <charconv>
#include <filesystem>
#include <fstream>
#include <functional>
#include <map>
#include <set>
#include <string_view>

#include "tests/support/golden_text.h"
#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

// Takes `key` (and the blank behind it) off the front of the line.
bool TakeKey(std::string_view& line, std::string_view key) {
  if (line.substr(0, key.size()) != key) return false;
  if (line.size() > key.size() && line[key.size()] != ' ') return false;
  line.remove_prefix(std::min(line.size(), key.size() + 1));
  return true;
}

// Takes the first word off the front of the line.
std::string_view TakeWord(std::string_view& line) {
  const std::string_view word = line.substr(0, line.find(' '));
  line.remove_prefix(std::min(line.size(), word.size() + 1));
  return word;
}

bool ReadNumber(std::string_view text, int64_t low, int64_t high, int64_t& out) {
  const char* const end = text.data() + text.size();
  const auto read = std::from_chars(text.data(), end, out);
  return read.ec == std::errc() && read.ptr == end && low <= out && out <= high;
}

// A number, or a character in quotes.
bool ReadCode(std::string_view text, int64_t low, int64_t high, int64_t& out) {
  const bool quoted = text.size() == 3 && text.front() == '\'' && text.back() == '\'';
  if (!quoted) return ReadNumber(text, low, high, out);
  out = text[1];
  return ' ' <= out && out <= '~';
}

// What stands behind an argument's name: its type and its value.
bool ReadValue(std::string_view line, Argument& out) {
  if (TakeKey(line, "str")) {
    out.letter = 'S';
    out.text = Unescape(line);
    return out.text.has_value();
  }
  if (line == "null") {
    out.letter = 'S';
    return true;
  }
  if (TakeKey(line, "int")) return ReadNumber(line, INT32_MIN, INT32_MAX, out.number);
  if (TakeKey(line, "byte")) {
    out.letter = 'b';
    return ReadCode(line, INT8_MIN, INT8_MAX, out.number);
  }
  out.letter = 'c';
  return TakeKey(line, "char") && ReadCode(line, 0, UINT16_MAX, out.number);
}

using NamedArguments = std::map<std::string, Argument, std::less<>>;

// Reads one file line by line.
class CGoldenReader {
 public:
  CGoldenReader(std::string file, Unanswered unanswered, GoldenCases& out)
      : m_file(std::move(file)), m_unanswered(unanswered), m_out(out) {}

  void Read(std::istream& in) {
    std::string line;
    while (std::getline(in, line)) {
      ++m_nLine;
      if (!line.empty() && (line.back() == ' ' || line.back() == '\r' || line.back() == '\t')) {
        Error("the line ends in a blank (write \\s)");
      }
      if (line.empty() || line[0] == '#') {
        EndCase();
      } else if (!ReadLine(line)) {
        Error("not understood: " + line);
      }
    }
    EndCase();
    if (m_titles.empty()) Error("no case in the file");
  }

 private:
  bool ReadLine(std::string_view line) {
    if (TakeKey(line, "==")) return BeginCase(line);
    if (TakeKey(line, "usual")) return ReadUsual(line);
    if (!m_bInCase) return false;
    if (TakeKey(line, "op")) return Set(m_case.operation, line);
    if (TakeKey(line, "clock")) return Set(m_case.clock, line);
    if (TakeKey(line, "status")) return ReadStatus(line);
    if (TakeKey(line, "result")) {
      const std::optional<std::string> result = Unescape(line);
      if (m_bResult || !result.has_value()) return false;
      m_bResult = true;
      m_case.result = *result;
      return true;
    }
    if (TakeKey(line, "log")) {
      const std::optional<std::string> text = Unescape(line);
      if (!m_case.logLines.has_value()) m_case.logLines.emplace();
      m_case.logLines->push_back(text.value_or(""));
      return text.has_value();
    }
    const std::string name(TakeWord(line));
    Argument argument;
    return ReadValue(line, argument) && m_named.emplace(name, std::move(argument)).second;
  }

  // What holds from here on for each case that does not say otherwise.
  bool ReadUsual(std::string_view line) {
    EndCase();
    const std::string name(TakeWord(line));
    if (name == "clock") {
      m_usualClock = line;
      return true;
    }
    Argument argument;
    if (!ReadValue(line, argument)) return false;
    m_usual[name] = std::move(argument);
    return true;
  }

  bool BeginCase(std::string_view title) {
    EndCase();
    m_bInCase = true;
    m_case.file = m_file;
    m_case.line = m_nLine;
    m_case.title = title;
    if (!m_titles.insert(m_case.TestName()).second) Error("title used twice");
    return !title.empty();
  }

  static bool Set(std::string& field, std::string_view value) {
    if (!field.empty() || value.empty()) return false;
    field = value;
    return true;
  }

  bool ReadStatus(std::string_view line) {
    if (m_case.status.has_value()) return false;
    int64_t number = 0;
    if (!ReadNumber(line, INT32_MIN, INT32_MAX, number)) return false;
    m_case.status = static_cast<int32_t>(number);
    return true;
  }

  void EndCase() {
    if (!m_bInCase) return;
    const Export* const row = FindExport(m_case.operation);
    if (row == nullptr) {
      CaseError("no operation is named \"" + m_case.operation + "\"");
    } else {
      FillCase(*row);
      m_out.cases.push_back(std::move(m_case));
    }
    m_case = GoldenCase();
    m_named.clear();
    m_bInCase = m_bResult = false;
  }

  void FillCase(const Export& row) {
    if (m_case.clock.empty()) m_case.clock = m_usualClock;
    if (!m_bResult && m_unanswered == Unanswered::kError) {
      CaseError("no result (scripts/golden --accept writes it)");
    }
    if (row.HasStatus()) {
      m_case.status = m_case.status.value_or(1);
    } else if (m_case.status.has_value()) {
      CaseError("the method has no status");
    }
    const std::vector<std::string_view> names = row.ArgumentNames();
    for (size_t i = 0; i < names.size(); ++i) AddArgument(names[i], row.shape[i]);
    for (const auto& [name, argument] : m_named) CaseError("no argument is named " + name);
  }

  void AddArgument(std::string_view name, char letter) {
    auto given = m_named.find(name);
    const bool usual = given == m_named.end();
    if (usual) given = m_usual.find(name);
    if (given == (usual ? m_usual : m_named).end()) {
      return CaseError("no value for " + std::string(name));
    }
    if (given->second.letter != letter) CaseError(std::string(name) + " has another type");
    m_case.arguments.push_back(given->second);
    if (!usual) m_named.erase(given);
  }

  void Error(const std::string& text) {
    m_out.errors.push_back(m_file + ":" + std::to_string(m_nLine) + ": " + text);
  }
  void CaseError(const std::string& text) { m_out.errors.push_back(m_case.Where() + ": " + text); }

  std::string m_file;
  Unanswered m_unanswered;
  GoldenCases& m_out;
  std::set<std::string> m_titles;
  std::string m_usualClock;
  NamedArguments m_usual;
  GoldenCase m_case;
  NamedArguments m_named;  // those that the case names
  int m_nLine = 0;
  bool m_bInCase = false;
  bool m_bResult = false;
};

}  // namespace

std::string GoldenCase::Where() const {
  return file + ":" + std::to_string(line) + ": " + title;
}

std::string GoldenCase::TestName() const {
  std::string name;
  for (char c : title) {
    const bool word = (c >= '0' && c <= '9') || (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
    if (word) {
      name.push_back(c);
    } else if (!name.empty() && name.back() != '_') {
      name.push_back('_');
    }
  }
  while (!name.empty() && name.back() == '_') name.pop_back();
  return name;
}

int64_t GoldenCase::PlatformRow() const {
  const Export* const row = FindExport(operation);
  const bool encoder = row != nullptr && row->shape.substr(0, 3) == "iii";
  return encoder && arguments.size() > 1 ? arguments[1].number : 0;
}

GoldenCases ReadGoldenCases(const std::string& directory, Unanswered unanswered) {
  std::vector<std::filesystem::path> files;
  std::error_code error;
  for (const auto& entry : std::filesystem::directory_iterator(directory, error)) {
    if (entry.path().extension() == ".txt") files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  GoldenCases cases;
  if (files.empty()) cases.errors.push_back("no golden file in " + directory);
  for (const auto& file : files) {
    std::ifstream in(file);
    CGoldenReader(file.filename().string(), unanswered, cases).Read(in);
  }
  return cases;
}

bool SetClockOf(const GoldenCase& golden) {
  return SetClock(golden.clock);
}

std::string PlatformName(int64_t row) {
  CRecordingHost host;
  const Outcome outcome = host.Call(
      *FindExport("AuthEncode"),
      {Argument::Int(0), Argument::Int(row), Argument::Int(0), Argument::Text("S"),
       Argument::Text("1.2.3.4"), Argument::Text(""), Argument::Text("&"), Argument::Text("")});
  const std::string request = outcome.result.value_or("");
  const size_t begin = request.find("|11=") + 4;
  return request.substr(begin, request.find('|', begin) - begin);
}

std::string FillPlatformName(std::string text, const std::string& platformName) {
  constexpr std::string_view kMarker = "{11}";
  for (size_t at = 0; (at = text.find(kMarker, at)) != std::string::npos;) {
    text.replace(at, kMarker.size(), platformName);
    at += platformName.size();
  }
  return text;
}

}  // namespace gateway_tests
