#ifndef TESTS_SUPPORT_MODIFIED_UTF8_H_
#define TESTS_SUPPORT_MODIFIED_UTF8_H_

#include <string_view>

namespace gateway_tests {

// Whether a virtual machine may be handed `text`: sequences of one byte (01-7F), two (C0-DF and one
// of 80-BF), three (E0-EF and two) or four (F0-F7 and three), and nothing else.
inline bool IsModifiedUtf8(std::string_view text) {
  int missing = 0;
  for (const char c : text) {
    const auto byte = static_cast<unsigned char>(c);
    const bool continues = byte >= 0x80 && byte <= 0xBF;
    if (continues != (missing > 0) || byte == 0 || byte >= 0xF8) return false;
    if (continues) {
      --missing;
    } else {
      missing = (byte >= 0xC0) + (byte >= 0xE0) + (byte >= 0xF0);
    }
  }
  return missing == 0;
}

}  // namespace gateway_tests

#endif  // TESTS_SUPPORT_MODIFIED_UTF8_H_
