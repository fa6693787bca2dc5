// SPDX-License-Identifier: Apache-2.0
// The cells of the drive's world for the telephony daemon's list.
#pragma once

#include "Simulator/Daemon/CellList.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

// The serving cell and its neighbours, those of the other technology too.
CellList cellListOf(const World& world);

}  // namespace kelvasi::sim::gsm
