// SPDX-License-Identifier: Apache-2.0
// A drive decoded up to a moment: the display, and what the cockpit makes of it. It only goes forwards; who
// wants to go back begins anew.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Capture/CaptureInput.h"
#include "Cockpit/Cockpit.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Readings.h"
#include "Model/KelvasiModelNode.h"
#include "Platform/PushedClock.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/Kelvasictl/TickSchedule.h"

namespace kelvasi {

class DriveEngine {
 public:
  // `surroundings` outlives it.
  DriveEngine(const Surroundings& surroundings, CaptureInput::Choice choice, const cockpit::TextStyle& style,
              CaptureInput::Tell tell);

  // Takes the messages up to a moment, `most` of them; true when it stands there. A message whose stamp goes
  // back counts as coming with the one before it.
  bool advance(Arrival moment, std::size_t most);
  // Whether the last message is taken.
  bool isAtEnd() const { return isAtEnd_; }
  bool hasFault() const { return input_.hasFault(); }
  // Of the first message, and of the last one that is taken; nothing before there was one.
  std::optional<Arrival> begin() const { return begin_; }
  std::optional<Arrival> position() const { return position_; }
  // Of the message that comes next, where advance() has met it.
  std::optional<Arrival> upcoming() const {
    return pending_ ? std::optional(pending_->arrival) : std::nullopt;
  }
  std::uint64_t messages() const { return messages_; }
  std::uint64_t bytesRead() const { return bytesRead_; }

  cockpit::Cockpit& cockpit() { return cockpit_; }
  // The tree of the display as the tick after the last message would have it.
  NodeRef root();
  PlistValue saveContents() const;

 private:
  void begin(std::string_view technology);
  void take(const InputMessage& message);
  // An exception of a decoder ends the process.
  void decode(const InputMessage& message) noexcept;
  void generate(Arrival time) noexcept;

  const Surroundings& surroundings_;
  PushedClock clock_;
  CaptureInput input_;
  cockpit::Cockpit cockpit_;
  std::string technology_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
  Readings readings_;
  TickSchedule schedule_;
  std::optional<InputMessage> pending_;  // its bytes last until the next one is asked for
  std::optional<Arrival> begin_;
  std::optional<Arrival> position_;
  std::uint64_t messages_ = 0;
  std::uint64_t bytesRead_ = 0;
  bool isAtEnd_ = false;
  PlistValue display_;
  NodeRef root_;  // null: to be built
};

}  // namespace kelvasi
