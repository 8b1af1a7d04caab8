#ifndef TESTS_HEAP_COUNTING_HEAP_H_
#define TESTS_HEAP_COUNTING_HEAP_H_

namespace gateway_tests {

/// Counts what the calling thread asks of the heap while the object lives. This program's own
/// `malloc`, `calloc` and `realloc` take the place of the C library's, for the library too.
class CHeapCount {
 public:
  CHeapCount();
  ~CHeapCount();

  int Allocations() const;
};

}  // namespace gateway_tests

#endif  // TESTS_HEAP_COUNTING_HEAP_H_
