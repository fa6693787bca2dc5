// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Signs.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace kelvasi::top {

namespace {

using cockpit::Fade;
using cockpit::LinkState;
using cockpit::Trend;
using cockpit::Verdict;
using survey::Spread;

constexpr std::array blocks{"\u2581", "\u2582", "\u2583", "\u2584", "\u2585", "\u2586", "\u2587", "\u2588"};
constexpr double grain = 4;

struct Scale {
  double least;
  double most;
};

Scale scaleOf(const std::vector<Spread>& spreads) {
  double least = 1e9;
  double most = -1e9;
  for (const Spread& spread : spreads) {
    if (spread.count == 0) continue;
    least = std::min<double>(least, spread.mean);
    most = std::max<double>(most, spread.mean);
  }
  least = std::floor(least / grain) * grain;
  return {least, std::max(least + 2 * grain, std::ceil(most / grain) * grain)};
}

const char* blockOf(const Spread& spread, const Scale& scale) {
  if (spread.count == 0) return " ";
  const double height = (spread.mean - scale.least) / (scale.most - scale.least);
  return blocks[static_cast<std::size_t>(std::clamp(std::floor(height * 8), 0.0, 7.0))];
}

}  // namespace

Piece signOf(Verdict verdict) {
  switch (verdict) {
    case Verdict::excellent:
      return {"\u25A0", {.role = Role::good}};
    case Verdict::good:
      return {"\u25CF", {.role = Role::good}};
    case Verdict::fair:
      return {"\u25B2", {.role = Role::fair}};
    case Verdict::poor:
      return {"\u25C6", {.role = Role::poor}};
    case Verdict::veryPoor:
      return {"\u25BC", {.role = Role::poor}};
    case Verdict::none:
      break;
  }
  return {" "};
}

Piece signOf(LinkState state) {
  switch (state) {
    case LinkState::live:
      return {"\u25CF", {.role = Role::good}};
    case LinkState::late:
      return {"\u25D0", {.role = Role::fair}};
    case LinkState::held:
    case LinkState::file:
      return {"\u25A1", {.role = Role::accent}};
    default:
      return {"\u25CB", {.role = Role::poor}};
  }
}

std::string arrowOf(Trend trend) {
  return trend == Trend::rising ? "\u2197" : trend == Trend::falling ? "\u2198" : "";
}

Role roleOf(Fade fade) {
  return fade == Fade::none ? Role::text : fade == Fade::faded ? Role::secondary : Role::stale;
}

std::string courseOf(const cockpit::Line& line, int columns) {
  const auto seconds = static_cast<std::int64_t>(line.points.size());
  if (columns <= 0 || seconds == 0) return std::string(static_cast<std::size_t>(std::max(columns, 0)), ' ');
  const std::int64_t step = (seconds + columns - 1) / columns;
  const std::int64_t first = std::chrono::floor<std::chrono::seconds>(line.from).count();
  const std::int64_t lastColumn = (first + seconds - 1) / step;
  std::vector<Spread> spreads(static_cast<std::size_t>(columns));
  for (std::int64_t at = 0; at < seconds; ++at) {
    const std::int64_t column = (first + at) / step - lastColumn + columns - 1;
    if (column >= 0) spreads[static_cast<std::size_t>(column)].add(line.points[static_cast<std::size_t>(at)]);
  }
  const Scale scale = scaleOf(spreads);
  std::string course;
  for (const Spread& spread : spreads) course += blockOf(spread, scale);
  return course;
}

}  // namespace kelvasi::top
