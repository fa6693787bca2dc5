// SPDX-License-Identifier: Apache-2.0
// Finds what happens in a stream of readings. Time is pushed: with every message, and by pass() where none
// may come.
#pragma once

#include <array>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>

#include "LogGenerator/Intake.h"
#include "LogGenerator/Readings.h"
#include "Survey/Cells/SeenCell.h"
#include "Survey/Events/Event.h"

namespace kelvasi::survey {

class EventFinder {
 public:
  using OnEvent = std::function<void(const Event& event)>;

  // Without a message for so long the link counts as lost; without a word of the serving cell, and where no
  // record says the kind of service, the service.
  static constexpr std::chrono::seconds silence{15};

  explicit EventFinder(OnEvent onEvent) : onEvent_(std::move(onEvent)) {}

  // The time without a message.
  void pass(Arrival time);
  // A message has arrived; to be called before all that it says.
  void arrive(Arrival time);
  // The states in a message.
  void take(const Readings& readings);
  // A change of the serving cell; `from` null for the first one.
  void serve(const SeenCell* from, const SeenCell& to, Arrival time);
  // A message speaks of the serving cell.
  void hearServing(const CellIdentity& cell, Arrival time);
  // New codes that no decoder understands.
  void take(const Intake& intake);
  // The connection to the daemon went; the next message brings it back.
  void lose(Arrival time, std::string reason);

 private:
  struct State {
    std::int64_t raw = 0;
    bool isKnown = false;
    std::string text;
  };
  static constexpr std::size_t watchedStates = 13;

  void regain(Arrival time);
  void follow(const Reading& reading, Arrival time);
  void followService(std::int64_t raw, const std::string& text, Arrival time);
  void setService(bool isThere, Arrival time, std::string reason);
  void camp(const CellIdentity& cell);
  // The serving cell of one of two air interfaces, or the one named last.
  const CellIdentity& cellOf(RadioFamily airInterface) const;
  void give(Event event);

  OnEvent onEvent_;
  CellIdentity cell_;  // the serving one that was named last
  CellIdentity oneXCell_;
  CellIdentity evdoCell_;
  std::array<State, watchedStates> states_;
  std::optional<bool> hasService_;
  bool saysService_ = false;  // a record says the kind of service
  std::optional<Arrival> lastMessage_;
  std::optional<Arrival> lastServing_;
  std::optional<Arrival> lostAt_;  // the link
  std::size_t countsSeen_ = 0;
};

}  // namespace kelvasi::survey
