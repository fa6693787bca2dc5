// SPDX-License-Identifier: Apache-2.0
// The records of the LTE baseband. What a record has no room for is told as the nearest value that it can.
#pragma once

#include <optional>

#include "Simulator/Daemon/CellList.h"
#include "Simulator/LTE/World.h"

namespace kelvasi::sim::lte {

// Each is nothing while there is nothing to tell.
std::optional<Bytes> servingCellRecord(const World& world);             // 0xB0C2
std::optional<Bytes> transmitAntennasRecord(const World& world);        // 0xB0C1
std::optional<Bytes> servingCellMeasurementRecord(const World& world);  // 0xB17F, in idle mode
std::optional<Bytes> neighborMeasurementRecord(const World& world);     // 0xB180, in idle mode
// 0xB186, in idle mode. Never more than one candidate: a second one would stand in the bytes of the first.
std::optional<Bytes> reselectionCandidatesRecord(const World& world);
std::optional<Bytes> connectedModeMeasurementRecord(const World& world);  // 0xB179

// The same cells for the telephony daemon's list, and those of other layers.
CellList cellListOf(const World& world);

}  // namespace kelvasi::sim::lte
