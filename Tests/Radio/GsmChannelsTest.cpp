// SPDX-License-Identifier: Apache-2.0
#include "Tests/Radio/ChannelSweep.h"

namespace kelvasi {
namespace {

using testing::BandLimits;
using testing::TypedCarrier;

// 3GPP TS 45.005, clause 2; the names of the extensions of 900 MHz for what they add.
constexpr std::array bands{
    BandLimits{"GSM 450", 460.4, 467.6, 450.4, 457.6, 35},
    BandLimits{"GSM 480", 488.8, 496, 478.8, 486, 35},
    BandLimits{"GSM 750", 747, 762, 777, 792, 74},
    BandLimits{"GSM 850", 869, 894, 824, 849, 124},
    BandLimits{"P-GSM 900", 935, 960, 890, 915, 124},
    BandLimits{"E-GSM 900", 925, 935, 880, 890, 50},
    BandLimits{"R-GSM 900", 921, 925, 876, 880, 20},
    BandLimits{"ER-GSM 900", 918, 921, 873, 876, 15},
    BandLimits{"DCS 1800", 1805, 1880, 1710, 1785, 374},
    BandLimits{"PCS 1900", 1930, 1990, 1850, 1910, 299},
};

TEST(GsmChannels, EveryNumberLiesWithinItsBand) {
  testing::expectEveryNumberWithin(bands, gsmCarriers);
}

TEST(GsmChannels, OnlyDcsAndPcsShareNumbers) {
  for (std::uint32_t arfcn = 0; arfcn < 1024; ++arfcn) {
    EXPECT_EQ(gsmCarriers(arfcn).size() == 2, 512 <= arfcn && arfcn <= 810) << arfcn;
    EXPECT_LE(gsmCarriers(arfcn).size(), 2U) << arfcn;
  }
}

TEST(GsmChannels, ValuesTypedByHand) {
  constexpr std::array rows{
      TypedCarrier{0, "E-GSM 900", 935, 890},        TypedCarrier{1, "P-GSM 900", 935.2, 890.2},
      TypedCarrier{62, "P-GSM 900", 947.4, 902.4},   TypedCarrier{124, "P-GSM 900", 959.8, 914.8},
      TypedCarrier{128, "GSM 850", 869.2, 824.2},    TypedCarrier{190, "GSM 850", 881.6, 836.6},
      TypedCarrier{251, "GSM 850", 893.8, 848.8},    TypedCarrier{259, "GSM 450", 460.6, 450.6},
      TypedCarrier{293, "GSM 450", 467.4, 457.4},    TypedCarrier{306, "GSM 480", 489, 479},
      TypedCarrier{340, "GSM 480", 495.8, 485.8},    TypedCarrier{438, "GSM 750", 747.2, 777.2},
      TypedCarrier{511, "GSM 750", 761.8, 791.8},    TypedCarrier{512, "DCS 1800", 1805.2, 1710.2},
      TypedCarrier{512, "PCS 1900", 1930.2, 1850.2}, TypedCarrier{661, "PCS 1900", 1960, 1880},
      TypedCarrier{661, "DCS 1800", 1835, 1740},     TypedCarrier{810, "PCS 1900", 1989.8, 1909.8},
      TypedCarrier{885, "DCS 1800", 1879.8, 1784.8}, TypedCarrier{940, "ER-GSM 900", 918.2, 873.2},
      TypedCarrier{955, "R-GSM 900", 921.2, 876.2},  TypedCarrier{974, "R-GSM 900", 925, 880},
      TypedCarrier{975, "E-GSM 900", 925.2, 880.2},  TypedCarrier{1023, "E-GSM 900", 934.8, 889.8},
  };
  testing::expectTyped(rows, gsmCarriers);
}

TEST(GsmChannels, NumbersBetweenTheBandsMeanNothing) {
  for (const std::uint32_t arfcn :
       {125U, 127U, 252U, 258U, 294U, 305U, 341U, 437U, 886U, 939U, 1024U, 65535U}) {
    EXPECT_TRUE(gsmCarriers(arfcn).empty()) << arfcn;
  }
}

}  // namespace
}  // namespace kelvasi
