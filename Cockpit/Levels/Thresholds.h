// SPDX-License-Identifier: Apache-2.0
// How good a level is, in a word. The thresholds are the field's habit, no standard; a user may have others.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "Cockpit/Levels/LevelKind.h"

namespace kelvasi::cockpit {

enum class Verdict : std::uint8_t { none, excellent, good, fair, poor, veryPoor };

// "excellent", "very poor"; empty for none.
std::string_view wordOf(Verdict verdict);

class Thresholds {
 public:
  // The least of excellent, good, fair and poor, each below the one before.
  using Steps = std::array<double, 4>;

  Thresholds();  // those of habit

  // Nothing where there are none: for RSSI.
  const std::optional<Steps>& of(LevelKind kind) const { return steps_[static_cast<std::size_t>(kind)]; }
  Verdict verdict(LevelKind kind, double level) const;

  // A line of a table: "rsrp -80 -90 -100 -110". Returns what is wrong with it, and changes nothing then;
  // empty when it was taken.
  std::string change(std::string_view line);
  // All lines.
  std::string text() const;

 private:
  std::array<std::optional<Steps>, levelKinds> steps_;
};

}  // namespace kelvasi::cockpit
