#include "tests/support/forbidden_calls.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <utility>

namespace gateway_tests {
namespace {

constexpr const char* kSlotNames[] = {
#include "tests/support/jni_slot_names.inc"
};
constexpr size_t kSlots = sizeof(JNINativeInterface_) / sizeof(void*);

template <size_t kSlot>
[[noreturn]] void Forbidden() {
  const char* name = kSlot < std::size(kSlotNames) ? kSlotNames[kSlot] : "a later function";
  std::fprintf(stderr, "forbidden VM call: %s (slot %zu)\n", name, kSlot);
  std::abort();
}

template <size_t... kSlot>
JNINativeInterface_ ForbidAll(std::index_sequence<kSlot...>) {
  using Function = void (*)();
  const Function slots[] = {&Forbidden<kSlot>...};
  JNINativeInterface_ table;
  static_assert(sizeof(slots) == sizeof(table));
  std::memcpy(static_cast<void*>(&table), slots, sizeof(table));
  return table;
}

}  // namespace

JNINativeInterface_ ForbiddenCalls() {
  return ForbidAll(std::make_index_sequence<kSlots>());
}

}  // namespace gateway_tests
