// SPDX-License-Identifier: Apache-2.0
// Scenario "drive" of CDMA2000: a handset with 1x and EV-DO on its way through a town, told by every record
// of the technology.
#pragma once

#include "Simulator/C2K/World.h"
#include "Simulator/Drive.h"

namespace kelvasi::sim::c2k {

class DriveScenario : public Drive<World> {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);

 private:
  // The frames of the step, of which a record each tells.
  void tellOfTheStep(Messages& messages) const override;
};

}  // namespace kelvasi::sim::c2k
