#include "gateway/core/wire_text.h"

#include <cstring>

namespace {

// The part of a piece's room that is not written yet.
struct Place {
  char* at;
  char* end;

  bool Has(size_t size) const { return static_cast<size_t>(end - at) >= size; }

  bool Put(const char* text, size_t size) {
    if (!Has(size)) return false;
    memcpy(at, text, size);
    at += size;
    return true;
  }

  bool PutNumber(int64_t number, size_t width) {
    if (!Has(DecimalSize(number, width))) return false;
    at = WriteDecimal(at, number, width);
    return true;
  }

  bool PutValue(const WireMark& mark, const WireValue& value) {
    if (mark.kind == 's') return Put(value.text, static_cast<size_t>(value.number));
    if (mark.kind != 'c') return PutNumber(value.number, mark.width);
    const char c = static_cast<char>(value.number);
    return Put(&c, 1);
  }
};

// False when the piece does not fit.
bool WritePiece(Place& place, const char* format, const WireMark* mark, const WireValue* value) {
  for (;; ++mark, ++value) {
    if (!place.Put(format + mark->literalAt, mark->literalSize)) return false;
    if (mark->kind == '\0' || (mark->kind == 'c' && value->number == 0)) return true;
    if (!place.PutValue(*mark, *value)) return false;
  }
}

}  // namespace

void CWireText::AppendTightly(const char* format, const WireMark* marks, const WireValue* values) {
  for (;;) {
    Place place = {m_pAt, m_pEnd};
    if (WritePiece(place, format, marks, values)) {
      m_pAt = place.at;
      return;
    }
    if (!MakeRoom(static_cast<size_t>(m_pEnd - m_pAt) + 1)) return;
  }
}
