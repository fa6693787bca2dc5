// SPDX-License-Identifier: Apache-2.0
// A level as it is shown: number, unit, verdict, age and course.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "Cockpit/Levels/Line.h"
#include "Cockpit/Levels/Thresholds.h"
#include "Cockpit/Words/Age.h"

namespace kelvasi::cockpit {

inline constexpr std::string_view notReported = "not reported";

struct Level {
  LevelKind kind = LevelKind::rsrp;
  std::string_view name;        // "RSRP"
  std::string_view unit;        // "dBm"
  std::optional<double> value;  // nothing: not reported
  std::string text;             // for a large figure, "-95", without the unit; or "not reported"
  Verdict verdict = Verdict::none;
  std::string_view verdictWord;
  Age age;
  Line line;  // the last 60 s
  Trend trend = Trend::unknown;

  bool isReported() const { return value.has_value(); }
};

}  // namespace kelvasi::cockpit
