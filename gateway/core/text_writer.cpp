#include "gateway/core/text_writer.h"

#include <algorithm>

CTextWriter CTextWriter::Continue(char* buffer, size_t size) {
  CTextWriter writer(buffer, size);
  writer.m_pAt += strnlen(buffer, size - 1);
  return writer;
}

void CTextWriter::Replace(std::string_view text) {
  m_pAt = m_pBegin;
  m_pEnd = m_pLimit;
  m_bOverflow = false;
  AppendText(text);
}

void CTextWriter::EscapeBlanks() {
  const auto blanks = static_cast<size_t>(std::count(m_pBegin, m_pAt, ' '));
  if (blanks == 0) return;
  if (static_cast<size_t>(m_pEnd - m_pAt) < 2 * blanks) {
    MakeRoom(2 * blanks);
    return;
  }
  const char* from = m_pAt;
  m_pAt += 2 * blanks;
  for (char* to = m_pAt; from != to;) {  // from the end, so that nothing is overwritten unread
    if (*--from == ' ') {
      to -= 3;
      memcpy(to, "%20", 3);
    } else {
      *--to = *from;
    }
  }
}

bool CTextWriter::MakeRoom(size_t) {
  m_bOverflow = true;
  m_pEnd = m_pAt;  // nothing more fits, however short
  return false;
}
