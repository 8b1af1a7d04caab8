// The wire's own format texts, read by the compiler: a wrong value type does not build, and at run
// time nothing is interpreted.
//
// Marks: "%s" (a C text, null read as empty, a std::string_view, a PaddedText or a FixedText), "%c"
// (char), "%d" (int, a byte of the host's or a RepeatedNumber), "%ld" (any integer) and the
// zero-padded "%0Nd" (int).
#ifndef QUORVANE_GATEWAY_CORE_WIRE_FORMAT_H_
#define QUORVANE_GATEWAY_CORE_WIRE_FORMAT_H_

#include <cstddef>

// A format text as a type, so that its marks are known while compiling.
#define WIRE(text)                                                  \
  ([] {                                                             \
    struct Format {                                                 \
      static constexpr const char* Chars() { return text; }         \
      static constexpr size_t Length() { return sizeof(text) - 1; } \
    };                                                              \
    return Format{};                                                \
  }())

// One mark of a format, with the literal text before it.
struct WireMark {
  size_t literalAt;
  size_t literalSize;
  char kind;  // 's', 'c', 'd', or 'l' for "%ld"; 0 behind the last mark
  size_t width;
};

// A format taken apart: its marks, then one entry for the literal text behind the last of them.
struct WirePlan {
  static constexpr size_t kMaxMarks = 24;

  WireMark marks[kMaxMarks + 1] = {};
  size_t count = 0;         // of the marks
  size_t literalChars = 0;  // of all literal texts together
};

template <class Format>
constexpr WirePlan PlanWire() {
  const char* const chars = Format::Chars();
  WirePlan plan;
  size_t at = 0;
  for (;;) {
    WireMark& mark = plan.marks[plan.count];
    mark.literalAt = at;
    while (at < Format::Length() && chars[at] != '%') ++at;
    mark.literalSize = at - mark.literalAt;
    plan.literalChars += mark.literalSize;
    if (at == Format::Length()) return plan;
    for (++at; chars[at] >= '0' && chars[at] <= '9'; ++at) {
      mark.width = mark.width * 10 + static_cast<size_t>(chars[at] - '0');
    }
    mark.kind = chars[at];
    at += chars[at] == 'l' ? 2 : 1;
    ++plan.count;
  }
}

template <class Format>
inline constexpr WirePlan kWirePlan = PlanWire<Format>();

#endif  // QUORVANE_GATEWAY_CORE_WIRE_FORMAT_H_
