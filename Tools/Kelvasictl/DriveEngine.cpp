// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/DriveEngine.h"

#include <algorithm>
#include <utility>

#include "Tools/Kelvasictl/CockpitSetting.h"

namespace kelvasi {

DriveEngine::DriveEngine(const Surroundings& surroundings, CaptureInput::Choice choice,
                         const cockpit::TextStyle& style, CaptureInput::Tell tell)
    : surroundings_(surroundings),
      clock_(surroundings.clock),
      input_(std::move(choice), surroundings.plists, std::move(tell),
             [this](std::uint64_t, std::uint64_t bytes) { bytesRead_ += bytes; }),
      cockpit_(cockpitSetUp(style)) {}

bool DriveEngine::advance(Arrival moment, std::size_t most) {
  for (std::size_t taken = 0; taken < most; ++taken) {
    if (!pending_) pending_ = input_.next();
    isAtEnd_ = !pending_;
    if (isAtEnd_ || std::max(pending_->arrival, position_.value_or(pending_->arrival)) > moment) return true;
    take(*std::exchange(pending_, std::nullopt));
  }
  return false;
}

void DriveEngine::begin(std::string_view technology) {
  technology_ = technology;
  generator_ = LogGenerator::generatorFromTechnology(technology_, surroundings_.platformWith(clock_));
  generator_->gatherInto(&readings_);
  state_ = PlistDictionary::make();
  cockpit_.hear({.source = cockpit::LinkReport::Source::file, .technology = technology_});
}

void DriveEngine::take(const InputMessage& message) {
  if (!generator_ || technology_ != message.technology) begin(message.technology);
  if (const auto tick = schedule_.tickBefore(message.arrival)) generate(*tick);
  decode(message);
  cockpit_.take(readings_, generator_->intake());
  if (!begin_) begin_ = message.arrival;
  position_ = std::max(message.arrival, position_.value_or(message.arrival));
  ++messages_;
  root_.reset();
}

void DriveEngine::decode(const InputMessage& message) noexcept {
  clock_.set(message.arrival);
  generator_->setArrival(message.arrival);
  generator_->updateState(*state_, message.bytes);
}

void DriveEngine::generate(Arrival time) noexcept {
  clock_.set(time);
  display_ = generator_->generateLogUsingState(*state_);
}

NodeRef DriveEngine::root() {
  if (root_ || !generator_) return root_;
  generate(schedule_.lastTick().value_or(*position_));
  PathDictionary paths;
  root_ = KelvasiModelNode::makeTreeFromObject(display_, paths);
  return root_;
}

PlistValue DriveEngine::saveContents() const {
  return generator_ ? generator_->getSaveContentsFromState(*state_) : PlistValue();
}

}  // namespace kelvasi
