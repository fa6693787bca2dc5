// SPDX-License-Identifier: Apache-2.0
// A scenario whose world is told at every step.
#pragma once

#include <functional>
#include <memory>

#include "Simulator/Scenario.h"

namespace kelvasi::sim {

class ToldScenario : public Scenario {
 public:
  // Gets the cells after each step, before the step's messages are sent.
  using Tell = std::function<void(const TrueCells& cells)>;

  ToldScenario(std::unique_ptr<Scenario> inner, Tell tell)
      : inner_(std::move(inner)), tell_(std::move(tell)) {}

  WorldTime stepLength() const override { return inner_->stepLength(); }
  void step(Messages& messages) override {
    inner_->step(messages);
    tell_(inner_->truth());
  }
  void greet(Messages& messages) override { inner_->greet(messages); }
  TrueCells truth() const override { return inner_->truth(); }

 private:
  std::unique_ptr<Scenario> inner_;
  Tell tell_;
};

}  // namespace kelvasi::sim
