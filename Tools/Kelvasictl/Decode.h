// SPDX-License-Identifier: Apache-2.0
// Captures through a generator, with the display ticks that the viewer would have had.
#pragma once

#include <functional>
#include <memory>

#include "Capture/CaptureReader.h"
#include "LogGenerator/LogGenerator.h"
#include "Platform/PushedClock.h"
#include "Tools/Kelvasictl/TickSchedule.h"

namespace kelvasi {

class Decode {
 public:
  // Called after each tick with its time, since 1970, and its display, which lasts for the call.
  using TickHandler = std::function<void(TickSchedule::Time time, const PlistValue& display)>;

  // `clock`, the generator's, follows the messages and the ticks.
  Decode(std::unique_ptr<LogGenerator> generator, PushedClock& clock, TickHandler onTick)
      : generator_(std::move(generator)), clock_(clock), onTick_(std::move(onTick)) {}

  // The next message. An exception of the generator ends the process.
  void take(const CapturedMessage& message);
  // The tick after the last message; none when there was no message.
  void finish();

  // The display of the last tick; absent before.
  const PlistValue& display() const { return display_; }
  const Intake& intake() const { return generator_->intake(); }
  PlistValue saveContents() const { return generator_->getSaveContentsFromState(*state_); }

 private:
  void update(const CapturedMessage& message) noexcept {
    generator_->setArrival(message.arrival);
    generator_->updateState(*state_, message.bytes);
  }
  PlistValue generate() noexcept { return generator_->generateLogUsingState(*state_); }
  void tick(TickSchedule::Time time);

  std::unique_ptr<LogGenerator> generator_;
  PushedClock& clock_;
  TickHandler onTick_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
  TickSchedule schedule_;
  PlistValue display_;
};

}  // namespace kelvasi
