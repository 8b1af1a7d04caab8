#include <gtest/gtest.h>

#include "tests/support/surroundings.h"

int main(int argc, char** argv) {
  gateway_tests::EnterMarketTimeZone();
  testing::InitGoogleTest(&argc, argv);
  return RUN_ALL_TESTS();
}
