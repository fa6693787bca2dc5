// SPDX-License-Identifier: Apache-2.0
// A live link as a scene of `top`.
#pragma once

#include <optional>
#include <string>

#include "Model/KelvasiModel.h"
#include "Platform/Clock.h"
#include "Tools/Kelvasictl/KeptStates.h"
#include "Tools/Top/Scene.h"

namespace kelvasi {

class LiveScene : public top::Scene {
 public:
  // Both outlive it.
  LiveScene(KelvasiModel& model, const Clock& clock, cockpit::TextStyle style);

  // After a display tick that saw new data.
  void update();
  // Every second.
  void pass();

  cockpit::Cockpit& cockpit() override { return cockpit_; }
  Arrival moment() const override { return held_ ? held_->time : now(); }
  cockpit::Snapshot face() override;
  NodeRef root() override { return held_ ? held_->root : root_; }
  std::vector<cockpit::EventLine> events(std::size_t most) const override;
  std::string status() const override;
  PlistValue saveContents() override { return model_.getSaveContents(); }
  std::string whyNoSave() const override;
  void pause() override;
  bool step(int by) override;
  void move(std::chrono::nanoseconds by) override;
  void goTo(Arrival moment) override;
  std::optional<top::Timeline> timeline(std::size_t) const override { return std::nullopt; }

 private:
  Arrival now() const { return arrivalAt(clock_.now()); }
  void tellLink();
  void hold(const KeptState& state);
  void goOn();

  KelvasiModel& model_;
  const Clock& clock_;
  cockpit::TextStyle style_;
  cockpit::Cockpit cockpit_;
  KeptStates states_;
  NodeRef root_;
  std::optional<Arrival> updated_;
  std::string technologyOfPanes_;
  std::optional<KeptState> held_;
};

}  // namespace kelvasi
