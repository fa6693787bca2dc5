// SPDX-License-Identifier: Apache-2.0
// Watches values and events for what its rules call an alarm. Time is pushed: with every value and event, and
// by pass() where nothing may come.
//
// A rule that has given an alarm gives the next one only after the value has come back by the hysteresis, or,
// for an absent value, after one has come; and not before its time for "every" is over. Alarms that are held
// back by that are counted in the next one.
#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

#include "Radio/CellIdentity.h"
#include "Survey/Alarms/AlarmRule.h"

namespace kelvasi::survey {

struct Alarm {
  const AlarmRule& rule;
  std::chrono::nanoseconds time{0};  // since 1 January 1970 UTC
  std::chrono::nanoseconds since{
      0};                       // when it began: the first value out of order, the last value before none
  std::optional<double> value;  // of a band's rule, in the quantity's unit
  CellIdentity cell;            // whose value or event it was; of the last value when there is none
  std::string_view event;       // what happened, in words
  std::uint64_t heldBack = 0;   // alarms of the rule since the last one that was given
};

class AlarmWatch {
 public:
  // What `give` gets lasts for the call.
  using Give = std::function<void(const Alarm& alarm)>;

  // A stretch without values that is longer than this, and than half of what has to last, ends it: nobody
  // knows what was in it.
  static constexpr std::chrono::seconds longestGap{5};

  AlarmWatch(std::vector<AlarmRule> rules, Give give);

  void value(const Quantity& quantity, std::chrono::nanoseconds time, double value, const CellIdentity& cell);
  void event(EventKind kind, std::chrono::nanoseconds time, std::string_view text, const CellIdentity& cell);
  void pass(std::chrono::nanoseconds time);

  std::uint64_t given() const { return given_; }

  // From now on these rules. What has begun under a rule of the same text goes on. Not to
  // be called while an alarm is given.
  void change(std::vector<AlarmRule> rules);
  std::size_t rules() const { return watched_.size(); }
  const AlarmRule& rule(std::size_t place) const { return watched_[place].rule; }
  // Whether it has given an alarm that is not over. Events are over at once.
  bool isRaised(std::size_t place) const { return watched_[place].isRaised; }

 private:
  struct Watched {
    AlarmRule rule;
    bool isRaised = false;
    std::optional<std::chrono::nanoseconds> begin;      // of what may become an alarm
    std::optional<std::chrono::nanoseconds> lastValue;  // or the first time heard of, before any value
    std::optional<std::chrono::nanoseconds> lastGiven;
    std::uint64_t heldBack = 0;
    CellIdentity cell;
  };

  void look(Watched& watched, std::chrono::nanoseconds time, double value);
  void lookForAbsence(Watched& watched, std::chrono::nanoseconds time);
  // Gives the alarm unless it comes too early.
  void raise(Watched& watched, Alarm alarm);

  std::vector<Watched> watched_;
  Give give_;
  std::uint64_t given_ = 0;
};

}  // namespace kelvasi::survey
