// SPDX-License-Identifier: Apache-2.0
// Scenario "mobility": a handset that registers, moves between areas, calls, transfers data and loses
// service, told by the mobility-management records alone.
#pragma once

#include <vector>

#include "Simulator/Daemon/CellList.h"
#include "Simulator/Handset/Registration.h"
#include "Simulator/RecordFeed.h"
#include "Simulator/Scenario.h"

namespace kelvasi::sim::gsm {

struct MobilityWorld {
  Registration registration;
  CellList cells;
};

class MobilityScenario : public Scenario {
 public:
  // `plists` outlives the scenario.
  MobilityScenario(std::uint64_t seed, const PlistSerialiser& plists);

  WorldTime stepLength() const override { return std::chrono::milliseconds(500); }
  void step(Messages& messages) override;
  void greet(Messages& messages) override { feed_.all(now_, world_, messages); }

  const MobilityWorld& world() const { return world_; }

 private:
  void wander(double seconds);
  bool mustMeasure() const;
  void measure();
  MeasuredCell measured(const Cell& cell, int weakest, int strongest);
  std::size_t firstNearby() const;
  std::size_t lastNearby() const;

  Random random_;
  std::vector<Cell> town_;
  MobilityWorld world_;
  RecordFeed<MobilityWorld> feed_;
  WorldTime now_{0};
  WorldTime measuredAt_{0};
  std::size_t place_ = 0;  // of the cell that covers the handset
  bool isCovered_ = true;
  double untilMove_ = 0;
};

}  // namespace kelvasi::sim::gsm
