#include "tests/support/golden_text.h"

#include <algorithm>
#include <charconv>
#include <cstdio>

namespace gateway_tests {
namespace {

struct EscapedByte {
  char letter;
  char byte;
};

constexpr EscapedByte kEscapes[] = {
    {'n', '\n'}, {'r', '\r'}, {'t', '\t'}, {'s', ' '}, {'\\', '\\'}};

// Reads the escape that `text` begins with behind its backslash, and takes it off the front.
bool TakeEscape(std::string_view& text, std::string& out) {
  if (text.empty()) return false;
  const char letter = text.front();
  text.remove_prefix(1);
  if (letter == 'x') {
    unsigned value = 0;
    const std::string_view digits = text.substr(0, 2);
    const char* const end = digits.data() + digits.size();
    if (digits.size() < 2 || std::from_chars(digits.data(), end, value, 16).ptr != end)
      return false;
    text.remove_prefix(2);
    out.push_back(static_cast<char>(value));
    return value != 0;
  }
  const auto* const known = std::find_if(std::begin(kEscapes), std::end(kEscapes),
                                         [=](EscapedByte row) { return row.letter == letter; });
  if (known == std::end(kEscapes)) return false;
  out.push_back(known->byte);
  return true;
}

bool IsContinuation(char byte) {
  return (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
}

// Number of bytes of the well-formed character of UTF-8 that `text` begins with; 0 when there is
// none.
size_t CharacterSize(std::string_view text) {
  const auto first = static_cast<unsigned char>(text.front());
  const size_t size = first < 0x80 ? 1 : first < 0xC2 ? 0 : first < 0xE0 ? 2 : first < 0xF0 ? 3 : 4;
  if (first > 0xF4 || size > text.size()) return 0;
  for (size_t i = 1; i < size; ++i) {
    if (!IsContinuation(text[i])) return 0;
  }
  return size;
}

void AppendEscaped(std::string& out, char byte) {
  const auto* const known =
      std::find_if(std::begin(kEscapes), std::end(kEscapes),
                   [=](EscapedByte row) { return row.byte == byte && byte != ' '; });
  if (known != std::end(kEscapes)) {
    out.append({'\\', known->letter});
    return;
  }
  char hex[8];
  std::snprintf(hex, sizeof hex, "\\x%02x",
                static_cast<unsigned>(static_cast<unsigned char>(byte)));
  out.append(hex);
}

}  // namespace

std::optional<std::string> Unescape(std::string_view escaped) {
  std::string out;
  while (!escaped.empty()) {
    const char first = escaped.front();
    escaped.remove_prefix(1);
    if (first != '\\') {
      out.push_back(first);
    } else if (!TakeEscape(escaped, out)) {
      return std::nullopt;
    }
  }
  return out;
}

std::string Escape(std::string_view text) {
  std::string out;
  const bool blankAtEnd = !text.empty() && text.back() == ' ';
  if (blankAtEnd) text.remove_suffix(1);
  while (!text.empty()) {
    const size_t size = CharacterSize(text);
    const char first = text.front();
    const bool plain = size > 1 || (size == 1 && first >= ' ' && first != '\\' && first != 0x7F);
    if (plain) {
      out.append(text.substr(0, size));
      text.remove_prefix(size);
    } else {
      AppendEscaped(out, first);
      text.remove_prefix(1);
    }
  }
  return blankAtEnd ? out.append("\\s") : out;
}

size_t FirstDifference(std::string_view wanted, std::string_view got) {
  if (wanted == got) return std::string_view::npos;
  const size_t common = std::min(wanted.size(), got.size());
  size_t at = 0;
  while (at < common && wanted[at] == got[at]) ++at;
  const auto inside = [at](std::string_view text) {
    return at < text.size() && IsContinuation(text[at]);
  };
  if (inside(wanted) || inside(got)) {
    while (at > 0 && IsContinuation(wanted[at - 1])) --at;
    if (at > 0) --at;
  }
  return at;
}

std::string Marked(std::string_view text, size_t at) {
  constexpr size_t kShown = 60;  // bytes before the mark, and behind it
  at = std::min(at, text.size());
  size_t begin = at > kShown ? at - kShown : 0;
  size_t end = std::min(text.size(), at + kShown);
  while (begin > 0 && IsContinuation(text[begin])) --begin;
  while (end < text.size() && IsContinuation(text[end])) ++end;
  return (begin > 0 ? "\"…" : "\"") + Escape(text.substr(begin, at - begin)) + "»" +
         Escape(text.substr(at, end - at)) + (end < text.size() ? "…\"" : "\"");
}

}  // namespace gateway_tests
