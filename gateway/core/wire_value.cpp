#include "gateway/core/wire_value.h"

void CopyUncommon(char* to, const char* from, size_t size) {
  if (size > 16) {
    memcpy(to, from, size);
  } else if (size > 0) {
    to[0] = from[0];
    to[size / 2] = from[size / 2];
    to[size - 1] = from[size - 1];
  }
}
