// Finding the field bars of a text: the one loop that every reply byte passes through.
#ifndef QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_
#define QUORVANE_GATEWAY_CORE_BYTE_SCAN_H_

#include <cstddef>
#include <cstdint>
#include <cstring>

inline constexpr size_t kBarBlock = 64;

// Bit i is set where block[i] is a '|': the rule that BarsOfBlock is held against.
inline uint64_t BarsOfBlockPlainly(const char* block) {
  uint64_t bars = 0;
  for (size_t i = 0; i < kBarBlock; ++i) {
    if (block[i] == '|') bars |= uint64_t{1} << i;
  }
  return bars;
}

// The same, eight bytes at a time. A byte of `word` that is zero, a bar, is the only one whose top
// bit survives; the multiplication then gathers the eight top bits in the highest byte.
inline uint64_t BarsOfBlock(const char* block) {
#if __BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__
  constexpr uint64_t kBars = 0x7c7c7c7c7c7c7c7cU;
  constexpr uint64_t kLowBits = 0x7f7f7f7f7f7f7f7fU;
  constexpr uint64_t kGather = 0x0002040810204081U;
  uint64_t bars = 0;
  for (size_t i = 0; i < kBarBlock / 8; ++i) {
    uint64_t word;
    memcpy(&word, block + 8 * i, sizeof word);
    word ^= kBars;
    const uint64_t tops = ~(((word & kLowBits) + kLowBits) | word | kLowBits);
    bars |= (tops * kGather >> 56) << (8 * i);
  }
  return bars;
#else
  return BarsOfBlockPlainly(block);
#endif
}

// Walks the bars of a text in order. Reads nothing outside the text.
class CBarScanner {
 public:
  CBarScanner(const char* text, size_t size) : m_pNext(text), m_pEnd(text + size) {}

  // The next bar, or the text's end when there is none left.
  const char* Next() {
    while (m_nBars == 0) {
      if (m_pNext == m_pEnd) return m_pEnd;
      Load();
    }
    const char* const bar = m_pBlock + __builtin_ctzll(m_nBars);
    m_nBars &= m_nBars - 1;
    return bar;
  }

  const char* End() const { return m_pEnd; }

 private:
  void Load() {
    m_pBlock = m_pNext;
    const auto left = static_cast<size_t>(m_pEnd - m_pNext);
    if (left >= kBarBlock) {
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
