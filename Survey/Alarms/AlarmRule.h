// SPDX-License-Identifier: Apache-2.0
// What is worth an alarm, in one line:
//
//   rsrp < -115 for 10s             a value of the serving cell beyond a threshold: <, <=, >, >=
//   rsrp leaves -110..-60 for 5s    outside a band
//   rsrp absent for 30s             no value for so long
//   event reject                    something happened
//
// After that, in any order: "hysteresis 3", how far a value must come back before the alarm is over, and
// "every 5min", at most so often. Durations are in ms, s, min or h.
#pragma once

#include <chrono>
#include <cstddef>
#include <limits>
#include <string>
#include <string_view>
#include <variant>

#include "Radio/Quantity.h"
#include "Survey/Events/EventKind.h"

namespace kelvasi::survey {

// The values that are in order.
struct Band {
  double least = -std::numeric_limits<double>::infinity();
  double most = std::numeric_limits<double>::infinity();
  bool isOpen = false;  // least and most are out of order themselves

  constexpr bool holds(double value) const {
    return isOpen ? value > least && value < most : value >= least && value <= most;
  }
  constexpr Band narrowedBy(double margin) const { return {least + margin, most - margin, isOpen}; }
};

struct AlarmRule {
  enum class Kind { leavesBand, absent, event };

  std::string text;  // as it was written
  Kind kind = Kind::leavesBand;
  const Quantity* quantity = nullptr;       // of all but events
  EventKind event = EventKind::cellChange;  // of events
  Band band;                                // of leavesBand
  double hysteresis = 0;                    // in the quantity's unit
  std::chrono::nanoseconds holdsFor{0};     // how long it has to last before it is an alarm
  std::chrono::nanoseconds atMostEvery{0};  // between two alarms of the rule
};

struct AlarmRuleError {
  std::size_t position = 0;  // in the rule, from 0
  std::string expected;
  std::string found;  // empty at the end of the rule

  // "at 6: expected a number, found \"weak\""
  std::string text() const;
};

std::variant<AlarmRule, AlarmRuleError> parseAlarmRule(std::string_view text);

}  // namespace kelvasi::survey
