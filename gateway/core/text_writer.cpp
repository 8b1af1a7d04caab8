#include "gateway/core/text_writer.h"

#include <cstring>

namespace {

size_t CountBlanks(const char* at, const char* end) {
  size_t blanks = 0;
  for (;; ++blanks) {
    at = static_cast<const char*>(memchr(at, ' ', static_cast<size_t>(end - at)));
    if (at == nullptr) return blanks;
    ++at;
  }
}

}  // namespace

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
  const size_t blanks = CountBlanks(m_pBegin, m_pAt);
  if (static_cast<size_t>(m_pEnd - m_pAt) < 2 * blanks) {
    MakeRoom(2 * blanks);
    return;
  }
  const char* end = m_pAt;
  m_pAt += 2 * blanks;
  for (char* to = m_pAt; to != end;) {  // from the end, so that nothing is overwritten unread
    const auto* const blank =
        static_cast<const char*>(memrchr(m_pBegin, ' ', static_cast<size_t>(end - m_pBegin)));
    const auto size = static_cast<size_t>(end - blank) - 1;
    to -= size;
    memmove(to, blank + 1, size);
    to -= 3;
    memcpy(to, "%20", 3);
    end = blank;
  }
}

bool CTextWriter::MakeRoom(size_t) {
  m_bOverflow = true;
  m_pEnd = m_pAt;  // nothing more fits, however short
  return false;
}
