// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/LiveScene.h"

#include <utility>

#include "Tools/Kelvasictl/CockpitSetting.h"

namespace kelvasi {

LiveScene::LiveScene(KelvasiModel& model, const Clock& clock, cockpit::TextStyle style)
    : model_(model), clock_(clock), style_(style), cockpit_(cockpitSetUp(std::move(style))) {
  model_.gatherReadings(
      [this](const Readings& readings, const Intake& intake) { cockpit_.take(readings, intake); });
  tellLink();
}

void LiveScene::update() {
  root_ = model_.topLevelNodes();
  updated_ = now();
  if (!held_) tellLink();
  states_.keep(*updated_, root_, cockpit_.at(*updated_));
}

void LiveScene::pass() {
  if (!held_) tellLink();
  cockpit_.pass(now());
}

void LiveScene::tellLink() {
  if (!model_.showsAnotherTechnology()) technologyOfPanes_ = model_.technology();
  cockpit_.hear({.source = cockpit::LinkReport::Source::daemon,
                 .isConnected = model_.isConnected(),
                 .reason = model_.isConnected() ? "" : "the daemon has not answered",
                 .technology = model_.technology(),
                 .panes = model_.showsAnotherTechnology() ? technologyOfPanes_ : ""});
}

cockpit::Snapshot LiveScene::face() {
  if (!held_) return cockpit_.at(now());
  cockpit::Snapshot face = held_->face;
  cockpit::Snapshot present = cockpit_.at(held_->time);
  face.link = std::move(present.link);
  face.pins = std::move(present.pins);
  return face;
}

std::vector<cockpit::EventLine> LiveScene::events(std::size_t most) const {
  if (!held_) return cockpit_.events(most);
  std::vector<cockpit::EventLine> events = cockpit_.events(cockpit_.eventCount());
  std::erase_if(events, [this](const cockpit::EventLine& event) { return event.time > held_->time; });
  if (events.size() > most) events.resize(most);
  return events;
}

std::string LiveScene::status() const {
  if (held_) {
    const std::uint64_t newer = states_.newest().number - held_->number;
    return "PAUSED at " + cockpit::clockText(held_->time, style_) + ", " + std::to_string(newer) + " newer";
  }
  if (!model_.isConnected() || !updated_) return "Connecting...";
  std::string words = cockpit::dateText(*updated_, style_);
  return "Updated " + words.replace(words.find(' '), 1, " at ");
}

std::string LiveScene::whyNoSave() const {
  return held_ ? "Go on first (P): a snapshot holds what has come in until now" : "";
}

void LiveScene::hold(const KeptState& state) {
  held_ = state;
  cockpit_.hear({.source = cockpit::LinkReport::Source::held, .technology = technologyOfPanes_});
}

void LiveScene::goOn() {
  held_.reset();
  tellLink();
}

void LiveScene::pause() {
  if (held_) return goOn();
  if (!root_) return;
  states_.keep(now(), root_, cockpit_.at(now()));
  hold(states_.newest());
}

bool LiveScene::step(int by) {
  if (states_.isEmpty()) return false;
  if (!held_) {
    if (by < 0) hold(states_.newest());
    return by < 0;
  }
  if (by > 0 && held_->number == states_.newest().number) {
    goOn();
    return true;
  }
  const std::uint64_t wanted = by < 0 ? held_->number - 1 : held_->number + 1;
  const KeptState* const state = held_->number == 0 && by < 0 ? nullptr : states_.find(wanted);
  if (state) hold(*state);
  return state != nullptr;
}

void LiveScene::move(std::chrono::nanoseconds by) {
  goTo(moment() + by);
}

void LiveScene::goTo(Arrival moment) {
  const KeptState* const state = states_.at(moment);
  if (!state || moment >= now()) return goOn();
  hold(*state);
}

}  // namespace kelvasi
