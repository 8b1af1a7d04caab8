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

/// Takes `prefix` (a key and the blank after it, or the whole line) off the front of the line.
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

/// Reads one file line by line.
class CGoldenReader {
 public:
  CGoldenReader(std::string file, TGoldenCases& out) : m_File(std::move(file)), m_Out(out) {}

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
    if (m_Titles.empty()) Error("no case in the file");
  }

 private:
  bool ReadLine(std::string_view line) {
    if (TakeKey(line, "==")) return BeginCase(line);
    if (!m_bInCase) return false;
    if (TakeKey(line, "op")) return Set(m_Case.m_Operation, line);
    if (TakeKey(line, "clock")) return Set(m_Case.m_Clock, line);
    if (TakeKey(line, "arg")) return ReadArgument(line);
    if (TakeKey(line, "status")) return ReadStatus(line);
    if (TakeKey(line, "result")) {
      if (m_bResult) return false;
      m_bResult = true;
      return Unescape(line, m_Case.m_Result);
    }
    if (TakeKey(line, "log")) {
      if (!m_Case.m_LogLines.has_value()) m_Case.m_LogLines.emplace();
      return Unescape(line, m_Case.m_LogLines->emplace_back());
    }
    return false;
  }

  bool BeginCase(std::string_view title) {
    EndCase();
    m_bInCase = true;
    m_Case.m_File = m_File;
    m_Case.m_nLine = m_nLine;
    m_Case.m_Title = title;
    if (!m_Titles.insert(m_Case.TestName()).second) Error("title used twice");
    return !title.empty();
  }

  static bool Set(std::string& field, std::string_view value) {
    if (!field.empty() || value.empty()) return false;
    field = value;
    return true;
  }

  bool ReadArgument(std::string_view line) {
    TArgument argument;
    int64_t& number = argument.m_nNumber;
    bool good = true;
    if (TakeKey(line, "str")) {
      argument.m_chLetter = 'S';
      good = Unescape(line, argument.m_Text.emplace());
    } else if (line == "null") {
      argument.m_chLetter = 'S';
    } else if (TakeKey(line, "int")) {
      good = ReadNumber(line, INT32_MIN, INT32_MAX, number);
    } else if (TakeKey(line, "byte")) {
      argument.m_chLetter = 'b';
      good = ReadNumber(line, INT8_MIN, INT8_MAX, number);
    } else if (TakeKey(line, "char")) {
      argument.m_chLetter = 'c';
      good = ReadNumber(line, 0, UINT16_MAX, number);
    } else {
      return false;
    }
    m_Case.m_Arguments.push_back(std::move(argument));
    return good;
  }

  bool ReadStatus(std::string_view line) {
    if (m_bStatus) return false;
    m_bStatus = true;
    if (line == "none") return true;
    int64_t number = 0;
    if (!ReadNumber(line, INT32_MIN, INT32_MAX, number)) return false;
    m_Case.m_Status = static_cast<int32_t>(number);
    return true;
  }

  void EndCase() {
    if (m_bInCase) {
      if (m_Case.m_Operation.empty()) CaseError("no op");
      if (!m_bStatus) CaseError("no status");
      if (!m_bResult) CaseError("no result");
      CheckShape();
      m_Out.m_Cases.push_back(std::move(m_Case));
    }
    m_Case = TGoldenCase();
    m_bInCase = m_bStatus = m_bResult = false;
  }

  void CheckShape() {
    const TExport* const row = FindExport(m_Case.m_Operation);
    if (row == nullptr) return CaseError("no operation is named " + m_Case.m_Operation);
    std::string shape;
    for (const TArgument& argument : m_Case.m_Arguments) shape.push_back(argument.m_chLetter);
    if (row->HasStatus()) shape.push_back('s');
    if (shape != row->m_szShape) {
      CaseError("arguments " + shape + " where " + std::string(row->m_szShape) + " is declared");
    }
    if (row->HasStatus() != m_Case.m_Status.has_value()) CaseError("status does not fit");
  }

  void Error(const std::string& text) {
    m_Out.m_Errors.push_back(m_File + ":" + std::to_string(m_nLine) + ": " + text);
  }
  void CaseError(const std::string& text) {
    m_Out.m_Errors.push_back(m_Case.Where() + ": " + text);
  }

  std::string m_File;
  TGoldenCases& m_Out;
  std::set<std::string> m_Titles;
  TGoldenCase m_Case;
  int m_nLine = 0;
  bool m_bInCase = false;
  bool m_bStatus = false;
  bool m_bResult = false;
};

}  // namespace

std::string TGoldenCase::Where() const {
  return m_File + ":" + std::to_string(m_nLine) + ": " + m_Title;
}

std::string TGoldenCase::TestName() const {
  std::string name;
  for (char c : m_Title) {
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

int64_t TGoldenCase::PlatformRow() const {
  const TExport* const row = FindExport(m_Operation);
  const bool encoder = row != nullptr && row->m_szShape.substr(0, 3) == "iii";
  return encoder && m_Arguments.size() > 1 ? m_Arguments[1].m_nNumber : 0;
}

TGoldenCases ReadGoldenCases(const std::string& directory) {
  std::vector<std::filesystem::path> files;
  std::error_code error;
  for (const auto& entry : std::filesystem::directory_iterator(directory, error)) {
    if (entry.path().extension() == ".txt") files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  TGoldenCases cases;
  if (files.empty()) cases.m_Errors.push_back("no golden file in " + directory);
  for (const auto& file : files) {
    std::ifstream in(file);
    CGoldenReader(file.filename().string(), cases).Read(in);
  }
  return cases;
}

bool SetClockOf(const TGoldenCase& golden) {
  return SetClock(golden.m_Clock.empty() ? "2024-01-15 13:45:21" : golden.m_Clock);
}

std::string PlatformName(int64_t row) {
  CRecordingHost host;
  const TOutcome outcome = host.Call(
      *FindExport("AuthEncode"),
      {TArgument::Int(0), TArgument::Int(row), TArgument::Int(0), TArgument::Text("S"),
       TArgument::Text("1.2.3.4"), TArgument::Text(""), TArgument::Text("&"), TArgument::Text("")});
  const std::string request = outcome.m_Result.value_or("");
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
