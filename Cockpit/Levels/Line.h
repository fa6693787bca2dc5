// SPDX-License-Identifier: Apache-2.0
// The course of a value: what the stretches of a time come to, each with its minimum and maximum.
#pragma once

#include <vector>

#include "LogGenerator/Arrival.h"
#include "Survey/Series/Spread.h"

namespace kelvasi::cockpit {

struct Line {
  Arrival from{0};
  Arrival to{0};
  std::vector<survey::Spread> points;  // equal stretches of [from, to); a count of 0 is a gap

  bool isEmpty() const;
  bool operator==(const Line&) const = default;
};

// Where a line goes, by what the means of its halves say.
enum class Trend : std::uint8_t { unknown, rising, steady, falling };
std::string_view wordOf(Trend trend);  // "rising", "steady", "falling"; empty for unknown
// `margin`: what counts as steady, either way.
Trend trendOf(const Line& line, float margin = 2);

}  // namespace kelvasi::cockpit
