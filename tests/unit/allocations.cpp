#include "tests/unit/allocations.h"

#include <cstdlib>
#include <new>

// This program's operators take the place of the library's own and of a sanitizer's; all forms are
// defined, so that every block is asked for and released on one heap.

namespace gateway_tests {
namespace {

thread_local bool t_bCounting = false;
thread_local size_t t_nCount = 0;
thread_local size_t t_nFirstFailing = CAllocations::kNever;

void* Allocate(size_t size) {
  return std::malloc(size == 0 ? 1 : size);
}

void* AllocateOrGiveUp(size_t size) {
  void* const block = Allocate(size);
  if (block == nullptr) std::abort();
  return block;
}

}  // namespace

CAllocations::CAllocations(size_t firstFailing) {
  t_bCounting = true;
  t_nCount = 0;
  t_nFirstFailing = firstFailing;
}

CAllocations::~CAllocations() {
  t_bCounting = false;
}

size_t CAllocations::Count() const {
  return t_nCount;
}

}  // namespace gateway_tests

void* operator new[](size_t size, const std::nothrow_t&) noexcept {
  using namespace gateway_tests;
  if (t_bCounting && ++t_nCount >= t_nFirstFailing) return nullptr;
  return Allocate(size);
}

void* operator new(size_t size, const std::nothrow_t&) noexcept {
  return gateway_tests::Allocate(size);
}

void* operator new(size_t size) {
  return gateway_tests::AllocateOrGiveUp(size);
}

void* operator new[](size_t size) {
  return gateway_tests::AllocateOrGiveUp(size);
}

void operator delete(void* block) noexcept {
  std::free(block);
}

void operator delete[](void* block) noexcept {
  std::free(block);
}

void operator delete(void* block, size_t) noexcept {
  std::free(block);
}

void operator delete[](void* block, size_t) noexcept {
  std::free(block);
}

void operator delete(void* block, const std::nothrow_t&) noexcept {
  std::free(block);
}

void operator delete[](void* block, const std::nothrow_t&) noexcept {
  std::free(block);
}
