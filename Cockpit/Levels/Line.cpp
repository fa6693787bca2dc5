// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Levels/Line.h"

#include <algorithm>
#include <array>
#include <span>

namespace kelvasi::cockpit {

namespace {

survey::Spread sumOf(std::span<const survey::Spread> points) {
  survey::Spread sum;
  for (const survey::Spread& point : points) sum.add(point);
  return sum;
}

}  // namespace

bool Line::isEmpty() const {
  return std::ranges::all_of(points, [](const survey::Spread& point) { return point.count == 0; });
}

std::string_view wordOf(Trend trend) {
  constexpr std::array<std::string_view, 4> words{"", "rising", "steady", "falling"};
  return words[static_cast<std::size_t>(trend)];
}

Trend trendOf(const Line& line, float margin) {
  const std::span points(line.points);
  const auto earlier = sumOf(points.first(points.size() / 2));
  const auto later = sumOf(points.subspan(points.size() / 2));
  if (earlier.count == 0 || later.count == 0) return Trend::unknown;
  if (later.mean > earlier.mean + margin) return Trend::rising;
  return later.mean < earlier.mean - margin ? Trend::falling : Trend::steady;
}

}  // namespace kelvasi::cockpit
