// Texts built piece by piece.
//
// A piece is one format of the wire, joined to the text as C text: a NUL character that a "%c"
// brings in ends its own piece and loses the rest of that piece alone; the next piece follows
// directly.
//
//   line.Append(WIRE("|27=%d|28=%d|29=%s"), kind, type, code);
//   line.AppendPieces(MakePiece(WIRE("|33=")), MakePiece(WIRE("!!%s"), key));
#ifndef QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
#define QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_

#include <array>
#include <string_view>
#include <tuple>
#include <utility>

#include "gateway/core/wire_format.h"
#include "gateway/core/wire_value.h"

// What a format prints of these values, one for each of its marks, to the byte: written at `at`, or
// nowhere if that is null. Returns its size. This is the plain way, for a text that has next to no
// room left.
size_t PrintPiece(const char* format, const WireArgument* values, char* at);

// One format with the values of its marks.
template <class Format, class... Values>
class CWirePiece {
 public:
  explicit CWirePiece(const Values&... values) : m_values(values...) {}

  // At most how many bytes WriteTo touches.
  ALWAYS_INLINE size_t Bound() const { return BoundOf(kMarks); }

  // Returns the place behind the piece.
  ALWAYS_INLINE char* WriteTo(char* at) const {
    if (WriteMarks(at, kMarks)) WriteLiteral<sizeof...(Values)>(at);
    return at;
  }

  static const char* FormatChars() { return Format::Chars(); }

  // The values plainly, as PrintPiece takes them.
  std::array<WireArgument, sizeof...(Values)> Plain() const { return PlainOf(kMarks); }

 private:
  static constexpr std::index_sequence_for<Values...> kMarks = {};

  template <size_t... kAt>
  ALWAYS_INLINE size_t BoundOf(std::index_sequence<kAt...>) const {
    return (kWirePlan<Format>.literalChars + ... + std::get<kAt>(m_values).Bound());
  }

  template <size_t... kAt>
  ALWAYS_INLINE bool WriteMarks(char*& at, std::index_sequence<kAt...>) const {
    return (WriteMark<kAt>(at, std::get<kAt>(m_values)) && ...);
  }

  template <size_t... kAt>
  std::array<WireArgument, sizeof...(Values)> PlainOf(std::index_sequence<kAt...>) const {
    return {std::get<kAt>(m_values).Plain()...};
  }

  template <size_t kAt>
  ALWAYS_INLINE static void WriteLiteral(char*& at) {
    constexpr const WireMark& kMark = kWirePlan<Format>.marks[kAt];
    memcpy(at, Format::Chars() + kMark.literalAt, kMark.literalSize);
    at += kMark.literalSize;
  }

  // Writes the text before a mark and the mark's value; false ends the piece.
  template <size_t kAt, class Value>
  ALWAYS_INLINE static bool WriteMark(char*& at, const Value& value) {
    WriteLiteral<kAt>(at);
    if constexpr (std::is_same_v<Value, CharValue>) {
      if (Rarely(value.c == '\0')) return false;
    }
    at = value.WriteTo(at);
    return true;
  }

  std::tuple<Values...> m_values;
};

template <class Format, class... WireValues>
CWirePiece<Format, WireValues...> MakePieceOf(const WireValues&... values) {
  return CWirePiece<Format, WireValues...>(values...);
}

template <class Format, size_t... kAt, class... Values>
auto MakePieceOf(std::index_sequence<kAt...>, const Values&... values) {
  constexpr const WirePlan& kPlan = kWirePlan<Format>;
  return MakePieceOf<Format>(
      MakeWireValue<kPlan.marks[kAt].kind, kPlan.marks[kAt].width>(values)...);
}

// A piece of its own, to be appended with others: `format` is a WIRE("...") text, then one value
// for each of its marks.
template <class Format, class... Values>
auto MakePiece(Format, const Values&... values) {
  static_assert(kWirePlan<Format>.count == sizeof...(Values), "one value for each mark");
  return MakePieceOf<Format>(std::index_sequence_for<Values...>(), values...);
}

// The pieces, over a room that `Room` provides: `bool Room::MakeRoom(size_t)` is asked when the
// next characters do not fit and either makes them fit or says no, for good. `Room::kGrows` is
// false where it always says no.
template <class Room>
class CWireText {
 public:
  // Joins one piece, whole or not at all.
  template <class Format, class... Values>
  void Append(Format format, const Values&... values) {
    AppendPieces(MakePiece(format, values...));
  }

  // Joins several as one after the other would be joined. The room is asked for once, with a bound
  // that is cheap to know; where that does not fit a text that cannot grow, exact sizes count. The
  // place is held in a local meanwhile, so that it stays in a register.
  template <class... Pieces>
  void AppendPieces(const Pieces&... pieces) {
    const size_t bound = (pieces.Bound() + ...);
    if (Mostly(Has(bound)) || (Room::kGrows && MakeRoom(bound))) {
      char* at = m_pAt;
      ((at = pieces.WriteTo(at)), ...);
      m_pAt = at;
    } else if constexpr (!Room::kGrows) {
      (AppendTightly(pieces), ...);
    }
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
    if (Mostly(Has(value.Bound())) || MakeRoom(value.Bound())) m_pAt = value.WriteTo(m_pAt);
  }

  template <class Piece>
  __attribute__((noinline, cold)) void AppendTightly(Piece piece) {
    AppendPrinted(Piece::FormatChars(), piece.Plain().data());
  }

  void AppendPrinted(const char* format, const WireArgument* values) {
    const size_t size = PrintPiece(format, values, nullptr);
    if (Has(size) || MakeRoom(size)) m_pAt += PrintPiece(format, values, m_pAt);
  }
};

#endif  // QUORVANE_GATEWAY_CORE_WIRE_TEXT_H_
