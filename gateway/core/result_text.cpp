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
  const std::string_view added = AsText(text);
  if (added.empty() || length == 0) return;
  if (reset && owner.data != nullptr) {
    owner.length = 0;
    memset(owner.data, 0, static_cast<size_t>(owner.size));
  }
  const size_t size = owner.data == nullptr ? 0 : static_cast<size_t>(owner.size);
  const size_t used = size == 0 ? 0 : strnlen(owner.data, size);
  const size_t needed = used + added.size();
  if (needed >= size) {
    char* const block = Allocate(needed + kSlack);
    if (block == nullptr) return;
    memset(block, 0, needed + kSlack);
    if (used > 0) memcpy(block, owner.data, used);
    Adopt(owner, block, needed + kSlack);
  }
  memcpy(owner.data + used, added.data(), added.size());
  owner.data[needed] = '\0';
  owner.length = WrapAdd(owner.length, length);
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
      m_nExpected(expected < INT32_MAX ? expected : INT32_MAX),
      m_pRecords(&m_cNoRoom) {
  owner.length = 0;
}

char* CResultText::Finish(std::string_view opening, int count) {
  if (m_pRecords == &m_cNoRoom) MakeRoom(0);
  if (m_bFailed) return nullptr;
  char* const start = m_owner.data;
  const size_t size = opening.size() + DecimalSize(count, 0) + 1;
  const size_t length = Length();
  memmove(start + size, m_pRecords, length);
  memcpy(start, opening.data(), opening.size());
  WriteDecimal(start + opening.size(), count, 0);
  start[size - 1] = '!';
  start[size + length] = '\0';
  m_owner.length = static_cast<int32_t>(size + length);
  return start;
}

bool CResultText::MakeRoom(size_t count) {
  if (m_bFailed) return false;
  const size_t used = Length();
  const size_t needed = kOpeningRoom + used + count + 1;
  const uint64_t wanted = (needed > m_nExpected ? needed : m_nExpected) + kSlack;
  const size_t size = wanted < INT32_MAX ? static_cast<size_t>(wanted) : INT32_MAX;
  char* const block = needed <= size ? Allocate(size) : nullptr;
  if (block == nullptr) {
    m_bFailed = true;
    m_pEnd = m_pAt;  // nothing more fits, however short
    return false;
  }
  char* const records = block + kOpeningRoom;
  memcpy(records, m_pRecords, used);
  Adopt(m_owner, block, size);
  m_nExpected = uint64_t{8} * size;
  m_pRecords = records;
  m_pAt = records + used;
  m_pEnd = block + size - 1;
  return true;
}
