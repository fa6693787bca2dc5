// Scenario "drive" of CDMA2000: a handset with 1x and EV-DO on its way through a town, told by every record
// of the technology.
#pragma once

#include "Simulator/C2K/World.h"
#include "Simulator/RecordFeed.h"
#include "Simulator/Scenario.h"

namespace kelvasi::sim::c2k {

class DriveScenario : public Scenario {
 public:
  // `plists` outlives the scenario.
  DriveScenario(std::uint64_t seed, const PlistSerialiser& plists);

  WorldTime stepLength() const override { return std::chrono::milliseconds(200); }
  void step(Messages& messages) override;
  void greet(Messages& messages) override { feed_.all(now_, world_, messages); }

  const World& world() const { return world_; }

 private:
  void sendFrames(Messages& messages) const;

  World world_;
  RecordFeed<World> feed_;
  WorldTime now_{0};
};

}  // namespace kelvasi::sim::c2k
