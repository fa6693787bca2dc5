// SPDX-License-Identifier: Apache-2.0
// Every number of a technology against the limits of its bands, which are typed from the standards' tables of
// operating bands and not from those of channel numbers.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <span>
#include <string_view>

#include "Radio/Channels.h"

namespace kelvasi::testing {

constexpr std::uint32_t sweepEnd = 1U << 18;

struct BandLimits {
  std::string_view name;
  double downlinkLow;  // MHz
  double downlinkHigh;
  double uplinkLow = 0;  // both 0: there is no uplink
  double uplinkHigh = 0;
  std::size_t channels = 0;  // how many numbers mean a carrier of this band
};

inline void expectWithin(const BandLimits& limits, const Carrier& carrier, std::uint32_t number) {
  EXPECT_GE(carrier.downlink.megahertz(), limits.downlinkLow) << limits.name << " " << number;
  EXPECT_LE(carrier.downlink.megahertz(), limits.downlinkHigh) << limits.name << " " << number;
  if (!carrier.uplink) return;
  EXPECT_GE(carrier.uplink->megahertz(), limits.uplinkLow) << limits.name << " " << number;
  EXPECT_LE(carrier.uplink->megahertz(), limits.uplinkHigh) << limits.name << " " << number;
}

// Each carrier lies in its band, no two numbers of a band are the same carrier, and each band has as many
// numbers as are stated and no band is left out or too many. Up to the 2^18th number, and for some at the end
// of 32 bits.
template <typename CarriersOf>
void expectEveryNumberWithin(std::span<const BandLimits> bands, const CarriersOf& carriersOf) {
  std::map<std::string_view, std::set<Frequency>> seen;
  for (std::uint32_t number = 0; number < sweepEnd; ++number) {
    for (const Carrier& carrier : carriersOf(number)) {
      const auto limits = std::ranges::find(bands, carrier.band.name, &BandLimits::name);
      ASSERT_NE(limits, bands.end()) << carrier.band.name;
      expectWithin(*limits, carrier, number);
      EXPECT_TRUE(seen[limits->name].insert(carrier.downlink).second) << limits->name << " " << number;
    }
  }
  for (const BandLimits& band : bands) EXPECT_EQ(seen[band.name].size(), band.channels) << band.name;
  for (std::uint32_t number = 0xFFFFFF00; number != 0; ++number) EXPECT_TRUE(carriersOf(number).empty());
}

// A row typed from a standard or a plan of frequencies: MHz of both ways, 0 for no uplink.
struct TypedCarrier {
  std::uint32_t number;
  std::string_view band;
  double downlink;
  double uplink;
};

inline bool isTyped(const Carrier& carrier, const TypedCarrier& typed) {
  return carrier.band.name == typed.band && carrier.downlink.megahertz() == typed.downlink &&
         (carrier.uplink ? carrier.uplink->megahertz() : 0) == typed.uplink;
}

// That each of the rows is among the carriers of its number.
template <typename CarriersOf>
void expectTyped(std::span<const TypedCarrier> rows, const CarriersOf& carriersOf) {
  for (const TypedCarrier& typed : rows) {
    EXPECT_TRUE(std::ranges::any_of(carriersOf(typed.number),
                                    [&](const Carrier& carrier) { return isTyped(carrier, typed); }))
        << typed.number << " " << typed.band << ": " << textOf(carriersOf(typed.number));
  }
}

}  // namespace kelvasi::testing
