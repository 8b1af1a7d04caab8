#include "tests/support/golden_file.h"

#include <algorithm>
#include <charconv>
#include <filesystem>
#include <fstream>
#include <set>
#include <string_view>

#include "tests/support/surroundings.h"

namespace gateway_tests {
namespace {

// Takes `prefix` (a key and the blank after it, or the whole line) off the front of the line.
bool TakeKey(std::string_view& line, std::string_view key) {
  if (line.substr(0, key.size()) != key) return false;
  if (line.size() > key.size() && line[key.size()] != ' ') return false;
  line.remove_prefix(std::min(line.size(), key.size() + 1));
  return true;
}

bool Unescape(std::string_view text, std::string& out) {
  for (size_t i = 0; i < text.size(); ++i) {
    if (text[i] != '\\') {
      out.push_back(text[i]);
      continue;
    }
    if (++i == text.size()) return false;
    switch (text[i]) {
      case 'n':
        out.push_back('\n');
        break;
      case 'r':
        out.push_back('\r');
        break;
      case 't':
        out.push_back('\t');
        break;
      case 's':
        out.push_back(' ');
        break;
      case '\\':
        out.push_back('\\');
        break;
      case 'z':
        break;
      case 'x': {
        unsigned value = 0;
        const char* const digits = text.data() + i + 1;
        if (i + 2 >= text.size()) return false;
        if (std::from_chars(digits, digits + 2, value, 16).ptr != digits + 2) return false;
        if (value == 0) return false;
        out.push_back(static_cast<char>(value));
        i += 2;
        break;
      }
      default:
        return false;
    }
  }
  return true;
}

bool ReadNumber(std::string_view text, int64_t low, int64_t high, int64_t& out) {
  const char* const end = text.data() + text.size();
  const auto read = std::from_chars(text.data(), end, out);
  return read.ec == std::errc() && read.ptr == end && low <= out && out <= high;
}

// Reads one file line by line.
class CGoldenReader {
 public:
  CGoldenReader(std::string file, GoldenCases& out) : m_file(std::move(file)), m_out(out) {}

  void Read(std::istream& in) {
    std::string line;
    while (std::getline(in, line)) {
      ++m_nLine;
      if (!line.empty() && (line.back() == ' ' || line.back() == '\r' || line.back() == '\t')) {
        Error("the line ends in a blank (write \\s)");
      }
      if (line.empty() || line[0] == '#') continue;
      if (!ReadLine(line)) Error("not understood: " + line);
    }
    EndCase();
    if (m_titles.empty()) Error("no case in the file");
  }

 private:
  bool ReadLine(std::string_view line) {
    if (TakeKey(line, "==")) return BeginCase(line);
    if (!m_bInCase) return false;
    if (TakeKey(line, "op")) return Set(m_case.operation, line);
    if (TakeKey(line, "clock")) return Set(m_case.clock, line);
    if (TakeKey(line, "arg")) return ReadArgument(line);
    if (TakeKey(line, "status")) return ReadStatus(line);
    if (TakeKey(line, "result")) {
      if (m_bResult) return false;
      m_bResult = true;
      return Unescape(line, m_case.result);
    }
    if (TakeKey(line, "log")) {
      if (!m_case.logLines.has_value()) m_case.logLines.emplace();
      return Unescape(line, m_case.logLines->emplace_back());
    }
    return false;
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

  bool ReadArgument(std::string_view line) {
    Argument argument;
    int64_t& number = argument.number;
    bool good = true;
    if (TakeKey(line, "str")) {
      argument.letter = 'S';
      good = Unescape(line, argument.text.emplace());
    } else if (line == "null") {
      argument.letter = 'S';
    } else if (TakeKey(line, "int")) {
      good = ReadNumber(line, INT32_MIN, INT32_MAX, number);
    } else if (TakeKey(line, "byte")) {
      argument.letter = 'b';
      good = ReadNumber(line, INT8_MIN, INT8_MAX, number);
    } else if (TakeKey(line, "char")) {
      argument.letter = 'c';
      good = ReadNumber(line, 0, UINT16_MAX, number);
    } else {
      return false;
    }
    m_case.arguments.push_back(std::move(argument));
    return good;
  }

  bool ReadStatus(std::string_view line) {
    if (m_bStatus) return false;
    m_bStatus = true;
    if (line == "none") return true;
    int64_t number = 0;
    if (!ReadNumber(line, INT32_MIN, INT32_MAX, number)) return false;
    m_case.status = static_cast<int32_t>(number);
    return true;
  }

  void EndCase() {
    if (m_bInCase) {
      if (m_case.operation.empty()) CaseError("no op");
      if (!m_bStatus) CaseError("no status");
      if (!m_bResult) CaseError("no result");
      CheckShape();
      m_out.cases.push_back(std::move(m_case));
    }
    m_case = GoldenCase();
    m_bInCase = m_bStatus = m_bResult = false;
  }

  void CheckShape() {
    const Export* const row = FindExport(m_case.operation);
    if (row == nullptr) return CaseError("no operation is named " + m_case.operation);
    std::string shape;
    for (const Argument& argument : m_case.arguments) shape.push_back(argument.letter);
    if (row->HasStatus()) shape.push_back('s');
    if (shape != row->shape) {
      CaseError("arguments " + shape + " where " + std::string(row->shape) + " is declared");
    }
    if (row->HasStatus() != m_case.status.has_value()) CaseError("status does not fit");
  }

  void Error(const std::string& text) {
    m_out.errors.push_back(m_file + ":" + std::to_string(m_nLine) + ": " + text);
  }
  void CaseError(const std::string& text) { m_out.errors.push_back(m_case.Where() + ": " + text); }

  std::string m_file;
  GoldenCases& m_out;
  std::set<std::string> m_titles;
  GoldenCase m_case;
  int m_nLine = 0;
  bool m_bInCase = false;
  bool m_bStatus = false;
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

GoldenCases ReadGoldenCases(const std::string& directory) {
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
    CGoldenReader(file.filename().string(), cases).Read(in);
  }
  return cases;
}

bool SetClockOf(const GoldenCase& golden) {
  return SetClock(golden.clock.empty() ? "2024-01-15 13:45:21" : golden.clock);
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
