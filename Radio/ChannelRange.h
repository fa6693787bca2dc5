// SPDX-License-Identifier: Apache-2.0
// A row of a table of channel numbers.
#pragma once

#include <span>

#include "Radio/Carrier.h"

namespace kelvasi {

// Numbers from `first` to `last`, and the frequency of the first.
struct ChannelSpan {
  std::uint32_t first = 1;
  std::uint32_t last = 0;  // less than the first: there are none
  Frequency frequency = {};

  constexpr bool has(std::uint32_t number) const { return first <= number && number <= last; }
};

// The n-th number of the downlink belongs with the n-th of the uplink.
struct ChannelRange {
  Band band;
  ChannelSpan downlink;
  ChannelSpan uplink;
  Frequency raster;         // from one number to the next
  std::uint32_t every = 1;  // where only each so many is a channel
};

constexpr Frequency frequencyOf(const ChannelSpan& span, std::uint32_t place, Frequency raster) {
  return span.frequency + raster * place;
}

constexpr Carrier carrierAt(const ChannelRange& range, std::uint32_t place) {
  Carrier carrier{range.band, frequencyOf(range.downlink, place, range.raster), std::nullopt};
  if (range.uplink.has(range.uplink.first + place))
    carrier.uplink = frequencyOf(range.uplink, place, range.raster);
  return carrier;
}

// The carriers of a number that counts in `direction`, &ChannelRange::downlink or &ChannelRange::uplink.
constexpr Carriers carriersIn(std::span<const ChannelRange> table, std::uint32_t number,
                              ChannelSpan ChannelRange::*direction) {
  Carriers found;
  for (const ChannelRange& range : table) {
    const ChannelSpan& span = range.*direction;
    if (span.has(number) && (number - span.first) % range.every == 0)
      found.add(carrierAt(range, number - span.first));
  }
  return found;
}

}  // namespace kelvasi
