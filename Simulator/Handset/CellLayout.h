// SPDX-License-Identifier: Apache-2.0
// The cells of a simulated town.
#pragma once

#include <array>
#include <vector>

#include "Simulator/Radio/Town.h"

namespace kelvasi::sim::gsm {

// The downlink UARFCN of a network's UMTS cells, in band I: 2117.6 MHz at home, 2132.6 MHz of the partner.
constexpr std::uint16_t umtsFrequencyOf(Plmn network) {
  return network == homePlmn ? 10588 : 10663;
}

// Sites on an irregular grid, every one with a GSM cell, most with a UMTS cell as well. Location areas lie
// from west to east, routing areas south and north; in the north-east corner is one that rejects the handset.
// The networks have a radio network controller and a UMTS carrier each. Codes are unique per technology.
std::vector<Cell> layOutCells(Random random);

// The ARFCNs that the dedicated channels of a GSM cell hop over; no other cell has them.
std::array<std::uint16_t, 3> hoppingFrequencies(const Cell& cell);

}  // namespace kelvasi::sim::gsm
