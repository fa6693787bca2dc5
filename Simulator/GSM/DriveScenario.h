// SPDX-License-Identifier: Apache-2.0
// Scenario "drive": a handset on its way through a town of GSM and UMTS cells, told by every record of the
// technology.
#pragma once

#include "Simulator/Drive.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

class DriveScenario : public Drive<World> {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);
};

}  // namespace kelvasi::sim::gsm
