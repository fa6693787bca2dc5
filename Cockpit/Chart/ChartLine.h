// SPDX-License-Identifier: Apache-2.0
// What a chart can draw: a level of a cell, or a row of the display.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "Cockpit/Levels/LevelKind.h"
#include "Radio/CellIdentity.h"
#include "Survey/Series/Spread.h"

namespace kelvasi::cockpit {

// Which values a line follows.
struct ChartLineKey {
  std::uint32_t cell = 0;               // the survey's number of a cell
  std::optional<LevelKind> level = {};  // of the cell
  const Quantity* quantity = nullptr;   // of the cell, where it is no level
  std::uint32_t row = 0;                // the number of a row that is of no cell

  auto operator<=>(const ChartLineKey&) const = default;
};

struct ChartLine {
  ChartLineKey key;
  std::string name;  // "PCI 404 RSRP", "Transmit Power"
  std::string unit;
  bool isServing = false;
  std::vector<survey::Spread> points;  // one a column; a count of 0 is a gap
  std::string newest;  // the newest value in words, "-95 dBm"; empty without one in the window
};

}  // namespace kelvasi::cockpit
