#include "tests/support/golden_answer.h"

#include <algorithm>
#include <cctype>
#include <vector>

#include "tests/support/golden_text.h"

namespace gateway_tests {
namespace {

std::vector<std::string_view> Split(std::string_view text, char separator) {
  std::vector<std::string_view> parts;
  for (size_t end = 0; (end = text.find(separator)) != std::string_view::npos;) {
    parts.push_back(text.substr(0, end));
    text.remove_prefix(end + 1);
  }
  parts.push_back(text);
  return parts;
}

std::string WantedAndGot(std::string_view wanted, std::string_view got) {
  const size_t at = FirstDifference(wanted, got);
  return ": wanted " + Marked(wanted, at) + ", got " + Marked(got, at);
}

// The place and the two parts of a text in which it first differs from another.
struct Part {
  std::string place;
  std::string_view wanted;
  std::string_view got;
};

std::string Tell(const Part& part) {
  return part.place + WantedAndGot(part.wanted, part.got);
}

std::string_view TagOf(std::string_view field) {
  return field.substr(0, field.find('='));
}

// The field of a request, by its tag.
Part PartOfRequest(std::string_view wanted, std::string_view got) {
  const std::vector<std::string_view> fields = Split(wanted, '|');
  const std::vector<std::string_view> others = Split(got, '|');
  size_t i = 0;
  while (i < fields.size() && i < others.size() && fields[i] == others[i]) ++i;
  const std::string_view field = i < fields.size() ? fields[i] : std::string_view();
  const std::string_view other = i < others.size() ? others[i] : std::string_view();
  const std::string tag(TagOf(field));
  const bool sameTag = field.find('=') != std::string_view::npos && tag == TagOf(other) &&
                       other.find('=') != std::string_view::npos;
  if (!sameTag) return {"field " + std::to_string(i + 1), field, other};
  return {"tag " + tag, field.substr(tag.size() + 1), other.substr(tag.size() + 1)};
}

bool IsCount(std::string_view piece) {
  return !piece.empty() && std::all_of(piece.begin(), piece.end(), [](char c) {
    return std::isdigit(static_cast<unsigned char>(c)) != 0;
  });
}

// The column of a result: pieces end in '!', a count opens a list and a mark such as <5> a section.
Part PartOfResult(std::string_view wanted, std::string_view got) {
  const std::vector<std::string_view> pieces = Split(wanted, '!');
  const std::vector<std::string_view> others = Split(got, '!');
  std::string section;
  bool counted = false;
  size_t record = 1;
  for (size_t i = 0; i < std::max(pieces.size(), others.size()); ++i) {
    const std::string_view piece = i < pieces.size() ? pieces[i] : std::string_view();
    const std::string_view other = i < others.size() ? others[i] : std::string_view();
    const bool opensSection = piece.size() == 3 && piece.front() == '<' && piece.back() == '>';
    const bool isCount = !counted && IsCount(piece);
    if (piece == other) {
      if (opensSection) section = "section " + std::string(piece) + ", ";
      record = opensSection || isCount ? 1 : record + 1;
      counted = !opensSection;
      continue;
    }
    if (isCount && IsCount(other)) return {section + "count", piece, other};
    const std::vector<std::string_view> columns = Split(piece, '@');
    const std::vector<std::string_view> otherColumns = Split(other, '@');
    const std::string place = section + "record " + std::to_string(record);
    size_t column = 0;
    while (column < columns.size() && column < otherColumns.size() &&
           columns[column] == otherColumns[column]) {
      ++column;
    }
    const auto cell = [column](const std::vector<std::string_view>& cells) {
      return column < cells.size() ? cells[column] : std::string_view();
    };
    return {place + ", column " + std::to_string(column), cell(columns), cell(otherColumns)};
  }
  return {"text", wanted, got};
}

std::string TellLogDifference(const std::vector<std::string>& wanted,
                              const std::vector<std::string>& got) {
  size_t i = 0;
  while (i < wanted.size() && i < got.size() && wanted[i] == got[i]) ++i;
  if (i == wanted.size() && i == got.size()) return {};
  const std::string place = "log line " + std::to_string(i + 1);
  if (i == got.size()) return place + ": wanted \"" + Escape(wanted[i]) + "\", got none";
  if (i == wanted.size()) return place + ": wanted none, got \"" + Escape(got[i]) + "\"";
  return place + ", " + TellDifference(wanted[i], got[i]);
}

std::string Text(const std::optional<int32_t>& status) {
  return status.has_value() ? std::to_string(*status) : "none";
}

}  // namespace

std::string TellDifference(std::string_view wanted, std::string_view got) {
  if (wanted == got) return {};
  const auto isRequest = [](std::string_view text) { return text.substr(0, 2) == "F="; };
  const auto isResult = [](std::string_view text) { return !text.empty() && text.back() == '!'; };
  if (isRequest(wanted) && isRequest(got)) return Tell(PartOfRequest(wanted, got));
  if (isResult(wanted) && isResult(got)) return Tell(PartOfResult(wanted, got));
  return Tell({"text", wanted, got});
}

std::string TellDifference(const GoldenCase& golden, const Outcome& outcome,
                           const std::string& platform) {
  if (!outcome.violations.empty()) return outcome.violations.front();
  if (!outcome.result.has_value()) return "no result";
  const std::string wanted = FillPlatformName(golden.result, platform);
  if (*outcome.result != wanted) return "result, " + TellDifference(wanted, *outcome.result);
  if (outcome.status != golden.status) {
    return "status: wanted " + Text(golden.status) + ", got " + Text(outcome.status);
  }
  if (!golden.logLines.has_value()) return {};
  std::vector<std::string> lines = *golden.logLines;
  for (std::string& line : lines) line = FillPlatformName(line, platform);
  return TellLogDifference(lines, outcome.logLines);
}

}  // namespace gateway_tests
