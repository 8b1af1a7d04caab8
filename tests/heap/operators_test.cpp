// The library's own operators; the export map hides those in the library, so this program is built
// with the same source.

#include <gtest/gtest.h>

#include <new>

#include "tests/heap/counting_heap.h"

// Clang declares the sized forms only where it is told to use them.
void operator delete(void* block, size_t size) noexcept;
void operator delete[](void* block, size_t size) noexcept;

namespace gateway_tests {
namespace {

TEST(Operators, BlockOfNoBytesIsABlock) {
  const CHeapCount count;
  void* const block = operator new[](0, std::nothrow_t{});
  EXPECT_NE(block, nullptr);
  EXPECT_EQ(count.Allocations(), 1);
  operator delete[](block);
}

TEST(Operators, EachFormReleasesABlock) {
  using Form = void (*)(void*);
  for (const Form release : {
           Form([](void* block) { operator delete(block); }),
           Form([](void* block) { operator delete (block, size_t{1}); }),
           Form([](void* block) { operator delete[](block); }),
           Form([](void* block) { operator delete[](block, size_t{1}); }),
       }) {
    void* const block = operator new[](1, std::nothrow_t{});
    const CHeapCount count;
    release(block);
    EXPECT_EQ(count.Releases(), 1);
  }
}

}  // namespace
}  // namespace gateway_tests
