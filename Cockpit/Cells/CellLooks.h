// SPDX-License-Identifier: Apache-2.0
// Makes the table of cells and that of carriers.
#pragma once

#include <vector>

#include "Cockpit/Cells/CellLine.h"
#include "Cockpit/Cells/CellOrder.h"
#include "Cockpit/Serving/ServingLooks.h"
#include "Cockpit/View.h"

namespace kelvasi::cockpit {

// How long a cell that is gone stays in sight.
inline constexpr std::chrono::seconds forgottenAge{60};

std::vector<CellLine> cellLines(const View& view, const ServingCells& serving, CellOrder& order,
                                std::size_t most, Arrival now);
std::vector<CarrierLine> carrierLines(const View& view, const ServingCells& serving, Arrival now);

}  // namespace kelvasi::cockpit
