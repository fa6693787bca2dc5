// SPDX-License-Identifier: Apache-2.0
// Round numbers and round times for axes: four labels at most.
#pragma once

#include <string>
#include <vector>

#include "Cockpit/Words/TextStyle.h"

namespace kelvasi::cockpit {

inline constexpr std::size_t mostTicks = 4;

struct Tick {
  double place = 0;  // 0 is the lower or earlier end of the axis, 1 the other
  std::string text;
};

// The least step of 1, 2 or 5 times a power of ten that has at most so many multiples from `least` to `most`.
double roundStep(double least, double most, std::size_t ticks);
// Steps of 1, 2 or 5 times a power of ten.
std::vector<Tick> valueTicks(double least, double most, const TextStyle& style);
// Steps of whole seconds, minutes or hours as clocks have them, by the local time.
std::vector<Tick> timeTicks(Arrival from, Arrival to, const TextStyle& style);

}  // namespace kelvasi::cockpit
