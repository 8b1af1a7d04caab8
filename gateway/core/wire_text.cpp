#include "gateway/core/wire_text.h"

size_t PrintPiece(const char* format, const WireArgument* values, char* at) {
  size_t size = 0;
  const auto put = [&size, at](std::string_view text) {
    if (at != nullptr) text.copy(at + size, text.size());
    size += text.size();
  };
  for (;; ++format) {
    const char* const mark = strchr(format, '%');
    if (mark == nullptr) {
      put(format);
      return size;
    }
    put({format, static_cast<size_t>(mark - format)});
    format = mark;
    size_t width = 0;
    for (size_t digit; (digit = static_cast<size_t>(*++format - '0')) <= 9;) {
      width = width * 10 + digit;
    }
    const WireArgument& value = *values++;
    if (*format == 's') {
      put(value.text);
    } else if (*format == 'c') {
      const char c = static_cast<char>(value.number);
      if (c == '\0') return size;
      put({&c, 1});
    } else {
      if (*format == 'l') ++format;
      if (at != nullptr) WriteDecimal(at + size, value.number, width);
      size += DecimalSize(value.number, width);
    }
  }
}
