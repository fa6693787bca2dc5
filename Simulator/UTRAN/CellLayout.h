// SPDX-License-Identifier: Apache-2.0
// The cells of the simulated town where UTRA is in TDD mode (3GPP TS 25.102), with the GSM cells of the same
// sites.
#pragma once

#include <vector>

#include "Simulator/Radio/Town.h"

namespace kelvasi::sim::utran {

// On three carriers of each network by turns. The cell parameters are unique.
std::vector<Cell> layOutCells(Random random);

}  // namespace kelvasi::sim::utran
