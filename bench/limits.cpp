#include "bench/limits.h"

#include <cstring>

namespace bench {

void CopyBytes(const std::string& text, char* out) {
  memcpy(out, text.data(), text.size());
}

size_t ScanBars(const std::string& text) {
  const char* at = text.data();
  const char* const end = at + text.size();
  size_t bars = 0;
  while ((at = static_cast<const char*>(memchr(at, '|', static_cast<size_t>(end - at)))) !=
         nullptr) {
    ++bars;
    ++at;
  }
  return bars;
}

}  // namespace bench
