// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "LogGenerator/Reading.h"

namespace kelvasi::survey {

// Whether a reading is of an entry of a list, or of other cells than the serving one: not of the handset
// itself.
constexpr bool isOneOfSeveral(const Reading& reading) {
  const CellRole role = reading.section ? reading.section->role : CellRole::none;
  const bool isInList = reading.entry != Reading::notInList || reading.element != Reading::notInList;
  return isInList || role == CellRole::neighbour || role == CellRole::candidate;
}

}  // namespace kelvasi::survey
