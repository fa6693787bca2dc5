// SPDX-License-Identifier: Apache-2.0
#include "Tests/Radio/ChannelSweep.h"

namespace kelvasi {
namespace {

using testing::BandLimits;
using testing::TypedCarrier;

// 3GPP TS 25.101, table 5.0; the numbers of channels from tables 5.1 and 5.2.
constexpr std::array bands{
    BandLimits{"Band I", 2110, 2170, 1920, 1980, 277},
    BandLimits{"Band II", 1930, 1990, 1850, 1910, 277 + 12},
    BandLimits{"Band III", 1805, 1880, 1710, 1785, 352},
    BandLimits{"Band IV", 2110, 2155, 1710, 1755, 202 + 9},
    BandLimits{"Band V", 869, 894, 824, 849, 102 + 6},
    BandLimits{"Band VI", 875, 885, 830, 840, 27 + 2},
    BandLimits{"Band VII", 2620, 2690, 2500, 2570, 327 + 14},
    BandLimits{"Band VIII", 925, 960, 880, 915, 152},
    BandLimits{"Band IX", 1844.9, 1879.9, 1749.9, 1784.9, 151},
    BandLimits{"Band X", 2110, 2170, 1710, 1770, 277 + 12},
    BandLimits{"Band XI", 1475.9, 1495.9, 1427.9, 1447.9, 76},
    BandLimits{"Band XII", 729, 746, 699, 716, 62 + 5},
    BandLimits{"Band XIII", 746, 756, 777, 787, 27 + 2},
    BandLimits{"Band XIV", 758, 768, 788, 798, 27 + 2},
    BandLimits{"Band XIX", 875, 890, 830, 845, 52 + 3},
    BandLimits{"Band XX", 791, 821, 832, 862, 127},
    BandLimits{"Band XXI", 1495.9, 1510.9, 1447.9, 1462.9, 51},
    BandLimits{"Band XXII", 3510, 3590, 3410, 3490, 377},
    BandLimits{"Band XXV", 1930, 1995, 1850, 1915, 302 + 13},
    BandLimits{"Band XXVI", 859, 894, 814, 849, 152},
    BandLimits{"Band XXXII", 1452, 1496, 0, 0, 197 + 8},
};

Carriers ofDownlink(std::uint32_t uarfcn) {
  return utraFddCarriers(uarfcn, LinkDirection::downlink);
}
Carriers ofUplink(std::uint32_t uarfcn) {
  return utraFddCarriers(uarfcn, LinkDirection::uplink);
}

TEST(UtraFddChannels, EveryNumberLiesWithinItsBand) {
  testing::expectEveryNumberWithin(bands, ofDownlink);
}

TEST(UtraFddChannels, EveryUplinkNumberLiesWithinItsBand) {
  std::vector<BandLimits> paired(bands.begin(), bands.end());
  std::erase_if(paired, [](const BandLimits& band) { return band.uplinkHigh == 0; });
  testing::expectEveryNumberWithin(paired, ofUplink);
}

// 3GPP TS 25.101, table 5.0A.
TEST(UtraFddChannels, TheTwoWaysAreAsFarApartAsTheBandSays) {
  const std::map<int, double> separations{
      {1, 190}, {2, 80},  {3, 95},   {4, 400},  {5, 45},  {6, 45},   {7, 120}, {8, 45},   {9, 95},  {10, 400},
      {11, 48}, {12, 30}, {13, -31}, {14, -30}, {19, 45}, {20, -41}, {21, 48}, {22, 100}, {25, 80}, {26, 45},
  };
  for (std::uint32_t uarfcn = 0; uarfcn < testing::sweepEnd; ++uarfcn) {
    for (const Carrier& carrier : ofDownlink(uarfcn)) {
      EXPECT_EQ(carrier.uplink.has_value(), carrier.band.number != 32) << uarfcn;
      if (!carrier.uplink) continue;
      EXPECT_EQ((carrier.downlink - *carrier.uplink).megahertz(), separations.at(carrier.band.number))
          << uarfcn;
    }
  }
}

TEST(UtraFddChannels, OnlyBandsFiveAndSixShareNumbersOfTheDownlink) {
  for (std::uint32_t uarfcn = 0; uarfcn < testing::sweepEnd; ++uarfcn) {
    const bool isShared = (4387 <= uarfcn && uarfcn <= 4413) || uarfcn == 1037 || uarfcn == 1062;
    EXPECT_EQ(ofDownlink(uarfcn).size() > 1, isShared) << uarfcn;
  }
  EXPECT_EQ(textOf(ofDownlink(4400)), "Band V 880 MHz or Band VI 880 MHz");
}

TEST(UtraFddChannels, ValuesTypedByHand) {
  constexpr std::array rows{
      TypedCarrier{10562, "Band I", 2112.4, 1922.4},  TypedCarrier{10700, "Band I", 2140, 1950},
      TypedCarrier{10838, "Band I", 2167.6, 1977.6},  TypedCarrier{9800, "Band II", 1960, 1880},
      TypedCarrier{412, "Band II", 1932.5, 1852.5},   TypedCarrier{687, "Band II", 1987.5, 1907.5},
      TypedCarrier{1338, "Band III", 1842.6, 1747.6}, TypedCarrier{1637, "Band IV", 2132.4, 1732.4},
      TypedCarrier{2087, "Band IV", 2152.5, 1752.5},  TypedCarrier{4385, "Band V", 877, 832},
      TypedCarrier{1087, "Band V", 887.5, 842.5},     TypedCarrier{1062, "Band VI", 882.5, 837.5},
      TypedCarrier{2400, "Band VII", 2655, 2535},     TypedCarrier{2912, "Band VII", 2687.5, 2567.5},
      TypedCarrier{2937, "Band VIII", 927.4, 882.4},  TypedCarrier{3088, "Band VIII", 957.6, 912.6},
      TypedCarrier{9387, "Band IX", 1877.4, 1782.4},  TypedCarrier{3388, "Band X", 2167.6, 1767.6},
      TypedCarrier{3787, "Band XI", 1493.4, 1445.4},  TypedCarrier{3992, "Band XII", 743.5, 713.5},
      TypedCarrier{4043, "Band XIII", 753.6, 784.6},  TypedCarrier{4192, "Band XIV", 765.5, 795.5},
      TypedCarrier{738, "Band XIX", 882.6, 837.6},    TypedCarrier{4638, "Band XX", 818.6, 859.6},
      TypedCarrier{887, "Band XXI", 1503.4, 1455.4},  TypedCarrier{5038, "Band XXII", 3587.6, 3487.6},
      TypedCarrier{6592, "Band XXV", 1992.5, 1912.5}, TypedCarrier{5913, "Band XXVI", 891.6, 846.6},
      TypedCarrier{6813, "Band XXXII", 1493.6, 0},
  };
  testing::expectTyped(rows, ofDownlink);
}

TEST(UtraFddChannels, UplinkNumbersTypedByHand) {
  constexpr std::array rows{
      TypedCarrier{9750, "Band I", 2140, 1950},       TypedCarrier{9400, "Band II", 1960, 1880},
      TypedCarrier{12, "Band II", 1932.5, 1852.5},    TypedCarrier{4175, "Band V", 880, 835},
      TypedCarrier{4175, "Band VI", 880, 835},        TypedCarrier{2712, "Band VIII", 927.4, 882.4},
      TypedCarrier{6067, "Band XXV", 1932.5, 1852.5}, TypedCarrier{4287, "Band XX", 793.4, 834.4},
  };
  testing::expectTyped(rows, ofUplink);
}

TEST(UtraFddChannels, NumbersBetweenTheChannelsMeanNothing) {
  for (const std::uint32_t uarfcn : {0U, 411U, 413U, 688U, 10561U, 10839U, 13096U, 65535U}) {
    EXPECT_TRUE(ofDownlink(uarfcn).empty()) << uarfcn;
  }
}

}  // namespace
}  // namespace kelvasi
