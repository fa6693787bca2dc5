// SPDX-License-Identifier: Apache-2.0
// Scenario "drive" of LTE: a handset on its way through a town of three LTE carriers above UMTS and GSM, told
// by every record of the technology.
#pragma once

#include "Simulator/Drive.h"
#include "Simulator/LTE/World.h"

namespace kelvasi::sim::lte {

class DriveScenario : public Drive<World> {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);
};

}  // namespace kelvasi::sim::lte
