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
#include <utility>

#include "gateway/core/branch_hints.h"
#include "gateway/core/decimal.h"
#include "gateway/core/wire_format.h"

// The pieces, over a room that the derived class provides.
class CWireText {
 public:
  // Joins one piece, whole or not at all: `format` is a WIRE("...") text, then one value for each
  // of its marks.
  template <class Format, class... Values>
  void Append(Format, const Values&... values) {
    static_assert(kWireMarks<Format>.size() == sizeof...(Values) + 1, "one value for each mark");
    AppendValues<Format>(std::index_sequence_for<Values...>(), values...);
  }

  void AppendText(std::string_view text) {
    AppendWritten(text.size(), [text](char* at) { text.copy(at, text.size()); });
  }

  void AppendChar(char c) {
    AppendWritten(1, [c](char* at) { *at = c; });
  }

  // Printed as "%0<width>d" prints it.
  void AppendPadded(int64_t number, size_t width) {
    AppendWritten(DecimalSize(number, width),
                  [number, width](char* at) { WriteDecimal(at, number, width); });
  }

  // Appends `count` characters that `write(char*)` writes in place, if they fit.
  template <class Write>
  void AppendWritten(size_t count, const Write& write) {
    if (!Has(count) && !MakeRoom(count)) return;
    write(m_pAt);
    m_pAt += count;
  }

 protected:
  CWireText(char* at, char* end) : m_pAt(at), m_pEnd(end) {}
  ~CWireText() = default;

  // Asked when the next characters do not fit: makes room for `count`, or says no, for good.
  virtual bool MakeRoom(size_t count) = 0;

  char* m_pAt;   // where the next character goes
  char* m_pEnd;  // the place kept for the terminator

 private:
  bool Has(size_t count) const { return static_cast<size_t>(m_pEnd - m_pAt) >= count; }

  template <class Format, size_t... kAt, class... Values>
  void AppendValues(std::index_sequence<kAt...> marks, const Values&... values) {
    AppendPiece<Format>(marks, MakeWireValue<kWireMarks<Format>[kAt].kind>(values)...);
  }

  // The room is asked for once, with a bound that costs nothing to know. The place is held in a
  // local meanwhile, so that it stays in a register. Walking the marks at run time instead costs
  // 19 % of an order through a virtual machine and 10 to 26 % of a list.
  template <class Format, size_t... kAt, class... Values>
  void AppendPiece(std::index_sequence<kAt...>, Values... values) {
    if (Mostly(Has((Format::Text().size() + ... + Bound<Format, kAt>(values))))) {
      char* at = m_pAt;
      if ((... && WriteMark<Format, kAt>(at, values))) WriteLiteral<Format, sizeof...(kAt)>(at);
      m_pAt = at;
    } else {
      const WireValue plain[] = {values..., {}};
      AppendTightly(Format::Text(), plain);
    }
  }

  // At most how many bytes the writing of a value touches.
  template <class Format, size_t kAt>
  static size_t Bound(const WireValue& value) {
    constexpr WireMark kMark = kWireMarks<Format>[kAt];
    if (kMark.kind == 's') return static_cast<size_t>(value.number);
    return kMark.kind == 'c' ? 1 : kMaxDecimalSize + kMark.width;
  }

  template <class Format, size_t kAt>
  static void WriteLiteral(char*& at) {
    constexpr WireMark kMark = kWireMarks<Format>[kAt];
    memcpy(at, Format::Text().data() + kMark.literalAt, kMark.literalSize);
    at += kMark.literalSize;
  }

  // Writes the text before a mark and the mark's value; false ends the piece.
  template <class Format, size_t kAt>
  static bool WriteMark(char*& at, const WireValue& value) {
    constexpr WireMark kMark = kWireMarks<Format>[kAt];
    WriteLiteral<Format, kAt>(at);
    if constexpr (kMark.kind == 's') {
      const auto size = static_cast<size_t>(value.number);
      if (Mostly(size != 0)) memcpy(at, value.text, size);
      at += size;
    } else if constexpr (kMark.kind == 'c') {
      if (Rarely(value.number == 0)) return false;
      *at++ = static_cast<char>(value.number);
    } else {
      at = WriteNumber<kMark.width>(at, value.number);
    }
    return true;
  }

  // The same where that bound does not fit: each value asks for itself, to the byte.
  void AppendTightly(std::string_view format, const WireValue* values);
};

#endif  // QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
