// SPDX-License-Identifier: Apache-2.0
#include "Tests/Radio/ChannelSweep.h"

namespace kelvasi {
namespace {

using testing::BandLimits;
using testing::TypedCarrier;

// 3GPP2 C.S0057: the system's frequencies of each class. Some channels have their centre on the band's edge.
constexpr std::array bands{
    BandLimits{"BC0", 860, 894, 815, 849, 799 + 33 + 300},
    BandLimits{"BC1", 1930, 1990, 1850, 1910, 1200},
    BandLimits{"BC2", 917, 960, 872, 915, 1001 + 719},
    BandLimits{"BC3", 832, 870, 887, 925, 799 + 239 + 159 + 400},
    BandLimits{"BC4", 1840, 1870, 1750, 1780, 600},
    BandLimits{"BC6", 2110, 2170, 1920, 1980, 1200},
    BandLimits{"BC7", 746, 758, 776, 788, 241},
    BandLimits{"BC8", 1805, 1880, 1710, 1785, 1500},
    BandLimits{"BC9", 925, 960, 880, 915, 700},
    BandLimits{"BC10", 851, 940, 806, 901, 920},
    BandLimits{"BC12", 915, 921, 870, 876, 240},
    BandLimits{"BC13", 2620, 2690, 2500, 2570, 1400},
    BandLimits{"BC14", 1930, 1995, 1850, 1915, 1300},
    BandLimits{"BC15", 2110, 2155, 1710, 1755, 900},
};

// The channels of class 5 are on two rasters over the same spectrum, so some share their frequency.
bool isClassFive(const Carrier& carrier) {
  return carrier.band.number == 5;
}

TEST(CdmaChannels, EveryNumberLiesWithinItsBand) {
  testing::expectEveryNumberWithin(bands, [](std::uint32_t channel) {
    Carriers others;
    for (const Carrier& carrier : cdmaCarriers(channel)) {
      if (!isClassFive(carrier)) others.add(carrier);
    }
    return others;
  });
}

TEST(CdmaChannels, EveryNumberOfClassFiveLiesWithinItsBand) {
  const BandLimits lower{"BC5", 420, 493.5, 410, 483.5};
  std::size_t channels = 0;
  for (std::uint32_t channel = 0; channel < testing::sweepEnd; ++channel) {
    for (const Carrier& carrier : cdmaCarriers(channel, 5)) {
      testing::expectWithin(lower, carrier, channel);
      EXPECT_EQ(carrier.downlink - *carrier.uplink, 10_MHz) << channel;
      ++channels;
    }
  }
  EXPECT_EQ(channels, 400U + 400 + 435 + 180 + 225);
}

TEST(CdmaChannels, ABandClassChoosesOneCarrier) {
  for (std::uint32_t channel = 0; channel < testing::sweepEnd; ++channel) {
    std::size_t alone = 0;
    for (std::uint32_t bandClass = 0; bandClass < 32; ++bandClass) {
      const Carriers chosen = cdmaCarriers(channel, bandClass);
      EXPECT_LE(chosen.size(), 1U) << channel;
      alone += chosen.size();
    }
    EXPECT_EQ(alone, cdmaCarriers(channel).size()) << channel;
  }
}

TEST(CdmaChannels, ValuesTypedByHand) {
  constexpr std::array rows{
      TypedCarrier{283, "BC0", 878.49, 833.49},
      TypedCarrier{384, "BC0", 881.52, 836.52},
      TypedCarrier{777, "BC0", 893.31, 848.31},
      TypedCarrier{1013, "BC0", 869.7, 824.7},
      TypedCarrier{1023, "BC0", 870, 825},
      TypedCarrier{1024, "BC0", 860.04, 815.04},
      TypedCarrier{25, "BC1", 1931.25, 1851.25},
      TypedCarrier{600, "BC1", 1960, 1880},
      TypedCarrier{1175, "BC1", 1988.75, 1908.75},
      TypedCarrier{0, "BC2", 934.9875, 889.9875},
      TypedCarrier{2047, "BC2", 934.9625, 889.9625},
      TypedCarrier{76, "BC3", 860.95, 915.95},
      TypedCarrier{100, "BC4", 1845, 1755},
      TypedCarrier{160, "BC5", 463.975, 453.975},
      TypedCarrier{472, "BC5", 420, 410},
      TypedCarrier{1473, "BC5", 469.99, 459.99},
      TypedCarrier{1600, "BC5", 490.6, 480.6},
      TypedCarrier{2016, "BC5", 493.48, 483.48},
      TypedCarrier{25, "BC6", 2111.25, 1921.25},
      TypedCarrier{120, "BC7", 752, 782},
      TypedCarrier{1499, "BC8", 1879.95, 1784.95},
      TypedCarrier{20, "BC9", 926, 881},
      TypedCarrier{476, "BC10", 862.9, 817.9},
      TypedCarrier{720, "BC10", 935, 896},
      TypedCarrier{40, "BC12", 916.0125, 871.0125},
      TypedCarrier{200, "BC13", 2630, 2510},
      TypedCarrier{1250, "BC14", 1992.5, 1912.5},
      TypedCarrier{425, "BC15", 2131.25, 1731.25},
  };
  testing::expectTyped(rows, [](std::uint32_t channel) { return cdmaCarriers(channel); });
}

TEST(CdmaChannels, NumbersOfNoBandAndClassesWithoutATableMeanNothing) {
  EXPECT_TRUE(cdmaCarriers(2048).empty());
  EXPECT_TRUE(cdmaCarriers(800, 0).empty());
  EXPECT_TRUE(cdmaCarriers(990, 0).empty());
  EXPECT_TRUE(cdmaCarriers(100, 11).empty());
  EXPECT_TRUE(cdmaCarriers(100, 255).empty());
}

}  // namespace
}  // namespace kelvasi
