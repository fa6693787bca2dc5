// Scenario "drive" of LTE: a handset on its way through a town of three LTE carriers above UMTS and GSM, told
// by every record of the technology.
#pragma once

#include "Simulator/LTE/World.h"
#include "Simulator/RecordFeed.h"
#include "Simulator/Scenario.h"

namespace kelvasi::sim::lte {

class DriveScenario : public Scenario {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);

  WorldTime stepLength() const override { return std::chrono::milliseconds(200); }
  void step(Messages& messages) override;
  void greet(Messages& messages) override { feed_.all(now_, world_, messages); }

  const World& world() const { return world_; }

 private:
  World world_;
  RecordFeed<World> feed_;
  WorldTime now_{0};
};

}  // namespace kelvasi::sim::lte
