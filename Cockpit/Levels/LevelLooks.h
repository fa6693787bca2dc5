// SPDX-License-Identifier: Apache-2.0
// Finds the levels of a cell in what was surveyed.
#pragma once

#include <optional>
#include <vector>

#include "Cockpit/Levels/Level.h"
#include "Cockpit/View.h"

namespace kelvasi::cockpit {

// The newest value, whichever of the level's sources it came by.
struct LevelValue {
  double value = 0;
  Arrival time{0};
};

inline constexpr std::chrono::seconds lineLength{60};

std::optional<LevelValue> latest(const View& view, const survey::SeenCell& cell, LevelKind kind);

// A series and what makes a level of its values.
struct ScaledSeries {
  const survey::SeriesStore* store = nullptr;
  survey::SeriesKey key;
  double factor = 1;
  double offset = 0;
};
std::vector<ScaledSeries> seriesOf(const View& view, const survey::SeenCell& cell, LevelKind kind);
// All of them in one line.
std::vector<survey::Spread> pointsOf(const std::vector<ScaledSeries>& series, Arrival from, Arrival to,
                                     std::size_t points);

Line lineOf(const View& view, const survey::SeenCell& cell, LevelKind kind, Arrival now);
Level levelOf(const View& view, const survey::SeenCell& cell, LevelKind kind, Arrival now,
              bool withLine = true);
// The number and its unit, "-95 dBm", as large figures have it.
std::string valueText(LevelKind kind, double value, const TextStyle& style);

}  // namespace kelvasi::cockpit
