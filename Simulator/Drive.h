// SPDX-License-Identifier: Apache-2.0
// A scenario that moves a world on and tells of it by a feed of records.
#pragma once

#include <utility>

#include "Simulator/RecordFeed.h"
#include "Simulator/Scenario.h"

namespace kelvasi::sim {

// The world passes time in seconds and says by its situation() whether several records have changed at once.
template <typename World>
class Drive : public Scenario {
 public:
  // `rules` and `plists` outlive the scenario.
  template <typename... OfWorld>
  Drive(std::span<const RecordRule<World>> rules, const PlistSerialiser& plists, OfWorld&&... ofWorld)
      : world_(std::forward<OfWorld>(ofWorld)...), feed_(rules, plists) {}

  WorldTime stepLength() const override { return std::chrono::milliseconds(200); }
  void step(Messages& messages) override {
    const auto before = world_.situation();
    now_ += stepLength();
    world_.pass(std::chrono::duration<double>(stepLength()).count());
    tellOfTheStep(messages);
    feed_.advance(now_, world_, world_.situation() != before, messages);
  }
  void greet(Messages& messages) override { feed_.all(now_, world_, messages); }

  TrueCells truth() const override { return world_.truth(); }
  const World& world() const { return world_; }

 protected:
  WorldTime now() const { return now_; }

 private:
  // What happened in the step and no record of the world as it is tells.
  virtual void tellOfTheStep(Messages&) const {}

  World world_;
  RecordFeed<World> feed_;
  WorldTime now_{0};
};

}  // namespace kelvasi::sim
