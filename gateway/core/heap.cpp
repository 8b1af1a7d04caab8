// The library's own allocation operators, on the C library's heap.
//
// The code allocates with `new (std::nothrow_t{}) char[n]` alone and releases with `delete[]`; the
// virtual destructors add the plain `delete` of their deleting forms. With these few defined here
// the library needs neither libstdc++ nor an unwinder, and a failed allocation is a null pointer.
// The export map keeps them to this library: the process's own operators are not replaced.
#include <cstdlib>
#include <new>

void* operator new[](size_t size, const std::nothrow_t&) noexcept {
  return malloc(size == 0 ? 1 : size);
}

void operator delete[](void* block) noexcept {
  free(block);
}

void operator delete[](void* block, size_t) noexcept {
  free(block);
}

void operator delete(void* block) noexcept {
  free(block);
}

void operator delete(void* block, size_t) noexcept {
  free(block);
}
