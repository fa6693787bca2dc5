// SPDX-License-Identifier: Apache-2.0
#include "Radio/NetworkId.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

TEST(NetworkId, TheDigitsOfARecordSayHowLongTheNetworkCodeIs) {
  EXPECT_EQ(networkIdFromDigits("262", "01"), (NetworkId{262, 1, 2}));
  EXPECT_EQ(networkIdFromDigits("310", "01 "), (NetworkId{310, 1, 2}));
  EXPECT_EQ(networkIdFromDigits("310", "010"), (NetworkId{310, 10, 3}));
  EXPECT_EQ(networkIdFromDigits("310", "410"), (NetworkId{310, 410, 3}));
  EXPECT_NE(networkIdFromDigits("310", "41"), networkIdFromDigits("310", "041"));
}

TEST(NetworkId, OtherTextsAreNoNetwork) {
  for (const char* mnc : {"", "1", "1  ", "0101", "0a", " 01", "0 1", "-1"})
    EXPECT_EQ(networkIdFromDigits("262", mnc), std::nullopt) << mnc;
  for (const char* mcc : {"", "26", "2620", "26x", " 62"})
    EXPECT_EQ(networkIdFromDigits(mcc, "01"), std::nullopt) << mcc;
}

TEST(NetworkId, ANumberBelowAHundredMayHaveTwoDigitsOrThree) {
  EXPECT_EQ(networkIdFromNumbers(262, 1), (NetworkId{262, 1, 0}));
  EXPECT_EQ(networkIdFromNumbers(310, 99), (NetworkId{310, 99, 0}));
  EXPECT_EQ(networkIdFromNumbers(310, 100), (NetworkId{310, 100, 3}));
  EXPECT_EQ(networkIdFromNumbers(999, 999), (NetworkId{999, 999, 3}));
}

TEST(NetworkId, NumbersOutOfRangeAreNoNetwork) {
  EXPECT_EQ(networkIdFromNumbers(1000, 1), std::nullopt);
  EXPECT_EQ(networkIdFromNumbers(262, 1000), std::nullopt);
  EXPECT_EQ(networkIdFromNumbers(-1, 1), std::nullopt);
  EXPECT_EQ(networkIdFromNumbers(262, -1), std::nullopt);
}

TEST(NetworkId, IsWrittenWithAllItsDigits) {
  EXPECT_EQ(textOf({1, 1, 2}), "001-01");
  EXPECT_EQ(textOf({310, 26, 3}), "310-026");
  EXPECT_EQ(textOf({310, 26, 0}), "310-26");
  EXPECT_EQ(textOf({262, 7, 0}), "262-07");
}

}  // namespace
}  // namespace kelvasi
