// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/UTRAN/UTRANSamples.h"

#include "LogGenerator/UTRAN/ChannelMeasurement.h"
#include "LogGenerator/UTRAN/GSMNeighborCells.h"
#include "LogGenerator/UTRAN/NeighborCells.h"
#include "LogGenerator/UTRAN/RRCState.h"
#include "LogGenerator/UTRAN/ServingCell.h"

namespace kelvasi::bench {

using namespace utran;

std::span<const Sample> utranSamples() {
  static constexpr std::array samples{
      Sample{"0xD0E2 serving cell", servingCell::logCode, servingCell::minimumLength, servingCell::layout},
      Sample{.name = "0xD0E0 RRC state",
             .logCode = utran::rrcState::logCode,
             .length = utran::rrcState::expectedLength,
             .layout = utran::rrcState::layout,
             .below = 6,
             .fixed = {{{"layout version", utran::rrcState::knownVersion}}}},
      Sample{.name = "0xD00A 8 UTRAN cells",
             .logCode = neighborCells::logCode,
             .length = neighborCells::minimumLength,
             .layout = neighborCells::layout,
             .lists = {{{neighborCells::cells, 8}}}},
      Sample{.name = "0xD00E 8 GSM cells",
             .logCode = gsmNeighborCells::logCode,
             .length = gsmNeighborCells::minimumLength,
             .layout = gsmNeighborCells::layout,
             .lists = {{{gsmNeighborCells::cells, 8}}}},
      Sample{.name = "0xD00C 4 transport, 2 composite",
             .logCode = channelMeasurement::logCode,
             .length = channelMeasurement::minimumLength,
             .layout = channelMeasurement::layout,
             .lists = {{{channelMeasurement::transportChannels, 4},
                        {channelMeasurement::compositeChannels, 2}}}},
  };
  return samples;
}

}  // namespace kelvasi::bench
