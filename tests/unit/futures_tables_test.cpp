// The leg codes of futures lists.

#include <gtest/gtest.h>

#include "gateway/futures/leg_code.h"

namespace gateway_tests {
namespace {

TEST(FuturesLegPairs, TableHasFourRowsAndTwoSides) {
  EXPECT_EQ(FindLegPair("")->buying, 51);
  EXPECT_EQ(FindLegPair("0")->buying, 53);
  EXPECT_EQ(FindLegPair("1")->buying, 55);
  EXPECT_EQ(FindLegPair("2")->buying, 57);
  for (const char* open : {" ", "3", "00", "x"}) EXPECT_EQ(FindLegPair(open), nullptr);
  EXPECT_EQ(SideOffset("B"), 0);
  EXPECT_EQ(SideOffset("S"), 1);
  for (const char* open : {"", " ", "b", "s", "BS"}) EXPECT_EQ(SideOffset(open), kNoSide);
}

}  // namespace
}  // namespace gateway_tests
