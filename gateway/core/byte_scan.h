// Finding the next field bar: the one loop that every reply byte passes through.
#ifndef QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_
#define QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_

#include <cstdint>
#include <cstring>

// The first '|' in [at, end), or `end`: byte by byte, the rule that FindBar is held against.
inline const char* FindBarPlainly(const char* at, const char* end) {
  while (at != end && *at != '|') ++at;
  return at;
}

// As FindBarPlainly, eight bytes at a time: a byte of `word ^ bars` is zero where a bar stands, and
// the subtraction borrows into that byte's top bit. Reads nothing at or beyond `end`.
inline const char* FindBar(const char* at, const char* end) {
  constexpr uint64_t kBars = 0x7c7c7c7c7c7c7c7cU;
  constexpr uint64_t kOnes = 0x0101010101010101U;
  constexpr uint64_t kTops = 0x8080808080808080U;
  while (end - at >= 8) {
    uint64_t word;
    memcpy(&word, at, sizeof word);
    word ^= kBars;
    if (((word - kOnes) & ~word & kTops) != 0) break;
    at += 8;
  }
  return FindBarPlainly(at, end);
}

#endif  // QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_
