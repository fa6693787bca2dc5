// The cells of a simulated town.
#pragma once

#include <array>
#include <vector>

#include "Simulator/GSM/Cell.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::gsm {

// Mobile country code 999 is kept free for networks of nobody (ITU-T E.212).
inline constexpr Plmn homePlmn{999, 1};
inline constexpr Plmn partnerPlmn{999, 2};

// Half the extent of the town, metres.
inline constexpr Point townEdge{2400, 1600};

// Sites on an irregular grid, every one with a GSM cell, most with a UMTS cell as well. Location areas lie
// from west to east, routing areas south and north; in the north-east corner is one that rejects the handset.
// Frequencies and codes are unique per technology.
std::vector<Cell> layOutCells(Random random);

// The ARFCNs that the dedicated channels of a GSM cell hop over; no other cell has them.
std::array<std::uint16_t, 3> hoppingFrequencies(const Cell& cell);

}  // namespace kelvasi::sim::gsm
