#include "tests/fuzz/lent_memory.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

#if defined(__has_feature)
#if __has_feature(address_sanitizer)
#define QUORVANE_ADDRESS_SANITIZER
#elif __has_feature(memory_sanitizer)
#define QUORVANE_MEMORY_SANITIZER
#endif
#elif defined(__SANITIZE_ADDRESS__)
#define QUORVANE_ADDRESS_SANITIZER
#endif

#if defined(QUORVANE_ADDRESS_SANITIZER)
#include <sanitizer/asan_interface.h>
#elif defined(QUORVANE_MEMORY_SANITIZER)
#include <sanitizer/msan_interface.h>
#elif defined(QUORVANE_POISONS)
#error "without a sanitizer nothing notices a read behind what was lent"
#endif

namespace gateway_fuzz {
namespace {

// A poisoned region may end, and a readable one begin, at such places alone.
constexpr size_t kGrain = 8;
// What stands between two blocks at least.
constexpr size_t kGap = 64;

alignas(64) char s_Ring[kLentRoom];
size_t s_nNext = 0;

void Poison(void* place, size_t size) {
#if defined(QUORVANE_ADDRESS_SANITIZER)
  __asan_poison_memory_region(place, size);
#elif defined(QUORVANE_MEMORY_SANITIZER)
  __msan_poison(place, size);
#else
  // A use must not find the old text, also without a sanitizer.
  std::memset(place, '#', size);
#endif
}

void Unpoison(void* place, size_t size) {
#if defined(QUORVANE_ADDRESS_SANITIZER)
  __asan_unpoison_memory_region(place, size);
#else
  // The memory sanitizer waits for a write.
  static_cast<void>(place);
  static_cast<void>(size);
#endif
}

}  // namespace

char* Lend(size_t size) {
  static const bool s_bPoisoned = [] {
    Poison(s_Ring, sizeof s_Ring);
    return true;
  }();
  static_cast<void>(s_bPoisoned);
  const size_t room = (size + kGap + kGrain - 1) / kGrain * kGrain;
  if (room + kGap > kLentRoom) {
    std::fprintf(stderr, "no room to lend %zu bytes\n", size);
    std::abort();
  }
  if (s_nNext + room + kGap > kLentRoom) s_nNext = 0;
  char* const block = s_Ring + kGap + s_nNext;
  s_nNext += room;
  Unpoison(block, size);
  return block;
}

char* LendText(std::string_view text) {
  char* const block = Lend(text.size() + 1);
  if (!text.empty()) std::memcpy(block, text.data(), text.size());
  block[text.size()] = '\0';
  return block;
}

void TakeBack(char* block, size_t size) {
  Poison(block, size);
}

void Forbid(void* place, size_t size) {
  Poison(place, size);
}

CLent::CLent(size_t size) : m_nSize(size), m_pData(Lend(size)) {
  std::memset(m_pData, '#', size);
}

CLent::CLent(std::string_view text, End end)
    : m_nSize(text.size() + (end == End::kTerminated ? 1 : 0)), m_pData(Lend(m_nSize)) {
  if (!text.empty()) std::memcpy(m_pData, text.data(), text.size());
  if (end == End::kTerminated) m_pData[text.size()] = '\0';
}

}  // namespace gateway_fuzz
