// SPDX-License-Identifier: Apache-2.0
#include "Tests/Radio/ChannelSweep.h"

namespace kelvasi {
namespace {

using testing::BandLimits;
using testing::TypedCarrier;

// 3GPP TS 36.101, table 5.5-1. A step of 100 kHz is a channel, up to the one before the band's end.
constexpr std::array pairedBands{
    BandLimits{"B1", 2110, 2170, 1920, 1980},
    BandLimits{"B2", 1930, 1990, 1850, 1910},
    BandLimits{"B3", 1805, 1880, 1710, 1785},
    BandLimits{"B4", 2110, 2155, 1710, 1755},
    BandLimits{"B5", 869, 894, 824, 849},
    BandLimits{"B6", 875, 885, 830, 840},
    BandLimits{"B7", 2620, 2690, 2500, 2570},
    BandLimits{"B8", 925, 960, 880, 915},
    BandLimits{"B9", 1844.9, 1879.9, 1749.9, 1784.9},
    BandLimits{"B10", 2110, 2170, 1710, 1770},
    BandLimits{"B11", 1475.9, 1495.9, 1427.9, 1447.9},
    BandLimits{"B12", 729, 746, 699, 716},
    BandLimits{"B13", 746, 756, 777, 787},
    BandLimits{"B14", 758, 768, 788, 798},
    BandLimits{"B17", 734, 746, 704, 716},
    BandLimits{"B18", 860, 875, 815, 830},
    BandLimits{"B19", 875, 890, 830, 845},
    BandLimits{"B20", 791, 821, 832, 862},
    BandLimits{"B21", 1495.9, 1510.9, 1447.9, 1462.9},
    BandLimits{"B22", 3510, 3590, 3410, 3490},
    BandLimits{"B23", 2180, 2200, 2000, 2020},
    BandLimits{"B24", 1525, 1559, 1626.5, 1660.5},
    BandLimits{"B25", 1930, 1995, 1850, 1915},
    BandLimits{"B26", 859, 894, 814, 849},
    BandLimits{"B27", 852, 869, 807, 824},
    BandLimits{"B28", 758, 803, 703, 748},
    BandLimits{"B29", 717, 728},
    BandLimits{"B30", 2350, 2360, 2305, 2315},
    BandLimits{"B31", 462.5, 467.5, 452.5, 457.5},
    BandLimits{"B32", 1452, 1496},
    BandLimits{"B65", 2110, 2200, 1920, 2010},
    BandLimits{"B66", 2110, 2200, 1710, 1780},
    BandLimits{"B67", 738, 758},
    BandLimits{"B68", 753, 783, 698, 728},
    BandLimits{"B69", 2570, 2620},
    BandLimits{"B70", 1995, 2020, 1695, 1710},
    BandLimits{"B71", 617, 652, 663, 698},
    BandLimits{"B72", 461, 466, 451, 456},
    BandLimits{"B73", 460, 465, 450, 455},
    BandLimits{"B74", 1475, 1518, 1427, 1470},
    BandLimits{"B75", 1432, 1517},
    BandLimits{"B76", 1427, 1432},
    BandLimits{"B85", 728, 746, 698, 716},
    BandLimits{"B87", 420, 425, 410, 415},
    BandLimits{"B88", 422, 427, 412, 417},
    BandLimits{"B103", 757, 758, 787, 788},
};

struct UnpairedBand {
  std::string_view name;
  double low;  // MHz
  double high;
};
constexpr std::array unpairedBands{
    UnpairedBand{"B33", 1900, 1920}, UnpairedBand{"B34", 2010, 2025}, UnpairedBand{"B35", 1850, 1910},
    UnpairedBand{"B36", 1930, 1990}, UnpairedBand{"B37", 1910, 1930}, UnpairedBand{"B38", 2570, 2620},
    UnpairedBand{"B39", 1880, 1920}, UnpairedBand{"B40", 2300, 2400}, UnpairedBand{"B41", 2496, 2690},
    UnpairedBand{"B42", 3400, 3600}, UnpairedBand{"B43", 3600, 3800}, UnpairedBand{"B44", 703, 803},
    UnpairedBand{"B45", 1447, 1467}, UnpairedBand{"B46", 5150, 5925}, UnpairedBand{"B47", 5855, 5925},
    UnpairedBand{"B48", 3550, 3700}, UnpairedBand{"B49", 3550, 3700}, UnpairedBand{"B50", 1432, 1517},
    UnpairedBand{"B51", 1427, 1432}, UnpairedBand{"B52", 3300, 3400}, UnpairedBand{"B53", 2483.5, 2495},
};

std::size_t stepsBetween(double low, double high) {
  return static_cast<std::size_t>((high - low) * 10 + 0.5);
}

// With the channels that a band's downlink has.
std::vector<BandLimits> allBands() {
  std::vector<BandLimits> bands(pairedBands.begin(), pairedBands.end());
  for (const auto& [name, low, high] : unpairedBands) bands.push_back({name, low, high, low, high});
  for (BandLimits& band : bands) band.channels = stepsBetween(band.downlinkLow, band.downlinkHigh);
  return bands;
}

bool isUplinkNumber(std::uint32_t earfcn) {
  return (18000 <= earfcn && earfcn < 36000) || earfcn >= 131072;
}

TEST(EutraChannels, EveryNumberLiesWithinItsBand) {
  testing::expectEveryNumberWithin(allBands(), [](std::uint32_t earfcn) {
    return isUplinkNumber(earfcn) && earfcn < testing::sweepEnd ? Carriers() : eutraCarriers(earfcn);
  });
}

TEST(EutraChannels, EveryUplinkNumberLiesWithinItsBand) {
  std::vector<BandLimits> bands(pairedBands.begin(), pairedBands.end());
  std::erase_if(bands, [](const BandLimits& band) { return band.uplinkHigh == 0; });
  for (BandLimits& band : bands) band.channels = stepsBetween(band.uplinkLow, band.uplinkHigh);
  testing::expectEveryNumberWithin(bands, [](std::uint32_t earfcn) {
    return isUplinkNumber(earfcn) ? eutraCarriers(earfcn) : Carriers();
  });
}

TEST(EutraChannels, TheUplinksNumberBelongsToTheSameCarrier) {
  for (std::uint32_t number = 0; number < testing::sweepEnd; ++number) {
    const auto uplink = eutraUplinkNumber(number);
    if (!uplink) continue;
    EXPECT_EQ(eutraCarriers(*uplink)[0], eutraCarriers(number)[0]) << number;
  }
}

// 3GPP TS 36.101, table 5.7.3-1.
TEST(EutraChannels, UplinkNumbersTypedByHand) {
  using Pair = std::pair<std::uint32_t, std::uint32_t>;
  for (const auto& [downlink, uplink] :
       {Pair{0, 18000}, Pair{599, 18599}, Pair{1575, 19575}, Pair{3350, 21350}, Pair{6300, 24300},
        Pair{9770, 27660}, Pair{37750, 37750}, Pair{39150, 39150}, Pair{66436, 131972}})
    EXPECT_EQ(eutraUplinkNumber(downlink), uplink) << downlink;
  for (const std::uint32_t number : {4950u, 9660u, 18000u, 67335u, 67336u, 0xFFFFFFFFu})
    EXPECT_EQ(eutraUplinkNumber(number), std::nullopt) << number;
}

TEST(EutraChannels, ANumberMeansOneCarrierAtMost) {
  for (std::uint32_t earfcn = 0; earfcn < testing::sweepEnd; ++earfcn)
    ASSERT_LE(eutraCarriers(earfcn).size(), 1U) << earfcn;
}

// The numbers of the downlink leave out these, and no others, up to the last of them.
TEST(EutraChannels, TheGapsAreThoseOfTheStandard) {
  struct Gap {
    std::uint32_t first;
    std::uint32_t last;
  };
  constexpr std::array gaps{Gap{4950, 5009},   Gap{5380, 5729},   Gap{7400, 7499},   Gap{10360, 17999},
                            Gap{22950, 23009}, Gap{23380, 23729}, Gap{25400, 25499}, Gap{27810, 35999},
                            Gap{60255, 65535}, Gap{70656, 131071}};
  for (std::uint32_t earfcn = 0; earfcn < 134292; ++earfcn) {
    const bool isInGap =
        std::ranges::any_of(gaps, [&](const Gap& gap) { return gap.first <= earfcn && earfcn <= gap.last; });
    EXPECT_EQ(eutraCarriers(earfcn).empty(), isInGap) << earfcn;
  }
  EXPECT_TRUE(eutraCarriers(134292).empty());
}

TEST(EutraChannels, ValuesTypedByHand) {
  constexpr std::array rows{
      TypedCarrier{0, "B1", 2110, 1920},        TypedCarrier{300, "B1", 2140, 1950},
      TypedCarrier{900, "B2", 1960, 1880},      TypedCarrier{1300, "B3", 1815, 1720},
      TypedCarrier{1575, "B3", 1842.5, 1747.5}, TypedCarrier{2175, "B4", 2132.5, 1732.5},
      TypedCarrier{2525, "B5", 881.5, 836.5},   TypedCarrier{3350, "B7", 2680, 2560},
      TypedCarrier{3625, "B8", 942.5, 897.5},   TypedCarrier{3799, "B8", 959.9, 914.9},
      TypedCarrier{3800, "B9", 1844.9, 1749.9}, TypedCarrier{5095, "B12", 737.5, 707.5},
      TypedCarrier{5230, "B13", 751, 782},      TypedCarrier{5330, "B14", 763, 793},
      TypedCarrier{5790, "B17", 740, 710},      TypedCarrier{6300, "B20", 806, 847},
      TypedCarrier{6449, "B20", 820.9, 861.9},  TypedCarrier{8365, "B25", 1962.5, 1882.5},
      TypedCarrier{9410, "B28", 778, 723},      TypedCarrier{9715, "B29", 722.5, 0},
      TypedCarrier{9820, "B30", 2355, 2310},    TypedCarrier{9895, "B31", 465, 455},
      TypedCarrier{38000, "B38", 2595, 2595},   TypedCarrier{38450, "B39", 1900, 1900},
      TypedCarrier{39150, "B40", 2350, 2350},   TypedCarrier{40620, "B41", 2593, 2593},
      TypedCarrier{42590, "B42", 3500, 3500},   TypedCarrier{50665, "B46", 5537.5, 5537.5},
      TypedCarrier{55990, "B48", 3625, 3625},   TypedCarrier{66886, "B66", 2155, 1755},
      TypedCarrier{67335, "B66", 2199.9, 0},    TypedCarrier{68485, "B70", 2009.9, 1709.9},
      TypedCarrier{68486, "B70", 2010, 0},      TypedCarrier{68761, "B71", 634.5, 680.5},
      TypedCarrier{21100, "B7", 2655, 2535},    TypedCarrier{132322, "B66", 2145, 1745},
  };
  testing::expectTyped(rows, eutraCarriers);
}

}  // namespace
}  // namespace kelvasi
