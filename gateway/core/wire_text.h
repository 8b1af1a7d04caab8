// Texts built piece by piece from the wire's own format texts.
//
// A piece is one printf-like format, joined to the text as C text: a NUL character that a "%c"
// brings in ends its own piece and loses the rest of that piece alone; the next piece follows
// directly. Formats are read by the compiler, so a wrong value type does not build and nothing is
// interpreted at run time:
//
//   line.Append(WIRE("|27=%d|28=%d|29=%s"), kind, type, code);
//
// Marks: "%s" (a C text, null read as empty, or a std::string_view), "%c", "%d" (int),
// "%ld" (any integer) and the zero-padded "%0Nd".
#ifndef QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
#define QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_

#include <cstring>
#include <string_view>
#include <type_traits>

#include "gateway/core/decimal.h"

// A format text as a type, so that its marks are read while compiling.
#define WIRE(text)                                                  \
  ([] {                                                             \
    struct Format {                                                 \
      static constexpr const char* Chars() { return text; }         \
      static constexpr size_t Length() { return sizeof(text) - 1; } \
    };                                                              \
    return Format{};                                                \
  }())

// One mark of a format: what it prints, its zero-padded width and where the format goes on.
struct WireMark {
  char kind;
  size_t width;
  size_t next;
};

template <class Format>
constexpr size_t FindMark(size_t from) {
  while (from < Format::Length() && Format::Chars()[from] != '%') ++from;
  return from;
}

template <class Format>
constexpr WireMark ReadMark(size_t at) {
  WireMark mark = {'d', 0, at + 1};
  while (Format::Chars()[mark.next] >= '0' && Format::Chars()[mark.next] <= '9') {
    mark.width = mark.width * 10 + static_cast<size_t>(Format::Chars()[mark.next++] - '0');
  }
  if (Format::Chars()[mark.next] == 'l') {
    mark.kind = 'l';
    mark.next += 2;
  } else {
    mark.kind = Format::Chars()[mark.next++];
  }
  return mark;
}

inline std::string_view AsText(const char* text) {
  return text == nullptr ? std::string_view() : std::string_view(text);
}
inline std::string_view AsText(std::string_view text) {
  return text;
}

// The pieces, over a room that `Room` provides: `bool Room::MakeRoom(size_t)` is asked when the
// next characters do not fit and either makes them fit or says no, for good.
template <class Room>
class CWireText {
 public:
  // Joins one piece: `format` is a WIRE("...") text, then one value for each of its marks.
  template <class Format, class... Values>
  void Append(Format, const Values&... values) {
    AppendFrom<Format, 0>(values...);
  }

  void AppendText(std::string_view text) {
    if (text.empty() || !Has(text.size())) return;
    memcpy(m_pAt, text.data(), text.size());
    m_pAt += text.size();
  }

  void AppendChar(char c) {
    if (Has(1)) *m_pAt++ = c;
  }

  // Printed as "%0<width>d"; width 0 is the plain number.
  void AppendNumber(int64_t value, size_t width = 0) {
    const CDecimal decimal(value, width);
    if (!Has(decimal.Size())) return;
    decimal.WriteTo(m_pAt);
    m_pAt += decimal.Size();
  }

 protected:
  CWireText(char* at, char* end) : m_pAt(at), m_pEnd(end) {}

  char* m_pAt;   // where the next character goes
  char* m_pEnd;  // the place kept for the terminator

 private:
  bool Has(size_t count) {
    return static_cast<size_t>(m_pEnd - m_pAt) >= count ||
           static_cast<Room*>(this)->MakeRoom(count);
  }

  template <class Format, size_t kFrom, class... Values>
  void AppendFrom(const Values&... values) {
    constexpr size_t kMark = FindMark<Format>(kFrom);
    if constexpr (kMark > kFrom) AppendText({Format::Chars() + kFrom, kMark - kFrom});
    if constexpr (kMark < Format::Length()) {
      static_assert(sizeof...(Values) > 0, "a mark of the format has no value");
      AppendValue<Format, kMark>(values...);
    } else {
      static_assert(sizeof...(Values) == 0, "a value has no mark in the format");
    }
  }

  template <class Format, size_t kAt, class Value, class... Rest>
  void AppendValue(const Value& value, const Rest&... rest) {
    constexpr WireMark kMark = ReadMark<Format>(kAt);
    if constexpr (kMark.kind == 's') {
      AppendText(AsText(value));
    } else if constexpr (kMark.kind == 'c') {
      static_assert(std::is_same_v<Value, char>, "%c takes a char");
      if (value == '\0') return;
      AppendChar(value);
    } else {
      static_assert(kMark.kind == 'l' || kMark.kind == 'd', "an unknown mark");
      static_assert(kMark.kind == 'l' ? std::is_integral_v<Value> : std::is_same_v<Value, int>,
                    "%d takes an int, %ld an integer");
      AppendNumber(static_cast<int64_t>(value), kMark.width);
    }
    AppendFrom<Format, kMark.next>(rest...);
  }
};

#endif  // QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
