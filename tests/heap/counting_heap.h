#ifndef TESTS_HEAP_COUNTING_HEAP_H_
#define TESTS_HEAP_COUNTING_HEAP_H_

#include <cstddef>

namespace gateway_tests {

// Counts what the calling thread asks of the heap while the object lives. This program's own
// `malloc`, `calloc`, `realloc` and `free` take the place of the C library's, for the library too.
class CHeapCount {
 public:
  CHeapCount();
  ~CHeapCount();

  int Allocations() const;
  // Bytes asked for, all blocks together.
  size_t Bytes() const;
  int Releases() const;
};

// Refuses what the library asks of the heap on the calling thread, while the object lives; the
// program's own requests and those of other libraries are served.
class CFailingHeap {
 public:
  static constexpr size_t kNever = ~size_t{0};

  // Refuses the requests number `first` to `last`, counted from 1.
  CFailingHeap(size_t first, size_t last);
  CFailingHeap(const CFailingHeap&) = delete;
  CFailingHeap& operator=(const CFailingHeap&) = delete;
  ~CFailingHeap();

  // Requests of the library so far, refused ones too.
  size_t Requests() const;
  // Blocks that the library was given and has not released.
  long Unreleased() const;
};

// Gives the library blocks of the very size that it asks for, each before a page that nobody may
// touch, so that a byte behind a block ends the program; on the calling thread, while the object
// lives.
class CGuardedHeap {
 public:
  CGuardedHeap();
  CGuardedHeap(const CGuardedHeap&) = delete;
  CGuardedHeap& operator=(const CGuardedHeap&) = delete;
  ~CGuardedHeap();
};

}  // namespace gateway_tests

#endif  // TESTS_HEAP_COUNTING_HEAP_H_
