// SPDX-License-Identifier: Apache-2.0
// The town that every drive goes through: its extent, its sites, and the networks that have them.
#pragma once

#include "Simulator/Radio/Cell.h"
#include "Simulator/Random.h"

namespace kelvasi::sim {

// Mobile country code 999 is kept free for networks of nobody (ITU-T E.212).
inline constexpr Plmn homePlmn{999, 1};
inline constexpr Plmn partnerPlmn{999, 2};

// Half the extent of the town, metres.
inline constexpr Point townEdge{2400, 1600};

// Sites stand on an irregular grid.
inline constexpr int siteColumns = 6;
inline constexpr int siteRows = 4;
inline constexpr int siteCount = siteColumns * siteRows;

Point siteAt(int column, int row, Random& random);

}  // namespace kelvasi::sim
