#include "gateway/core/result_text.h"

#include <new>

namespace {

constexpr size_t kSlack = 4096;

char* Allocate(size_t size) {
  return size <= INT32_MAX ? new (std::nothrow_t{}) char[size] : nullptr;
}

void Adopt(const HeapText& owner, char* block, size_t size) {
  delete[] owner.data;
  owner.data = block;
  owner.size = static_cast<int32_t>(size);
}

}  // namespace

void AppendHeapText(const HeapText& owner, const char* text, int length, bool reset) {
  if (text == nullptr || length <= 0) return;
  if (reset && owner.length > 0) {
    owner.length = 0;
    memset(owner.data, 0, static_cast<size_t>(owner.size));
  }
  const auto used = static_cast<size_t>(owner.length);
  const size_t needed = used + static_cast<size_t>(length);
  if (needed >= static_cast<size_t>(owner.size)) {
    char* const block = Allocate(needed + kSlack);
    if (block == nullptr) return;
    memset(block, 0, needed + kSlack);
    if (used > 0) memcpy(block, owner.data, used);
    Adopt(owner, block, needed + kSlack);
  }
  memcpy(owner.data + used, text, strnlen(text, static_cast<size_t>(length)));
  owner.length = static_cast<int32_t>(needed);
}

char* RenewHeapText(const HeapText& owner, size_t length) {
  char* const block = Allocate(length + 1);
  if (block == nullptr) return nullptr;
  Adopt(owner, block, length + 1);
  owner.length = static_cast<int32_t>(length);
  block[length] = '\0';
  return block;
}

CResultText::CResultText(const HeapText& owner, size_t expected)
    : CWireText(&m_cNoRoom, &m_cNoRoom),
      m_owner(owner),
      m_nExpected(expected),
      m_pRecords(&m_cNoRoom) {
  owner.length = 0;
}

char* CResultText::Finish(std::string_view opening, int count) {
  if (m_pRecords == &m_cNoRoom) MakeRoom(0);
  if (m_bFailed) return nullptr;
  const size_t size = opening.size() + DecimalSize(count, 0) + 1;
  char* const start = m_pRecords - size;
  memcpy(start, opening.data(), opening.size());
  WriteDecimal(start + opening.size(), count, 0);
  m_pRecords[-1] = '!';
  *m_pAt = '\0';
  m_owner.length = static_cast<int32_t>(m_pAt - m_owner.data);
  return start;
}

bool CResultText::MakeRoom(size_t count) {
  if (m_bFailed) return false;
  const size_t used = Length();
  if (m_pRecords != &m_cNoRoom)
    m_nExpected = m_nExpected < INT32_MAX / 8 ? 8 * m_nExpected : INT32_MAX;
  if (m_nExpected < used + count) m_nExpected = used + count;
  const size_t size = kOpeningRoom + m_nExpected + kSlack;
  char* const block = Allocate(size);
  if (block == nullptr) {
    m_bFailed = true;
    m_pEnd = m_pAt;  // nothing more fits, however short
    return false;
  }
  char* const records = block + kOpeningRoom;
  if (used > 0) memcpy(records, m_pRecords, used);
  Adopt(m_owner, block, size);
  m_pRecords = records;
  m_pAt = records + used;
  m_pEnd = block + size - 1;
  return true;
}
