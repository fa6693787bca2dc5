// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include "LogGenerator/Base.h"

namespace kelvasi {
namespace {

TEST(LookUpECNO, GivesTheLadderAtItsEdges) {
  EXPECT_EQ(Base::lookUpECNO(0xFFFFFFFF), 0);
  EXPECT_EQ(Base::lookUpECNO(524288), 0);
  EXPECT_EQ(Base::lookUpECNO(524287), -1);
  EXPECT_EQ(Base::lookUpECNO(417648), -1);
  EXPECT_EQ(Base::lookUpECNO(417647), -2);
  EXPECT_EQ(Base::lookUpECNO(16904), -15);
  EXPECT_EQ(Base::lookUpECNO(16903), -16);
  EXPECT_EQ(Base::lookUpECNO(814), -30);
}

TEST(LookUpECNO, YieldsMinus31OverTwoSteps) {
  EXPECT_EQ(Base::lookUpECNO(813), -31);
  EXPECT_EQ(Base::lookUpECNO(757), -31);
  EXPECT_EQ(Base::lookUpECNO(756), -31);
  EXPECT_EQ(Base::lookUpECNO(706), -31);
}

TEST(LookUpECNO, MapsTheSmallestValuesBackToZero) {
  EXPECT_EQ(Base::lookUpECNO(705), 0);
  EXPECT_EQ(Base::lookUpECNO(600), 0);
  EXPECT_EQ(Base::lookUpECNO(0), 0);
}

// The ladder as conditions in the order in which they are tried, written out a second time.
std::int16_t slowLadder(std::uint32_t v) {
  if (v >= 524288) return 0;
  const std::uint32_t above[] = {417647, 331808, 263624, 209463, 166441, 132268, 105123,
                                 83562,  66435,  52830,  42023,  33440,  26621,  21205};
  for (int step = 0; step < 14; ++step) {
    if (v > above[step]) return static_cast<std::int16_t>(-1 - step);
  }
  if (v >= 16904) return -15;
  if (v > 13486) return -16;
  if (v >= 10772) return -17;
  if (v >= 8616) return -18;
  if (v > 6902) return -19;
  if (v > 5542) return -20;
  if (v >= 4462) return -21;
  const std::uint32_t lowest[] = {3603, 2921, 2240, 1949, 1607, 1336, 1120, 949, 813};
  for (int step = 0; step < 9; ++step) {
    if (v > lowest[step]) return static_cast<std::int16_t>(-22 - step);
  }
  return v > 705 ? std::int16_t{-31} : std::int16_t{0};
}

TEST(LookUpECNO, AgreesWithTheLadderWrittenOutEverywhere) {
  for (std::uint32_t linear = 0; linear <= 530000; ++linear) {
    ASSERT_EQ(Base::lookUpECNO(linear), slowLadder(linear)) << linear;
  }
}

}  // namespace
}  // namespace kelvasi
