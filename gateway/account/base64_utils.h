// The Base64 text of certificate messages.
#ifndef QUORVANE_GATEWAY_ACCOUNT_BASE64_UTILS_H_
#define QUORVANE_GATEWAY_ACCOUNT_BASE64_UTILS_H_

#include <cstddef>
#include <cstdint>

// RFC 4648's alphabet and padding with the habits that the gateways know: a line break behind every
// 1024 characters of whole groups (behind the last full line too), and "====" with none of the data
// for fewer than three bytes.
//
// Blocks are made with calloc; whoever receives one releases it with free. Null when memory ran
// out.
class CBase64Utils {
 public:
  CBase64Utils() = default;
  ~CBase64Utils() = default;

  // Number of characters of the text of `length` bytes, without a terminator.
  static size_t EncodedSize(size_t length);

  // Writes those EncodedSize(length) characters to `out`, without a terminator.
  static void EncodeTo(const char* data, size_t length, char* out);

  // What the class offers beside; no operation calls it.

  // The terminated text of the first `length` bytes at `data`; a negative length counts as 0.
  // Reads nothing beyond them.
  char* Encode(const char* data, int length);

  // The bytes that the first `*length` characters at `text` stand for, up to an '='. `*length`
  // becomes their number: three for each group of four characters; a last group of two characters
  // counts two, one of three counts one and a lone character counts three. The block has room for
  // three bytes more than the characters given, so that any last group is written whole.
  //
  // Characters outside the alphabet are skipped, and all of them but line breaks set the error
  // flag; 'r' is taken for one of them. One that stands last is not skipped but read as 43, as is
  // the place behind the text when nothing else is left. Reads nothing beyond the text.
  char* Decode(const char* text, int* length);

  int32_t m_nError = 0;  // 1 once Decode skipped a foreign character
};

#endif  // QUORVANE_GATEWAY_ACCOUNT_BASE64_UTILS_H_
