// The wire's own format texts, read by the compiler: a wrong value type does not build, and at run
// time nothing is looked for but where a text has next to no room left.
//
// Marks: "%s" (a C text, null read as empty, or a std::string_view), "%c" (char), "%d" (int, or a
// byte of the host's), "%ld" (any integer) and the zero-padded "%0Nd" (int).
#ifndef QUORVANE_GATEWAY_CORE_WIRE_FORMAT_H_
#define QUORVANE_GATEWAY_CORE_WIRE_FORMAT_H_

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <type_traits>

// A format text as a type, so that its marks are known while compiling.
#define WIRE(text)                                              \
  ([] {                                                         \
    struct Format {                                             \
      static constexpr std::string_view Text() { return text; } \
    };                                                          \
    return Format{};                                            \
  }())

// One mark of a format and the literal text before it. Behind the last mark of a format stands one
// more, of kind 0, for the rest of the literal text.
struct WireMark {
  size_t literalAt;
  size_t literalSize;
  char kind;  // 's', 'c', 'd', or 'l' for "%ld"
  size_t width;
};

constexpr size_t CountMarks(std::string_view format) {
  size_t count = 0;
  for (char c : format) count += c == '%';
  return count;
}

// Reads the mark from `at` on, which goes behind it.
constexpr WireMark ReadMark(std::string_view format, size_t& at) {
  WireMark mark = {at, 0, 0, 0};
  while (at < format.size() && format[at] != '%') ++at;
  mark.literalSize = at - mark.literalAt;
  if (at == format.size()) return mark;
  for (++at; format[at] <= '9'; ++at) {
    mark.width = mark.width * 10 + static_cast<size_t>(format[at] - '0');
  }
  mark.kind = format[at];
  at += mark.kind == 'l' ? 2 : 1;
  return mark;
}

template <size_t kCount>
constexpr std::array<WireMark, kCount + 1> ReadMarks(std::string_view format) {
  std::array<WireMark, kCount + 1> marks = {};
  size_t at = 0;
  for (WireMark& mark : marks) mark = ReadMark(format, at);
  return marks;
}

template <class Format>
inline constexpr auto kWireMarks = ReadMarks<CountMarks(Format::Text())>(Format::Text());

// A value as the writer takes it, of a text the characters and their number.
struct WireValue {
  int64_t number;
  const char* text = nullptr;

  std::string_view Text() const { return {text, static_cast<size_t>(number)}; }
};

inline std::string_view AsText(const char* text) {
  return text == nullptr ? std::string_view() : std::string_view(text);
}
inline std::string_view AsText(std::string_view text) {
  return text;
}

template <char kKind, class Value>
WireValue MakeWireValue(const Value& value) {
  if constexpr (kKind == 's') {
    const std::string_view text = AsText(value);
    return {static_cast<int64_t>(text.size()), text.data()};
  } else {
    static_assert(kKind != 'c' || std::is_same_v<Value, char>, "%c takes a char");
    static_assert(kKind != 'd' || std::is_same_v<Value, int> || std::is_same_v<Value, uint8_t>,
                  "%d takes an int or a byte");
    static_assert(std::is_integral_v<Value>, "%ld takes an integer");
    return {static_cast<int64_t>(value)};
  }
}

#endif  // QUORVANE_GATEWAY_CORE_WIRE_FORMAT_H_
