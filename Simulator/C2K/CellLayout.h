// SPDX-License-Identifier: Apache-2.0
// The base stations of a simulated town: every site sends one 1x and one EV-DO carrier with the same pilot.
#pragma once

#include <vector>

#include "Simulator/Radio/Cell.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::c2k {

// Carriers of band class 0, one next to the other (3GPP2 C.S0057).
inline constexpr std::uint8_t bandClass = 0;
inline constexpr std::uint16_t oneXChannel = 283;
inline constexpr std::uint16_t evdoChannel = 242;

struct System {
  std::uint16_t systemId = 0;
  std::uint16_t networkId = 0;
  std::uint8_t colorCode = 0;  // of its EV-DO subnet
  bool isHome = false;
};

// A cell's code is its PN offset, its id the base station's, its routing area the packet zone. PN offsets are
// unique. The home system lies in the west, another one in the east.
std::vector<Cell> layOutCells(Random random);

const System& systemOf(const Cell& cell);

}  // namespace kelvasi::sim::c2k
