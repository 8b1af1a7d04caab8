// Constants and small rules that the request headers share.
#ifndef QUORVANE_GATEWAY_CORE_PROTOCOL_H_
#define QUORVANE_GATEWAY_CORE_PROTOCOL_H_

#include <cstring>
#include <string_view>

#include "gateway/core/messages.h"
#include "gateway/core/text_writer.h"

inline constexpr std::string_view kProtocolVersion = "24369";

// Buffer of one part of an identity field; a longer part is dropped.
inline constexpr size_t kIdentityPartSize = 40;

constexpr bool IsAccountLength(size_t length) {
  return length >= 2 && length <= 7;
}
constexpr bool IsIdNumberLength(size_t length) {
  return length >= 8 && length <= 10;
}

// Copies `text` and a terminator into `out` (may be null) if it is not empty and fits `size` bytes;
// leaves `out` as it was otherwise.
inline void CopyIfFits(std::string_view text, char* out, int size) {
  if (out == nullptr || size <= 0 || text.empty() || text.size() >= static_cast<size_t>(size)) {
    return;
  }
  memcpy(out, text.data(), text.size());
  out[text.size()] = '\0';
}

// The text before the next `separator`, which is passed over, or all the rest.
inline std::string_view TakePiece(std::string_view& rest, char separator) {
  const size_t end = rest.find(separator);
  const bool found = end != std::string_view::npos;
  const std::string_view piece(rest.data(), found ? end : rest.size());
  rest.remove_prefix(found ? end + 1 : rest.size());
  return piece;
}

// What a public method that writes into its caller's buffer returns: 1, or 0 with a message alone
// there.
inline int EndPublicText(CTextWriter& line, bool written) {
  const bool fits = !line.Overflowed();
  if (!fits) line.Replace(kBadParameters);
  line.Text();
  return written && fits ? 1 : 0;
}

#endif  // QUORVANE_GATEWAY_CORE_PROTOCOL_H_
