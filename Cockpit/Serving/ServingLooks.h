// SPDX-License-Identifier: Apache-2.0
// Makes the cards of the serving cells.
#pragma once

#include <string>

#include "Cockpit/Serving/ServingCell.h"
#include "Cockpit/View.h"

namespace kelvasi::cockpit {

// The cell of the first card and, in CDMA, of the second: 1x before EV-DO. Null where there is none.
struct ServingCells {
  const survey::SeenCell* first = nullptr;
  const survey::SeenCell* second = nullptr;
};
ServingCells servingCells(const survey::Cells& cells, Arrival now);

ServingCell servingCellOf(const View& view, const survey::SeenCell& cell, Arrival now);
ServingCell noServingCell(std::string why);

}  // namespace kelvasi::cockpit
