#include "tests/support/guarded_block.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <utility>

namespace gateway_tests {
namespace {

[[noreturn]] void GiveUp(const char* what) {
  std::perror(what);
  std::abort();
}

}  // namespace

CGuardedBlock::CGuardedBlock(Placement placement, const void* bytes, size_t size) : m_nSize(size) {
  if (placement == Placement::kHeap) {
    m_pData = static_cast<char*>(std::malloc(size));
    if (m_pData == nullptr && size != 0) GiveUp("malloc");
  } else {
    const auto page = static_cast<size_t>(sysconf(_SC_PAGESIZE));
    const size_t readable = (size + page - 1) / page * page;
    m_nMapping = page + readable + page;
    void* mapping =
        mmap(nullptr, m_nMapping, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0);
    if (mapping == MAP_FAILED) GiveUp("mmap");
    m_pMapping = static_cast<char*>(mapping);
    char* const first = m_pMapping + page;
    if (mprotect(first, readable, PROT_READ | PROT_WRITE) != 0) GiveUp("mprotect");
    m_pData = placement == Placement::kAfterUnreadable ? first : first + readable - size;
  }
  if (size != 0) std::memcpy(m_pData, bytes, size);
}

CGuardedBlock::CGuardedBlock(CGuardedBlock&& other) noexcept
    : m_pData(std::exchange(other.m_pData, nullptr)),
      m_nSize(std::exchange(other.m_nSize, 0)),
      m_pMapping(std::exchange(other.m_pMapping, nullptr)),
      m_nMapping(std::exchange(other.m_nMapping, 0)) {}

CGuardedBlock::~CGuardedBlock() {
  if (m_pMapping != nullptr) {
    munmap(m_pMapping, m_nMapping);
    return;
  }
  if (m_pData == nullptr) return;
  // A use after release must not find the old text, also without a sanitizer.
  explicit_bzero(m_pData, m_nSize);
  std::free(m_pData);
}

}  // namespace gateway_tests
