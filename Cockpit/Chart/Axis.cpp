// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/Axis.h"

#include <array>
#include <cmath>

namespace kelvasi::cockpit {

namespace {

using namespace std::chrono_literals;

constexpr std::array<std::chrono::seconds, 23> timeSteps{1s,   2s,   5s,    10s,   15s,   20s,   30s, 1min,
                                                         2min, 5min, 10min, 15min, 20min, 30min, 1h,  2h,
                                                         3h,   4h,   6h,    8h,    12h,   24h,   48h};

double placeOf(double value, double least, double most) {
  return (value - least) / (most - least);
}

// How many multiples of the step lie in the range.
std::int64_t multiplesIn(double least, double most, double step) {
  return static_cast<std::int64_t>(std::floor(most / step)) -
         static_cast<std::int64_t>(std::ceil(least / step)) + 1;
}

int decimalsOf(double step) {
  int decimals = 0;
  for (; step < 0.999 && decimals < 6; step *= 10) ++decimals;
  return decimals;
}

}  // namespace

double roundStep(double least, double most, std::size_t ticks) {
  const double span = most - least;
  double power = std::pow(10, std::floor(std::log10(span)) - 1);
  for (;; power *= 10) {
    for (const double digit : {1.0, 2.0, 5.0}) {
      if (multiplesIn(least, most, digit * power) <= static_cast<std::int64_t>(ticks)) return digit * power;
    }
  }
}

std::vector<Tick> valueTicks(double least, double most, const TextStyle& style) {
  std::vector<Tick> ticks;
  if (!(most > least) || !std::isfinite(most - least)) return ticks;
  const double step = roundStep(least, most, mostTicks);
  const auto first = static_cast<std::int64_t>(std::ceil(least / step));
  for (std::int64_t at = 0; at < multiplesIn(least, most, step); ++at) {
    const double value = static_cast<double>(first + at) * step;
    ticks.push_back({placeOf(value, least, most), numberText(value, decimalsOf(step), style)});
  }
  return ticks;
}

std::vector<Tick> timeTicks(Arrival from, Arrival to, const TextStyle& style) {
  std::vector<Tick> ticks;
  if (to <= from) return ticks;
  const auto east = style.eastOfUtc ? style.eastOfUtc(from) : 0s;
  for (const auto step : timeSteps) {
    const Arrival stepTime = step;
    auto first = (from + east) / stepTime * stepTime;
    if (first < from + east) first += stepTime;
    if ((to + east - first) / stepTime + 1 > static_cast<std::int64_t>(mostTicks)) continue;
    for (Arrival at = first - east; at <= to; at += stepTime) {
      const double place =
          static_cast<double>((at - from).count()) / static_cast<double>((to - from).count());
      ticks.push_back({place, step < 1min ? clockText(at, style) : minuteText(at, style)});
    }
    return ticks;
  }
  return ticks;
}

}  // namespace kelvasi::cockpit
