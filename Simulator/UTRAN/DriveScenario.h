// Scenario "drive" of UTRAN: a handset on its way through a town of UTRA TDD and GSM cells, told by every
// record of the technology.
#pragma once

#include "Simulator/GSM/World.h"
#include "Simulator/RecordFeed.h"
#include "Simulator/Scenario.h"

namespace kelvasi::sim::utran {

class DriveScenario : public Scenario {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);

  WorldTime stepLength() const override { return std::chrono::milliseconds(200); }
  void step(Messages& messages) override;
  void greet(Messages& messages) override { feed_.all(now_, world_, messages); }

  const gsm::World& world() const { return world_; }

 private:
  gsm::World world_;
  RecordFeed<gsm::World> feed_;
  WorldTime now_{0};
};

}  // namespace kelvasi::sim::utran
