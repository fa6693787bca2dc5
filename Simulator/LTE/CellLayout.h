// SPDX-License-Identifier: Apache-2.0
// The LTE cells of the simulated town, with the GSM and UMTS cells of the same sites.
#pragma once

#include <vector>

#include "Simulator/Radio/Town.h"

namespace kelvasi::sim::lte {

// Tracking areas lie as the location areas do. Physical cell identities are unique.
std::vector<Cell> layOutCells(Random random);

}  // namespace kelvasi::sim::lte
