#include "tests/heap/counting_heap.h"

#include <link.h>
#include <sys/mman.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "tests/support/call_table.h"

namespace gateway_tests {
namespace {

thread_local bool t_bCounting = false;
thread_local int t_nAllocations = 0;
thread_local int t_nReleases = 0;
thread_local size_t t_nBytes = 0;

void Count(size_t bytes) {
  if (!t_bCounting) return;
  ++t_nAllocations;
  t_nBytes += bytes;
}

// Where the library's code lies.
uintptr_t s_nLibrary = 0;
uintptr_t s_nLibraryEnd = 0;

thread_local bool t_bFailing = false;
thread_local bool t_bGuarding = false;
thread_local size_t t_nRequests = 0;
thread_local size_t t_nFirst = 0;
thread_local size_t t_nLast = 0;
thread_local long t_nUnreleased = 0;

int FindLibrary(dl_phdr_info* object, size_t, void* symbol) {
  const auto address = reinterpret_cast<uintptr_t>(symbol);
  for (int i = 0; i < object->dlpi_phnum; ++i) {
    const auto& segment = object->dlpi_phdr[i];
    const uintptr_t begin = object->dlpi_addr + segment.p_vaddr;
    if (segment.p_type != PT_LOAD || address < begin || address >= begin + segment.p_memsz)
      continue;
    s_nLibrary = begin;
    s_nLibraryEnd = begin + segment.p_memsz;
    return 1;
  }
  return 0;
}

void LearnWhereTheLibraryLies() {
  if (s_nLibrary == 0) dl_iterate_phdr(&FindLibrary, AllExports()[0].EntryPoint());
  if (s_nLibrary == 0) std::abort();
}

bool IsOfLibrary(const void* caller) {
  const auto address = reinterpret_cast<uintptr_t>(caller);
  return address >= s_nLibrary && address < s_nLibraryEnd;
}

// Whether a request must be refused.
bool Refuses(const void* caller) {
  if (!t_bFailing || !IsOfLibrary(caller)) return false;
  ++t_nRequests;
  if (t_nRequests >= t_nFirst && t_nRequests <= t_nLast) return true;
  ++t_nUnreleased;
  return false;
}

// The blocks before a page that nobody may touch; a call takes few, and one thread plays.
struct GuardedBlock {
  char* data;
  char* mapping;
  size_t size;
};
GuardedBlock s_guarded[16];

char* TakeGuarded(size_t size) {
  constexpr size_t kPage = 65536;  // of the largest page that a kernel has
  const size_t usable = (size + kPage - 1) / kPage * kPage;
  void* const mapping =
      mmap(nullptr, usable + kPage, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (mapping == MAP_FAILED) std::abort();
  char* const begin = static_cast<char*>(mapping);
  if (mprotect(begin + usable, kPage, PROT_NONE) != 0) std::abort();
  for (GuardedBlock& block : s_guarded) {
    if (block.data != nullptr) continue;
    block = {begin + usable - size, begin, usable + kPage};
    return block.data;
  }
  std::abort();
}

// False when it is no guarded block.
bool GiveGuardedBack(const void* data) {
  for (GuardedBlock& block : s_guarded) {
    if (block.data != data) continue;
    munmap(block.mapping, block.size);
    block = {};
    return true;
  }
  return false;
}

}  // namespace

CHeapCount::CHeapCount() {
  t_nAllocations = 0;
  t_nReleases = 0;
  t_nBytes = 0;
  t_bCounting = true;
}

CHeapCount::~CHeapCount() {
  t_bCounting = false;
}

int CHeapCount::Allocations() const {
  return t_nAllocations;
}

size_t CHeapCount::Bytes() const {
  return t_nBytes;
}

int CHeapCount::Releases() const {
  return t_nReleases;
}

CFailingHeap::CFailingHeap(size_t first, size_t last) {
  LearnWhereTheLibraryLies();
  t_nRequests = 0;
  t_nUnreleased = 0;
  t_nFirst = first;
  t_nLast = last;
  t_bFailing = true;
}

CFailingHeap::~CFailingHeap() {
  t_bFailing = false;
}

size_t CFailingHeap::Requests() const {
  return t_nRequests;
}

long CFailingHeap::Unreleased() const {
  return t_nUnreleased;
}

CGuardedHeap::CGuardedHeap() {
  LearnWhereTheLibraryLies();
  t_bGuarding = true;
}

CGuardedHeap::~CGuardedHeap() {
  t_bGuarding = false;
}

}  // namespace gateway_tests

extern "C" {

// The C library's own, under the names that it keeps for programs that bring theirs.
void* __libc_malloc(size_t size);
void* __libc_calloc(size_t count, size_t size);
void* __libc_realloc(void* block, size_t size);
void __libc_free(void* block);

void* malloc(size_t size) noexcept {
  gateway_tests::Count(size);
  const void* const caller = __builtin_return_address(0);
  if (gateway_tests::Refuses(caller)) return nullptr;
  if (gateway_tests::t_bGuarding && gateway_tests::IsOfLibrary(caller)) {
    return gateway_tests::TakeGuarded(size);
  }
  return __libc_malloc(size);
}

void* calloc(size_t count, size_t size) noexcept {
  gateway_tests::Count(count * size);
  if (gateway_tests::Refuses(__builtin_return_address(0))) return nullptr;
  return __libc_calloc(count, size);
}

void* realloc(void* block, size_t size) noexcept {
  gateway_tests::Count(size);
  return __libc_realloc(block, size);
}

void free(void* block) noexcept {
  if (gateway_tests::t_bCounting && block != nullptr) ++gateway_tests::t_nReleases;
  if (block == nullptr) return;
  if (gateway_tests::IsOfLibrary(__builtin_return_address(0))) {
    if (gateway_tests::t_bFailing) --gateway_tests::t_nUnreleased;
    if (gateway_tests::t_bGuarding && gateway_tests::GiveGuardedBack(block)) return;
  }
  __libc_free(block);
}

}  // extern "C"
