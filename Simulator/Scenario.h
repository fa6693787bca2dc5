// SPDX-License-Identifier: Apache-2.0
// A simulated handset and its surroundings, moved on in steps. Equal seeds give equal messages.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>

#include "Platform/PlistSerialiser.h"
#include "Simulator/Message.h"
#include "Simulator/MessageSource.h"
#include "Simulator/Radio/TrueCell.h"

namespace kelvasi::sim {

class Scenario {
 public:
  virtual ~Scenario() = default;

  virtual WorldTime stepLength() const = 0;
  // Moves the world on by one step and appends the messages that the handset gives meanwhile.
  virtual void step(Messages& messages) = 0;
  // Appends one message of every kind that describes the present state.
  virtual void greet(Messages& messages) = 0;
  // The cells of the world as they are now; none where the scenario has no world of radio.
  virtual TrueCells truth() const { return {}; }
};

// Lets `time` pass, in whole steps, without a word of it.
inline void skip(Scenario& scenario, WorldTime time) {
  Messages untold;
  for (WorldTime now{0}; now < time; now += scenario.stepLength()) {
    scenario.step(untold);
    untold.clear();
  }
}

using ScenarioMaker = std::function<std::unique_ptr<Scenario>()>;

// Plays a scenario without end; a rewound one is made anew.
class ScenarioSource : public MessageSource {
 public:
  explicit ScenarioSource(ScenarioMaker maker) : maker_(std::move(maker)), scenario_(maker_()) {}

  std::optional<WorldTime> nextAt() const override { return now_ + scenario_->stepLength(); }
  void take(Messages& messages) override {
    now_ += scenario_->stepLength();
    scenario_->step(messages);
  }
  void greet(Messages& messages) override { scenario_->greet(messages); }
  void rewind() override {
    now_ = WorldTime(0);
    scenario_ = maker_();
  }

 private:
  ScenarioMaker maker_;
  std::unique_ptr<Scenario> scenario_;
  WorldTime now_{0};
};

}  // namespace kelvasi::sim
