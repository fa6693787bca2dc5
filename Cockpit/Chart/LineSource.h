// SPDX-License-Identifier: Apache-2.0
// What a line of a chart is made of.
#pragma once

#include <string>
#include <vector>

#include "Cockpit/Chart/ChartLine.h"
#include "Cockpit/Levels/LevelLooks.h"
#include "Cockpit/View.h"

namespace kelvasi::cockpit {

struct LineSource {
  std::vector<ScaledSeries> series;  // none: there is no such cell or row any more
  std::string name;
  std::string unit;
  int decimals = 0;
  bool isServing = false;
};

LineSource sourceOf(const View& view, const ChartLineKey& key, Arrival now);
// "-95 dBm"
std::string valueText(const LineSource& source, double value, const TextStyle& style);

}  // namespace kelvasi::cockpit
