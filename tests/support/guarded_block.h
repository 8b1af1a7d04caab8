#ifndef TESTS_SUPPORT_GUARDED_BLOCK_H_
#define TESTS_SUPPORT_GUARDED_BLOCK_H_

#include <cstddef>

namespace gateway_tests {

// Where a block of memory lies; every placement has exactly the asked size.
enum class Placement {
  // A heap block: a sanitizer sees each byte past either end.
  kHeap,
  // The block's last byte is the last readable one: one byte too far crashes.
  kBeforeUnreadable,
  // The block's first byte is the first readable one: one byte before it crashes.
  kAfterUnreadable,
};

// Memory of an exact size in a given place.
class CGuardedBlock {
 public:
  CGuardedBlock(Placement placement, const void* bytes, size_t size);
  CGuardedBlock(CGuardedBlock&& other) noexcept;
  CGuardedBlock(const CGuardedBlock&) = delete;
  CGuardedBlock& operator=(const CGuardedBlock&) = delete;
  CGuardedBlock& operator=(CGuardedBlock&&) = delete;
  ~CGuardedBlock();

  char* Data() const { return m_pData; }
  size_t Size() const { return m_nSize; }

 private:
  char* m_pData = nullptr;
  size_t m_nSize = 0;
  char* m_pMapping = nullptr;
  size_t m_nMapping = 0;
};

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_GUARDED_BLOCK_H_
