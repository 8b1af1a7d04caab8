#include "gateway/account/base64_utils.h"

#include <cstdlib>
#include <cstring>

namespace {

constexpr char kAlphabet[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr char kPad = '=';

constexpr size_t kLineGroups = 256;  // of four characters each
constexpr char kLineEnd[] = {'\r', '\n'};

// Too short for a group: the data is not sent at all.
constexpr size_t kShortest = 3;
constexpr size_t kShortSize = 4;

// Marks a byte that is not of the alphabet. It is also the value of 'r', which is thus foreign too.
constexpr uint8_t kForeign = 43;

struct DecodingTable {
  uint8_t values[256] = {};

  constexpr DecodingTable() {
    for (uint8_t& value : values) value = kForeign;
    for (uint8_t i = 0; i < 64; ++i) values[static_cast<unsigned char>(kAlphabet[i])] = i;
  }
};

constexpr DecodingTable kDecoding;

constexpr uint32_t Byte(char c) {
  return static_cast<unsigned char>(c);
}

// The first `count` characters of the group whose 24 bits are `bits`.
char* WriteGroup(char* out, uint32_t bits, size_t count) {
  for (size_t i = 0; i < count; ++i) *out++ = kAlphabet[bits >> (18 - 6 * i) & 63];
  return out;
}

void WriteBytes(char* out, uint32_t accumulator) {
  out[0] = static_cast<char>(accumulator >> 22 & 255);
  out[1] = static_cast<char>(accumulator >> 14 & 255);
  out[2] = static_cast<char>(accumulator >> 6 & 255);
}

// The characters that a decoder has yet to read.
class CBase64Reader {
 public:
  CBase64Reader(const char* text, int length)
      : m_pAt(text), m_pEnd(text + length), m_nLength(length) {}

  // Whether no character is left before the end or pad.
  bool AtEnd() const { return m_pAt >= m_pEnd || *m_pAt == kPad; }

  // Skips foreign characters, then takes one. The skipping stops when `index` is the last character
  // left, so that the last one is taken even if it is foreign; behind the text stands a foreign
  // one.
  uint32_t Take(int index, int32_t& error) {
    while (m_pAt < m_pEnd && Value() == kForeign) {
      if (*m_pAt != '\r' && *m_pAt != '\n') error = 1;
      ++m_pAt;
      if (index >= --m_nLength) break;
    }
    if (m_pAt >= m_pEnd) return kForeign;
    const uint32_t value = Value();
    ++m_pAt;
    return value;
  }

 private:
  uint8_t Value() const { return kDecoding.values[Byte(*m_pAt)]; }

  const char* m_pAt;
  const char* m_pEnd;
  int m_nLength;  // characters of the text without those skipped so far
};

}  // namespace

size_t CBase64Utils::EncodedSize(size_t length) {
  if (length < kShortest) return kShortSize;
  const size_t groups = length / 3;
  const size_t tail = length % 3 == 0 ? 0 : 4;
  return 4 * groups + sizeof kLineEnd * (groups / kLineGroups) + tail;
}

void CBase64Utils::EncodeTo(const char* data, size_t length, char* out) {
  if (length < kShortest) {
    memset(out, kPad, kShortSize);
    return;
  }
  const size_t groups = length / 3;
  for (size_t group = 1; group <= groups; ++group, data += 3) {
    out = WriteGroup(out, Byte(data[0]) << 16 | Byte(data[1]) << 8 | Byte(data[2]), 4);
    if (group % kLineGroups != 0) continue;
    memcpy(out, kLineEnd, sizeof kLineEnd);
    out += sizeof kLineEnd;
  }
  const size_t rest = length % 3;
  if (rest == 0) return;
  const uint32_t second = rest == 2 ? Byte(data[1]) << 8 : 0;
  out = WriteGroup(out, Byte(data[0]) << 16 | second, rest + 1);
  memset(out, kPad, 3 - rest);
}

char* CBase64Utils::Encode(const char* data, int length) {
  const size_t count = length > 0 ? static_cast<size_t>(length) : 0;
  auto* const block = static_cast<char*>(calloc(EncodedSize(count) + 1, 1));
  if (block != nullptr) EncodeTo(data, count, block);
  return block;
}

char* CBase64Utils::Decode(const char* text, int* length) {
  const int given = text != nullptr && *length > 0 ? *length : 0;
  auto* const block = static_cast<char*>(calloc(static_cast<size_t>(given) + 3, 1));
  int count = 0;
  *length = 0;
  if (block == nullptr) return nullptr;
  CBase64Reader reader(text, given);
  char* out = block;
  uint32_t accumulator = 0;
  int index = 1;
  for (; !reader.AtEnd(); ++index) {
    accumulator = (accumulator | reader.Take(index, m_nError)) << 6;
    if (index % 4 != 0) continue;
    WriteBytes(out, accumulator);
    out += 3;
    count += 3;
    accumulator = 0;
  }
  const int open = (index - 1) % 4;
  if (open != 0) {
    const int missing = 4 - open;
    WriteBytes(out, accumulator << (6 * missing));
    count += missing;  // not the number of bytes that the group holds: kept for who counts on it
  }
  *length = count;
  return block;
}
