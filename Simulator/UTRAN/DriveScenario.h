// SPDX-License-Identifier: Apache-2.0
// Scenario "drive" of UTRAN: a handset on its way through a town of UTRA TDD and GSM cells, told by every
// record of the technology.
#pragma once

#include "Simulator/Drive.h"
#include "Simulator/Handset/World.h"

namespace kelvasi::sim::utran {

class DriveScenario : public Drive<gsm::World> {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);
};

}  // namespace kelvasi::sim::utran
