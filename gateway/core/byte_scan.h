// Finding the field bars of a text: the one loop that every reply byte passes through.
#ifndef QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_
#define QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_

#include <cstddef>
#include <cstdint>
#include <cstring>

#include "gateway/core/branch_hints.h"

#if defined(__SSE2__)
#include <emmintrin.h>
#elif defined(__aarch64__)
#include <arm_neon.h>
#endif

static_assert(__BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__,
              "words are read with their first byte lowest");

inline constexpr size_t kBarBlock = 64;

// Bit i is set where block[i] is a '|', as fast as the processor family's first generation allows:
// a block is compared in vectors, and the comparison's result gathered one bit a byte. A memchr for
// each bar instead costs 4 to 15 % of a list through a virtual machine.
#if defined(__SSE2__)
inline uint64_t BarsOfQuarter(const char* quarter) noexcept {
  __m128i bytes;
  memcpy(&bytes, quarter, sizeof bytes);
  const __m128i found = _mm_cmpeq_epi8(bytes, _mm_set1_epi8('|'));
  return static_cast<uint32_t>(_mm_movemask_epi8(found));
}
inline uint64_t BarsOfBlock(const char* block) {
  return BarsOfQuarter(block) | BarsOfQuarter(block + 16) << 16 | BarsOfQuarter(block + 32) << 32 |
         BarsOfQuarter(block + 48) << 48;
}
#elif defined(__aarch64__)
inline uint64_t BarsOfBlock(const char* block) {
  const uint8x16_t bar = vdupq_n_u8('|');
  const uint8x16_t bit = vreinterpretq_u8_u64(vdupq_n_u64(0x8040201008040201U));
  uint8x16_t found[4];
  for (size_t i = 0; i < 4; ++i) {
    const uint8x16_t bytes = vld1q_u8(reinterpret_cast<const uint8_t*>(block) + 16 * i);
    found[i] = vandq_u8(vceqq_u8(bytes, bar), bit);
  }
  const uint8x16_t pairs = vpaddq_u8(vpaddq_u8(found[0], found[1]), vpaddq_u8(found[2], found[3]));
  return vgetq_lane_u64(vreinterpretq_u64_u8(vpaddq_u8(pairs, pairs)), 0);
}
#else
inline uint64_t BarsOfBlock(const char* block) {
  constexpr uint64_t kBars = 0x7c7c7c7c7c7c7c7cU;
  constexpr uint64_t kLowBits = 0x7f7f7f7f7f7f7f7fU;
  constexpr uint64_t kGather = 0x0002040810204081U;
  uint64_t bars = 0;
  for (size_t i = 0; i < kBarBlock; i += 8) {
    uint64_t word;
    memcpy(&word, block + i, sizeof word);
    word ^= kBars;
    // Only a byte that is zero now, a bar, keeps its top bit; the product gathers the top bits.
    const uint64_t tops = ~(((word & kLowBits) + kLowBits) | word | kLowBits);
    bars |= (tops * kGather >> 56) << i;
  }
  return bars;
}
#endif

// Walks the bars of a text in order. Reads nothing outside the text.
class CBarScanner {
 public:
  CBarScanner(const char* text, size_t size) : m_pNext(text), m_pEnd(text + size) {}

  // The next bar, or the text's end when there is none left.
  const char* Next() {
    while (Rarely(m_nBars == 0)) {
      if (m_pNext == m_pEnd) return m_pEnd;
      Load();
    }
    const char* const bar = m_pBlock + static_cast<unsigned>(__builtin_ctzll(m_nBars));
    m_nBars &= m_nBars - 1;
    return bar;
  }

  const char* End() const { return m_pEnd; }

 private:
  void Load() {
    m_pBlock = m_pNext;
    const auto left = static_cast<size_t>(m_pEnd - m_pNext);
    if (Mostly(left >= kBarBlock)) {
      m_nBars = BarsOfBlock(m_pBlock);
      m_pNext += kBarBlock;
    } else {
      char last[kBarBlock] = {};
      memcpy(last, m_pBlock, left);
      m_nBars = BarsOfBlock(last);
      m_pNext = m_pEnd;
    }
  }

  const char* m_pBlock = nullptr;
  const char* m_pNext;  // the block after it
  const char* m_pEnd;
  uint64_t m_nBars = 0;  // the block's bars that are still to be handed out
};

#endif  // QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_
