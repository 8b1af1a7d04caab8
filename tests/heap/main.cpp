#include <gtest/gtest.h>

#include "tests/support/surroundings.h"

int main(int argc, char** argv) {
  // Reads the zone once: later readings of the clock ask nothing of the heap.
  gateway_tests::EnterMarketTimeZone();
  testing::InitGoogleTest(&argc, argv);
  return RUN_ALL_TESTS();
}
