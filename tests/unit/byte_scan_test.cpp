// The search for bars, a block at a time, against the plain one.

#include "gateway/core/byte_scan.h"

#include <algorithm>
#include <cstring>
#include <random>

#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

// The bytes that look most like a bar to the arithmetic of a word, and some plain ones.
constexpr char kFills[] = {'a',    '\0',   '\x01', '\x7b', '\x7d',
                           '\x7f', '\x80', '\xfc', '\xfd', '\xff'};

// What BarsOfBlock is held against.
uint64_t BarsOfBlockPlainly(const char* block) {
  uint64_t bars = 0;
  for (size_t i = 0; i < kBarBlock; ++i) {
    if (block[i] == '|') bars |= uint64_t{1} << i;
  }
  return bars;
}

TEST(ByteScan, BlocksAgreeWithThePlainRuleForEveryPairOfBars) {
  for (const char fill : kFills) {
    char block[kBarBlock];
    memset(block, fill, sizeof block);
    for (size_t first = 0; first < kBarBlock; ++first) {
      for (size_t second = first; second < kBarBlock; ++second) {
        block[first] = block[second] = '|';
        const uint64_t bars = uint64_t{1} << first | uint64_t{1} << second;
        ASSERT_EQ(BarsOfBlockPlainly(block), bars);
        ASSERT_EQ(BarsOfBlock(block), bars) << first << ", " << second;
        block[first] = block[second] = fill;
      }
    }
    ASSERT_EQ(BarsOfBlock(block), 0U);
  }
}

TEST(ByteScan, BlocksAgreeWithThePlainRuleForEveryByteAndItsNeighbour) {
  for (int low = 0; low < 256; ++low) {
    for (int high = 0; high < 256; ++high) {
      char block[kBarBlock];
      for (size_t i = 0; i < kBarBlock; ++i) block[i] = static_cast<char>(i % 2 == 0 ? low : high);
      ASSERT_EQ(BarsOfBlock(block), BarsOfBlockPlainly(block)) << low << ", " << high;
    }
  }
}

std::vector<size_t> BarsOf(const char* text, size_t size) {
  std::vector<size_t> places;
  CBarScanner bars(text, size);
  EXPECT_EQ(bars.End(), text + size);
  for (const char* bar = bars.Next(); bar != bars.End(); bar = bars.Next()) {
    places.push_back(static_cast<size_t>(bar - text));
  }
  EXPECT_EQ(bars.Next(), bars.End()) << "asked again behind the end";
  return places;
}

std::vector<size_t> BarsPlainly(const char* text, size_t size) {
  std::vector<size_t> places;
  for (size_t i = 0; i < size; ++i) {
    if (text[i] == '|') places.push_back(i);
  }
  return places;
}

// Every size around the blocks, with one bar at every place; an unreadable page lies behind the
// text, and another before it.
TEST(ByteScan, ScannerHandsOutABarAtEveryPlaceOfTextsOfEverySize) {
  for (size_t size = 0; size <= 3 * kBarBlock + 1; ++size) {
    const std::string plain(size, 'a');
    for (Placement placement : {Placement::kBeforeUnreadable, Placement::kAfterUnreadable}) {
      const CGuardedBlock text(placement, plain.data(), size);
      EXPECT_EQ(BarsOf(text.Data(), size), std::vector<size_t>{});
      for (size_t bar = 0; bar < size; ++bar) {
        text.Data()[bar] = '|';
        ASSERT_EQ(BarsOf(text.Data(), size), std::vector<size_t>{bar}) << size;
        text.Data()[bar] = 'a';
      }
    }
  }
}

TEST(ByteScan, ScannerHandsOutAllBarsInOrder) {
  for (size_t size : {1U, 63U, 64U, 65U, 128U, 1000U}) {
    const std::string bars(size, '|');
    EXPECT_EQ(BarsOf(bars.data(), size).size(), size);
  }
  EXPECT_EQ(BarsOf(nullptr, 0), std::vector<size_t>{});
}

TEST(ByteScan, ScannerStopsAtTheEndEvenBeforeAnotherBar) {
  const std::string text = std::string(100, 'a') + "||||";
  for (size_t size = 0; size <= 100; ++size) {
    EXPECT_EQ(BarsOf(text.data(), size), std::vector<size_t>{});
  }
}

TEST(ByteScan, ScannerAgreesWithThePlainRuleOnGeneratedBytes) {
  std::mt19937 random(20240115);
  for (int round = 0; round < 5000; ++round) {
    std::string text(random() % 400, 'a');
    const size_t rarity = 1 + random() % 40;
    for (char& c : text) c = random() % rarity == 0 ? '|' : static_cast<char>(random());
    const size_t from = std::min<size_t>(random() % 9, text.size());
    ASSERT_EQ(BarsOf(text.data() + from, text.size() - from),
              BarsPlainly(text.data() + from, text.size() - from));
  }
}

}  // namespace
}  // namespace gateway_tests
