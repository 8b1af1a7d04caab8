#ifndef TESTS_UNIT_ALLOCATIONS_H_
#define TESTS_UNIT_ALLOCATIONS_H_

#include <cstddef>

namespace gateway_tests {

// Counts the heap blocks that the calling thread asks for by `new (std::nothrow) char[n]`, the one
// form that the library uses, while the object lives.
class CAllocations {
 public:
  static constexpr size_t kNever = ~size_t{0};

  // The requests number `firstFailing` (counted from 1) and all after it are refused.
  explicit CAllocations(size_t firstFailing = kNever);
  CAllocations(const CAllocations&) = delete;
  CAllocations& operator=(const CAllocations&) = delete;
  ~CAllocations();

  // Requests so far, refused ones too.
  size_t Count() const;
};

}  // namespace gateway_tests

#endif  // TESTS_UNIT_ALLOCATIONS_H_
