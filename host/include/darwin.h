#pragma once

// What the C library of macOS lacks of those that the library calls.

#include <stddef.h>

// The last byte of a block that is `byte`, or null.
inline const void* memrchr(const void* block, int byte, size_t length) {
  const char* const bytes = static_cast<const char*>(block);
  while (length > 0 && bytes[length - 1] != static_cast<char>(byte)) --length;
  return length > 0 ? bytes + length - 1 : nullptr;
}
