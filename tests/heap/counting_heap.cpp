#include "tests/heap/counting_heap.h"

#include <cstddef>

namespace gateway_tests {
namespace {

thread_local bool t_bCounting = false;
thread_local int t_nAllocations = 0;

void Count() {
  if (t_bCounting) ++t_nAllocations;
}

}  // namespace

CHeapCount::CHeapCount() {
  t_nAllocations = 0;
  t_bCounting = true;
}

CHeapCount::~CHeapCount() {
  t_bCounting = false;
}

int CHeapCount::Allocations() const {
  return t_nAllocations;
}

}  // namespace gateway_tests

extern "C" {

// The C library's own, under the names that it keeps for programs that bring theirs.
void* __libc_malloc(size_t size);
void* __libc_calloc(size_t count, size_t size);
void* __libc_realloc(void* block, size_t size);

void* malloc(size_t size) noexcept {
  gateway_tests::Count();
  return __libc_malloc(size);
}

void* calloc(size_t count, size_t size) noexcept {
  gateway_tests::Count();
  return __libc_calloc(count, size);
}

void* realloc(void* block, size_t size) noexcept {
  gateway_tests::Count();
  return __libc_realloc(block, size);
}

}  // extern "C"
