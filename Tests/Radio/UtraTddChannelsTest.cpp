// SPDX-License-Identifier: Apache-2.0
#include "Tests/Radio/ChannelSweep.h"

namespace kelvasi {
namespace {

using testing::BandLimits;
using testing::TypedCarrier;

// 3GPP TS 25.102, clause 5.2. A carrier of 1.6 MHz lies in the band as a whole.
constexpr std::array bands{
    BandLimits{"TDD band a", 1900.8, 2024.2, 1900.8, 2024.2, 93 + 68},
    BandLimits{"TDD band b", 1850.8, 1989.2, 1850.8, 1989.2, 293 + 293},
    BandLimits{"TDD band c", 1910.8, 1929.2, 1910.8, 1929.2, 93},
    BandLimits{"TDD band d", 2570.8, 2619.2, 2570.8, 2619.2, 243},
    BandLimits{"TDD band e", 2300.8, 2399.2, 2300.8, 2399.2, 493},
    BandLimits{"TDD band f", 1880.8, 1919.2, 1880.8, 1919.2, 193},
};

TEST(UtraTddChannels, EveryNumberLiesWithinItsBand) {
  testing::expectEveryNumberWithin(bands, utraTddCarriers);
}

TEST(UtraTddChannels, OneFrequencyServesBothWaysAndIsAFifthOfTheNumber) {
  for (std::uint32_t uarfcn = 0; uarfcn < testing::sweepEnd; ++uarfcn) {
    for (const Carrier& carrier : utraTddCarriers(uarfcn)) {
      EXPECT_EQ(carrier.downlink.hertz, std::int64_t{uarfcn} * 200'000);
      EXPECT_EQ(carrier.uplink, carrier.downlink);
    }
  }
}

TEST(UtraTddChannels, ValuesTypedByHand) {
  constexpr std::array rows{
      TypedCarrier{10054, "TDD band a", 2010.8, 2010.8}, TypedCarrier{10121, "TDD band a", 2024.2, 2024.2},
      TypedCarrier{9404, "TDD band f", 1880.8, 1880.8},  TypedCarrier{9500, "TDD band f", 1900, 1900},
      TypedCarrier{11504, "TDD band e", 2300.8, 2300.8}, TypedCarrier{13096, "TDD band d", 2619.2, 2619.2},
  };
  testing::expectTyped(rows, utraTddCarriers);
}

TEST(UtraTddChannels, BandsThatOverlapAreAllNamed) {
  EXPECT_EQ(textOf(utraTddCarriers(9570)),
            "TDD band a 1914 MHz or TDD band c 1914 MHz or TDD band f 1914 MHz");
}

}  // namespace
}  // namespace kelvasi
