// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Radio/EutraBand.h"

#include <gtest/gtest.h>

#include <ostream>

namespace kelvasi::sim {
namespace {

// Typed from 3GPP TS 36.101, table 5.7.3-1: the first and last numbers of bands, and worked frequencies.
struct Carrier {
  std::uint16_t earfcn;
  int band;
  double downlink;
  std::uint16_t uplinkNumber;
  double uplink;
};
void PrintTo(const Carrier& carrier, std::ostream* out) {
  *out << carrier.earfcn;
}

class EutraCarrier : public testing::TestWithParam<Carrier> {};

TEST_P(EutraCarrier, LiesWhereTheTablePutsIt) {
  const Carrier& carrier = GetParam();
  const EutraBand* band = eutraBandOf(carrier.earfcn);
  ASSERT_TRUE(band);
  EXPECT_EQ(band->number, carrier.band);
  EXPECT_NEAR(downlinkMegahertz(carrier.earfcn), carrier.downlink, 1e-6);
  EXPECT_EQ(uplinkEarfcn(carrier.earfcn), carrier.uplinkNumber);
  EXPECT_NEAR(uplinkMegahertz(carrier.earfcn), carrier.uplink, 1e-6);
}

INSTANTIATE_TEST_SUITE_P(
    Table, EutraCarrier,
    testing::Values(Carrier{0, 1, 2110, 18000, 1920}, Carrier{300, 1, 2140, 18300, 1950},
                    Carrier{599, 1, 2169.9, 18599, 1979.9}, Carrier{600, 2, 1930, 18600, 1850},
                    Carrier{1199, 2, 1989.9, 19199, 1909.9}, Carrier{1200, 3, 1805, 19200, 1710},
                    Carrier{1575, 3, 1842.5, 19575, 1747.5}, Carrier{1949, 3, 1879.9, 19949, 1784.9},
                    Carrier{2175, 4, 2132.5, 20175, 1732.5}, Carrier{2525, 5, 881.5, 20525, 836.5},
                    Carrier{2750, 7, 2620, 20750, 2500}, Carrier{3350, 7, 2680, 21350, 2560},
                    Carrier{3449, 7, 2689.9, 21449, 2569.9}, Carrier{3625, 8, 942.5, 21625, 897.5},
                    Carrier{5230, 13, 751, 23230, 782}, Carrier{5330, 14, 763, 23330, 793},
                    Carrier{5790, 17, 740, 23790, 710}, Carrier{6150, 20, 791, 24150, 832},
                    Carrier{6300, 20, 806, 24300, 847}, Carrier{6449, 20, 820.9, 24449, 861.9},
                    Carrier{37750, 38, 2570, 37750, 2570}, Carrier{38000, 38, 2595, 38000, 2595},
                    Carrier{39150, 40, 2350, 39150, 2350}));

TEST(EutraBand, NumbersBetweenTheBandsAreInNone) {
  for (const int earfcn : {4950, 5009, 5380, 5729, 6600, 35999, 36350, 37749, 41590, 65535})
    EXPECT_FALSE(eutraBandOf(static_cast<std::uint16_t>(earfcn))) << earfcn;
}

// 3GPP TS 36.101, tables 5.6-1 and 5.6.1-1.
TEST(EutraBand, AllowsTheBandwidthsOfTheTable) {
  EXPECT_EQ(megahertzOfBlocks(6), 1.4);
  EXPECT_EQ(megahertzOfBlocks(15), 3);
  EXPECT_EQ(megahertzOfBlocks(25), 5);
  EXPECT_EQ(megahertzOfBlocks(50), 10);
  EXPECT_EQ(megahertzOfBlocks(75), 15);
  EXPECT_EQ(megahertzOfBlocks(100), 20);
  EXPECT_EQ(megahertzOfBlocks(7), 0);
  const auto allows = [](std::uint16_t earfcn, std::uint8_t blocks) {
    return allowsBandwidth(*eutraBandOf(earfcn), blocks);
  };
  EXPECT_FALSE(allows(300, 15));  // band 1 from 5 MHz
  EXPECT_TRUE(allows(300, 25));
  EXPECT_TRUE(allows(1575, 6));  // band 3 all
  EXPECT_TRUE(allows(1575, 100));
  EXPECT_TRUE(allows(2525, 50));  // band 5 up to 10 MHz
  EXPECT_FALSE(allows(2525, 75));
  EXPECT_FALSE(allows(5230, 15));  // band 13 5 and 10 MHz
  EXPECT_TRUE(allows(5230, 50));
  EXPECT_FALSE(allows(5230, 75));
  EXPECT_TRUE(allows(6300, 100));  // band 20 from 5 MHz
  EXPECT_FALSE(allows(6300, 15));
  EXPECT_FALSE(allows(6300, 7));  // no bandwidth at all
}

}  // namespace
}  // namespace kelvasi::sim
