#include "gateway/core/wire_text.h"

namespace {

// The part of a piece's room that is not written yet.
struct Place {
  char* at;
  char* end;

  bool Has(size_t size) const { return static_cast<size_t>(end - at) >= size; }

  bool Put(std::string_view text) {
    if (!Has(text.size())) return false;
    at += text.copy(at, text.size());
    return true;
  }

  bool PutNumber(int64_t number, size_t width) {
    if (!Has(DecimalSize(number, width))) return false;
    at = WriteDecimal(at, number, width);
    return true;
  }

  bool PutValue(const WireMark& mark, const WireValue& value) {
    if (mark.kind == 's') return Put(value.Text());
    if (mark.kind != 'c') return PutNumber(value.number, mark.width);
    const char c = static_cast<char>(value.number);
    return Put({&c, 1});
  }
};

// False when the piece does not fit.
bool WritePiece(Place& place, std::string_view format, const WireValue* value) {
  for (size_t at = 0;; ++value) {
    const WireMark mark = ReadMark(format, at);
    if (!place.Put({format.data() + mark.literalAt, mark.literalSize})) return false;
    if (mark.kind == '\0' || (mark.kind == 'c' && value->number == 0)) return true;
    if (!place.PutValue(mark, *value)) return false;
  }
}

}  // namespace

void CWireText::AppendTightly(std::string_view format, const WireValue* values) {
  for (;;) {
    Place place = {m_pAt, m_pEnd};
    if (WritePiece(place, format, values)) {
      m_pAt = place.at;
      return;
    }
    if (!MakeRoom(static_cast<size_t>(m_pEnd - m_pAt) + 1)) return;
  }
}
