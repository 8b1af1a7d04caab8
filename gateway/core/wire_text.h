// Texts built piece by piece.
//
// A piece is one format of the wire, joined to the text as C text: a NUL character that a "%c"
// brings in ends its own piece and loses the rest of that piece alone; the next piece follows
// directly.
//
//   line.Append(WIRE("|27=%d|28=%d|29=%s"), kind, type, code);
#ifndef QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
#define QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_

#include <cstring>
#include <string_view>
#include <type_traits>
#include <utility>

#include "gateway/core/branch_hints.h"
#include "gateway/core/decimal.h"
#include "gateway/core/wire_format.h"

inline std::string_view AsText(const char* text) {
  return text == nullptr ? std::string_view() : std::string_view(text);
}
inline std::string_view AsText(std::string_view text) {
  return text;
}

// Copies `size` bytes. Most values of a line are a few characters long, so that two overlapping
// moves cost less than a call.
inline void CopyShort(char* to, const char* from, size_t size) {
  if (Rarely(size > 16)) {
    memcpy(to, from, size);
  } else if (size >= 8) {
    uint64_t head, tail;
    memcpy(&head, from, 8);
    memcpy(&tail, from + size - 8, 8);
    memcpy(to, &head, 8);
    memcpy(to + size - 8, &tail, 8);
  } else if (Mostly(size >= 4)) {
    uint32_t head, tail;
    memcpy(&head, from, 4);
    memcpy(&tail, from + size - 4, 4);
    memcpy(to, &head, 4);
    memcpy(to + size - 4, &tail, 4);
  } else if (size > 0) {
    to[0] = from[0];
    to[size / 2] = from[size / 2];
    to[size - 1] = from[size - 1];
  }
}

// The values of a piece as they are written: a size, at least a bound of it that costs nothing to
// know, and the writing itself, into room that was made before.
struct TextValue {
  std::string_view text;

  size_t Bound() const { return text.size(); }
  size_t Size() const { return text.size(); }
  char* WriteTo(char* at) const {
    CopyShort(at, text.data(), text.size());
    return at + text.size();
  }
};

// A text whose size the compiler knows.
template <size_t kSize>
struct FixedText {
  char chars[kSize];

  static size_t Bound() { return kSize; }
  static size_t Size() { return kSize; }
  char* WriteTo(char* at) const {
    memcpy(at, chars, kSize);
    return at + kSize;
  }
};

struct CharValue {
  char c;

  static size_t Bound() { return 1; }
  static size_t Size() { return 1; }
  char* WriteTo(char* at) const {
    *at = c;
    return at + 1;
  }
};

// `Signed` is int32_t or int64_t; `kWidth` as in "%0<width>d", 0 for the plain number.
template <class Signed, size_t kWidth>
struct NumberValue {
  // Numbers below it fill their width with zeros on the left, and fit 32 bits.
  static constexpr uint64_t kEnd = kWidth < 10 ? PowerOfTen(kWidth) : UINT32_MAX;

  Signed number;

  static size_t Bound() {
    return kWidth > kMaxDecimalSize<Signed> ? kWidth : kMaxDecimalSize<Signed>;
  }
  size_t Size() const { return DecimalSize(number, kWidth); }
  char* WriteTo(char* at) const {
    if constexpr (kWidth == 0) {
      if (number >= 0 && number < 10) return WriteDigits<1>(at, static_cast<uint32_t>(number));
      return WriteNumber(at, number);
    } else {
      if (Mostly(number >= 0 && static_cast<uint64_t>(number) < kEnd)) {
        return WriteDigits<kWidth>(at, static_cast<uint32_t>(number));
      }
    }
    return WriteDecimal(at, number, kWidth);
  }
};

// As NumberValue, with a width that is known only at run time.
struct PaddedValue {
  int64_t number;
  size_t width;

  size_t Bound() const { return DecimalSize(number, width); }
  size_t Size() const { return DecimalSize(number, width); }
  char* WriteTo(char* at) const { return WriteDecimal(at, number, width); }
};

inline TextValue MakeTextValue(std::string_view text) {
  return {text};
}
inline TextValue MakeTextValue(const char* text) {
  return {AsText(text)};
}
template <size_t kSize>
const FixedText<kSize>& MakeTextValue(const FixedText<kSize>& text) {
  return text;
}

// The value that a mark of this kind and width prints.
template <char kKind, size_t kWidth, class Value>
auto MakeWireValue(const Value& value) {
  if constexpr (kKind == 's') {
    return MakeTextValue(value);
  } else if constexpr (kKind == 'c') {
    static_assert(std::is_same_v<Value, char>, "%c takes a char");
    return CharValue{value};
  } else if constexpr (kKind == 'l') {
    static_assert(std::is_integral_v<Value>, "%ld takes an integer");
    return NumberValue<int64_t, kWidth>{static_cast<int64_t>(value)};
  } else {
    static_assert(kKind == 'd' && std::is_same_v<Value, int>, "%d takes an int");
    return NumberValue<int32_t, kWidth>{value};
  }
}

// The pieces, over a room that `Room` provides: `bool Room::MakeRoom(size_t)` is asked when the
// next characters do not fit and either makes them fit or says no, for good.
template <class Room>
class CWireText {
 public:
  // Joins one piece, whole or not at all: `format` is a WIRE("...") text, then one value for each
  // of its marks.
  template <class Format, class... Values>
  void Append(Format, const Values&... values) {
    static_assert(kWirePlan<Format>.count == sizeof...(Values), "one value for each mark");
    AppendMarks<Format>(std::index_sequence_for<Values...>(), values...);
  }

  void AppendText(std::string_view text) { AppendValue(TextValue{text}); }

  void AppendChar(char c) { AppendValue(CharValue{c}); }

  // Appends `count` characters that `write(char*)` writes in place, if they fit.
  template <class Write>
  void AppendWritten(size_t count, const Write& write) {
    if (!Has(count) && !MakeRoom(count)) return;
    write(m_pAt);
    m_pAt += count;
  }

  // Printed as "%0<width>d" prints it.
  void AppendPadded(int64_t number, size_t width) { AppendValue(PaddedValue{number, width}); }

 protected:
  CWireText(char* at, char* end) : m_pAt(at), m_pEnd(end) {}

  char* m_pAt;   // where the next character goes
  char* m_pEnd;  // the place kept for the terminator

 private:
  bool Has(size_t count) const { return static_cast<size_t>(m_pEnd - m_pAt) >= count; }
  bool MakeRoom(size_t count) { return static_cast<Room*>(this)->MakeRoom(count); }

  template <class Value>
  void AppendValue(const Value& value) {
    if (Mostly(Has(value.Bound())) || Has(value.Size()) || MakeRoom(value.Size())) {
      m_pAt = value.WriteTo(m_pAt);
    }
  }

  template <class Format, size_t... kAt, class... Values>
  void AppendMarks(std::index_sequence<kAt...>, const Values&... values) {
    constexpr const WirePlan& kPlan = kWirePlan<Format>;
    AppendPiece<Format, kAt...>(
        MakeWireValue<kPlan.marks[kAt].kind, kPlan.marks[kAt].width>(values)...);
  }

  // The room is asked for once a piece, with a bound that is cheap to know; the exact size counts
  // only where that bound does not fit. The place is held in a local meanwhile, so that it stays in
  // a register.
  template <class Format, size_t... kAt, class... Values>
  void AppendPiece(const Values&... values) {
    if (Rarely(!Has((kWirePlan<Format>.literalChars + ... + values.Bound()))) &&
        !MakeRoomFor<Format, kAt...>(values...)) {
      return;
    }
    char* at = m_pAt;
    if ((WriteMark<Format, kAt>(at, values) && ...)) WriteLiteral<Format, sizeof...(kAt)>(at);
    m_pAt = at;
  }

  template <class Format, size_t... kAt, class... Values>
  __attribute__((noinline)) bool MakeRoomFor(Values... values) {
    size_t size = 0;
    if ((CountMark<Format, kAt>(size, values) && ...)) {
      size += kWirePlan<Format>.marks[sizeof...(kAt)].literalSize;
    }
    return Has(size) || MakeRoom(size);
  }

  template <class Format, size_t kAt>
  static void WriteLiteral(char*& at) {
    constexpr const WireMark& kMark = kWirePlan<Format>.marks[kAt];
    if constexpr (kMark.literalSize > 0) {  // a list without room yet writes nothing to nowhere
      memcpy(at, Format::Chars() + kMark.literalAt, kMark.literalSize);
      at += kMark.literalSize;
    }
  }

  // Writes the text before a mark and the mark's value; false ends the piece.
  template <class Format, size_t kAt, class Value>
  static bool WriteMark(char*& at, const Value& value) {
    WriteLiteral<Format, kAt>(at);
    if constexpr (std::is_same_v<Value, CharValue>) {
      if (Rarely(value.c == '\0')) return false;
    }
    at = value.WriteTo(at);
    return true;
  }

  template <class Format, size_t kAt, class Value>
  static bool CountMark(size_t& size, const Value& value) {
    size += kWirePlan<Format>.marks[kAt].literalSize;
    if constexpr (std::is_same_v<Value, CharValue>) {
      if (value.c == '\0') return false;
    }
    size += value.Size();
    return true;
  }
};

#endif  // QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
