// SPDX-License-Identifier: Apache-2.0
// Scenario "drive" of the object-stream baseband: a handset's way through a town, told once a second by one
// property list that holds everything.
#pragma once

#include "Simulator/Handset/World.h"
#include "Simulator/Scenario.h"

namespace kelvasi::sim::objectStream {

class ObjectStreamScenario : public Scenario {
 public:
  // `plists` outlives the scenario.
  ObjectStreamScenario(std::uint64_t seed, const PlistSerialiser& plists)
      : world_(Random(seed)), plists_(plists) {}

  WorldTime stepLength() const override { return std::chrono::seconds(1); }
  void step(Messages& messages) override;
  void greet(Messages& messages) override;

  TrueCells truth() const override { return world_.truth(); }
  const gsm::World& world() const { return world_; }

 private:
  gsm::World world_;
  const PlistSerialiser& plists_;
  bool isBinaryNext_ = false;  // the two formats take turns
};

}  // namespace kelvasi::sim::objectStream
