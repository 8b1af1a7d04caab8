// A text in a buffer of fixed size: a request, a message, a log line.
#ifndef QUORVANE_GATEWAY_CORE_TEXT_WRITER_H_
#define QUORVANE_GATEWAY_CORE_TEXT_WRITER_H_

#include "gateway/core/wire_text.h"

// Never writes outside its buffer. What does not fit sets one sticky overflow and is not written,
// nor is anything after it; the writer's user asks once, at the end.
class CTextWriter : public CWireText {
 public:
  // Starts an empty text in `buffer`, which has `size` >= 1 bytes, terminator included, and
  // outlives the writer. Nothing is cleared but the text's own end.
  CTextWriter(char* buffer, size_t size)
      : CWireText(buffer, buffer + size - 1), m_pBegin(buffer), m_pLimit(buffer + size - 1) {}

  // Goes on behind the terminated text that `buffer` holds already.
  static CTextWriter Continue(char* buffer, size_t size);

  bool Overflowed() const { return m_bOverflow; }

  size_t Length() const { return static_cast<size_t>(m_pAt - m_pBegin); }

  // The text so far, terminated; valid as long as the buffer, until the next change.
  char* Text() {
    *m_pAt = '\0';
    return m_pBegin;
  }

  // Drops all that was written, an overflow too, and starts over with `text`.
  void Replace(std::string_view text);

  // Turns every blank into "%20", in place and in linear time.
  void EscapeBlanks();

 private:
  bool MakeRoom(size_t count) override;

  char* m_pBegin;
  char* m_pLimit;  // the buffer's last byte
  bool m_bOverflow = false;
};

#endif  // QUORVANE_GATEWAY_CORE_TEXT_WRITER_H_
