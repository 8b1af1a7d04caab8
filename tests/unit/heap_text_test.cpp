// Results that grow: AppendData, and the lists of the decoders.

#include <cstring>

#include "gateway/core/gateway_pub.h"
#include "gateway/core/result_text.h"
#include "tests/unit/allocations.h"
#include "tests/unit/session.h"

namespace gateway_tests {
namespace {

class HeapTexts : public CSessionTest {
 protected:
  void Append(const std::string& text, bool reset = false) {
    m_gateway.AppendData(text.c_str(), static_cast<int>(text.size()), reset);
  }

  HeapText Owner() { return {m_gateway.m_pData, m_gateway.m_nDataSize, m_gateway.m_nDataLen}; }

  // Whether every byte behind the text, to the end of the capacity, is zero.
  bool RestIsZero() const {
    for (int at = m_gateway.m_nDataLen; at < m_gateway.m_nDataSize; ++at) {
      if (m_gateway.m_pData[at] != '\0') return false;
    }
    return true;
  }

  CGatewayPub m_gateway;
};

TEST_F(HeapTexts, FirstAppendAllocatesItsLengthAndFourKilobytes) {
  for (bool reset : {false, true}) {
    CGatewayPub gateway;
    const CAllocations allocations;
    gateway.AppendData("abc", 3, reset);
    EXPECT_EQ(allocations.Count(), 1U);
    EXPECT_EQ(gateway.m_nDataSize, 3 + 4096);
    EXPECT_EQ(gateway.m_nDataLen, 3);
    EXPECT_STREQ(gateway.m_pData, "abc");
  }
}

TEST_F(HeapTexts, NothingIsDoneForNothing) {
  m_gateway.AppendData(nullptr, 5, false);
  m_gateway.AppendData("abc", 0, false);
  m_gateway.AppendData("", 5, false);
  EXPECT_EQ(m_gateway.m_pData, nullptr);
  EXPECT_EQ(m_gateway.m_nDataSize, 0);
  EXPECT_EQ(m_gateway.m_nDataLen, 0);
  Append("abc");
  m_gateway.AppendData(nullptr, 5, true);
  m_gateway.AppendData("x", 0, true);
  m_gateway.AppendData("", 5, true);
  EXPECT_STREQ(m_gateway.m_pData, "abc") << "no reset either";
  EXPECT_EQ(m_gateway.m_nDataLen, 3);
}

TEST_F(HeapTexts, TotalBelowTheCapacityStaysAndAtItGrows) {
  for (int length : {4095, 4096, 4097}) {  // behind 1 character in a capacity of 4097
    CGatewayPub gateway;
    gateway.AppendData("a", 1, false);
    const char* const before = gateway.m_pData;
    const std::string text(static_cast<size_t>(length), 'b');
    const CAllocations allocations;
    gateway.AppendData(text.c_str(), length, false);
    EXPECT_EQ(allocations.Count(), length == 4095 ? 0U : 1U) << length;
    EXPECT_EQ(gateway.m_pData == before, length == 4095) << length;
    EXPECT_EQ(gateway.m_nDataSize, length == 4095 ? 4097 : 1 + length + 4096) << length;
    EXPECT_EQ(gateway.m_nDataLen, 1 + length);
    EXPECT_EQ(gateway.m_pData, "a" + text);
  }
}

TEST_F(HeapTexts, PiecesAreJoinedAndTheRestIsZero) {
  std::string expected;
  for (int piece = 0; piece < 3000; ++piece) {
    const std::string text = "<" + std::to_string(piece) + ">@!";
    Append(text);
    expected += text;
  }
  EXPECT_EQ(m_gateway.m_pData, expected);
  EXPECT_EQ(static_cast<size_t>(m_gateway.m_nDataLen), expected.size());
  EXPECT_GT(m_gateway.m_nDataSize, m_gateway.m_nDataLen);
  EXPECT_TRUE(RestIsZero());
}

TEST_F(HeapTexts, ResetClearsTheTextAndKeepsTheCapacity) {
  Append(std::string(5000, 'a'));
  const int capacity = m_gateway.m_nDataSize;
  Append("xyz", true);
  EXPECT_STREQ(m_gateway.m_pData, "xyz");
  EXPECT_EQ(m_gateway.m_nDataLen, 3);
  EXPECT_EQ(m_gateway.m_nDataSize, capacity);
  EXPECT_TRUE(RestIsZero());
}

// A length is booked as the caller tells it; the text that is there says where the next one goes.
TEST_F(HeapTexts, WholeTextsAreJoinedWhateverTheirLengthsSay) {
  for (int length : {1, 2, 4, 100, -1, -100, INT32_MAX, INT32_MIN}) {
    CGatewayPub gateway;
    gateway.AppendData(CTextAtPageEnd("abc"), length, false);
    EXPECT_STREQ(gateway.m_pData, "abc") << length;
    EXPECT_EQ(gateway.m_nDataLen, length);
    gateway.AppendData(CTextAtPageEnd("def"), 3, false);
    EXPECT_STREQ(gateway.m_pData, "abcdef") << length;
    EXPECT_EQ(gateway.m_nDataLen, WrapAdd(length, 3));
    gateway.AppendData("g", 1, true);
    EXPECT_STREQ(gateway.m_pData, "g") << length;
    EXPECT_EQ(gateway.m_nDataLen, 1) << length;
  }
}

TEST_F(HeapTexts, RoomIsMadeForWhatIsReallyThere) {
  const std::string first(5000, 'a'), second(9000, 'b'), third(5000, 'c');
  m_gateway.AppendData(first.c_str(), 1, false);
  EXPECT_EQ(m_gateway.m_pData, first);
  m_gateway.AppendData(second.c_str(), 1, false);
  EXPECT_EQ(m_gateway.m_pData, first + second);
  m_gateway.AppendData(third.c_str(), 1, false);
  EXPECT_EQ(m_gateway.m_pData, first + second + third) << "growth carries the whole old text";
  EXPECT_EQ(m_gateway.m_nDataLen, 3);
}

// What a decoder left there is a text as any other.
TEST_F(HeapTexts, TextGoesOnBehindAList) {
  CResultText list(Owner(), 10);
  list.AppendText("a!");
  list.Finish("", 1);
  m_gateway.AppendData("more", 4, false);
  EXPECT_STREQ(m_gateway.m_pData, "1!a!more");
  EXPECT_EQ(m_gateway.m_nDataLen, 8);
}

TEST_F(HeapTexts, AppendWithoutMemoryKeepsTheOldText) {
  {
    const CAllocations none(1);
    Append("abc");
    EXPECT_EQ(m_gateway.m_pData, nullptr);
    EXPECT_EQ(m_gateway.m_nDataLen, 0);
    EXPECT_EQ(m_gateway.m_nDataSize, 0);
  }
  Append("abc");
  const CAllocations none(1);
  Append(std::string(5000, 'x'));
  EXPECT_STREQ(m_gateway.m_pData, "abc");
  EXPECT_EQ(m_gateway.m_nDataLen, 3);
  Append("d");
  EXPECT_STREQ(m_gateway.m_pData, "abcd");
}

TEST_F(HeapTexts, ListOpensWithItsCount) {
  const struct {
    const char* opening;
    int count;
    const char* expected;
  } rows[] = {{"", 0, "0!a!b!"},
              {"", 2, "2!a!b!"},
              {"", INT32_MAX, "2147483647!a!b!"},
              {"<0>!", 12, "<0>!12!a!b!"},
              {"<12345>!", INT32_MIN, "<12345>!-2147483648!a!b!"}};
  for (const auto& row : rows) {
    CResultText list(Owner(), 10);
    list.Append(WIRE("%s!"), "a");
    list.AppendText("b!");
    EXPECT_EQ(list.Length(), 4U);
    const char* const result = list.Finish(row.opening, row.count);
    EXPECT_STREQ(result, row.expected);
    EXPECT_FALSE(list.Failed());
    EXPECT_EQ(result, m_gateway.m_pData);
    EXPECT_EQ(strlen(result), static_cast<size_t>(m_gateway.m_nDataLen));
    EXPECT_LT(m_gateway.m_nDataLen, m_gateway.m_nDataSize);
  }
}

TEST_F(HeapTexts, EmptyListIsItsOpening) {
  CResultText list(Owner(), 0);
  list.AppendText("");
  list.Append(WIRE("%s"), "");
  EXPECT_EQ(list.Length(), 0U);
  EXPECT_STREQ(list.Finish("<0>!", 0), "<0>!0!");
}

TEST_F(HeapTexts, ListReplacesWhatTheOwnerHeld) {
  Append("old");
  CResultText list(Owner(), 10);
  list.AppendText("new!");
  EXPECT_STREQ(list.Finish("", 1), "1!new!");
}

TEST_F(HeapTexts, ListOfTheExpectedSizeTakesOneAllocation) {
  for (size_t expected : {0U, 1U, 5000U, 100000U}) {
    const CAllocations allocations;
    CResultText list(Owner(), expected);
    for (size_t i = 0; i < expected; ++i) list.AppendChar('x');
    EXPECT_EQ(list.Finish("", 1), "1!" + std::string(expected, 'x'));
    EXPECT_EQ(allocations.Count(), 1U) << expected;
  }
}

TEST_F(HeapTexts, ListOfEightTimesTheExpectedSizeTakesTwo) {
  const CAllocations allocations;
  CResultText list(Owner(), 10000);
  for (size_t i = 0; i < 20000; ++i) list.AppendText("abcd");
  EXPECT_EQ(allocations.Count(), 2U);
  const std::string result = list.Finish("", 7);
  EXPECT_EQ(result.size(), 80002U);
  EXPECT_EQ(result.substr(0, 10), "7!abcdabcd");
  EXPECT_EQ(result.find_first_not_of("abcd", 2), std::string::npos);
}

TEST_F(HeapTexts, OnePieceLargerThanAllExpectationsFits) {
  CResultText list(Owner(), 10);
  list.AppendText("a");
  list.AppendText(std::string(1000000, 'b'));
  list.AppendText("c");
  EXPECT_EQ(list.Finish("", 1), "1!a" + std::string(1000000, 'b') + "c");
}

TEST_F(HeapTexts, ListWithoutMemoryFailsForGood) {
  for (size_t failing : {1U, 2U}) {
    {
      const CAllocations refused(failing);
      CResultText list(Owner(), 10);
      list.AppendText("a");
      list.AppendText(std::string(10000, 'b'));
      EXPECT_TRUE(list.Failed());
      list.AppendText("c");
      list.Append(WIRE("%s|%d"), "d", 5);
      EXPECT_EQ(list.Finish("", 1), nullptr);
    }
    CResultText list(Owner(), 10);
    EXPECT_STREQ(list.Finish("", 0), "0!") << "the owner is none the worse";
  }
  const CAllocations refused(1);
  CResultText empty(Owner(), 10);
  EXPECT_EQ(empty.Finish("", 0), nullptr);
}

TEST_F(HeapTexts, ListThatOutgrowsALargeExpectationIsWhole) {
  constexpr size_t kExpected = size_t{260} << 20;
  constexpr size_t kHalf = size_t{150} << 20;
  const auto fill = [](char c) { return [c](char* at) { memset(at, c, kHalf); }; };
  CResultText list(Owner(), kExpected);
  list.AppendWritten(kHalf, fill('a'));
  list.AppendWritten(kHalf, fill('b'));
  list.AppendText("c!");
  const char* const text = list.Finish("", 3);
  ASSERT_NE(text, nullptr);
  const std::string_view result(text);
  EXPECT_EQ(result.size(), 2 * kHalf + 4);
  EXPECT_EQ(result.substr(0, 3), "3!a");
  EXPECT_EQ(result.substr(1 + kHalf, 2), "ab");
  EXPECT_EQ(result.substr(1 + 2 * kHalf), "bc!");
}

TEST_F(HeapTexts, ListThatOutgrowsItsExpectationTakesEightTimesAsMuchOnce) {
  CResultText list(Owner(), 10000);
  list.AppendText("a");
  const int first = m_gateway.m_nDataSize;
  EXPECT_GE(first, 10000);
  EXPECT_LT(first, 15000);
  list.AppendText(std::string(static_cast<size_t>(first), 'b'));
  EXPECT_GE(m_gateway.m_nDataSize, 8 * first);
  EXPECT_LT(m_gateway.m_nDataSize, 9 * first);
}

// The last size that an int holds is a block's, its terminator and the list's opening included.
TEST_F(HeapTexts, SizesUpToWhatAnIntHoldsAreServedAndNoMore) {
  EXPECT_EQ(RenewHeapText(Owner(), INT32_MAX), nullptr);
  EXPECT_EQ(m_gateway.m_pData, nullptr);
  constexpr size_t kLongest = INT32_MAX - CResultText::kOpeningRoom - 1;
  const auto nothing = [](char*) {};
  CResultText list(Owner(), size_t{600} << 20);
  list.AppendWritten(kLongest, nothing);
  EXPECT_FALSE(list.Failed());
  EXPECT_EQ(m_gateway.m_nDataSize, INT32_MAX);
  list.AppendText("x");
  EXPECT_TRUE(list.Failed());
  EXPECT_EQ(list.Finish("", 1), nullptr);
  CResultText overrated(Owner(), SIZE_MAX);
  overrated.AppendText("short!");
  EXPECT_STREQ(overrated.Finish("", 1), "1!short!");
}

}  // namespace
}  // namespace gateway_tests
