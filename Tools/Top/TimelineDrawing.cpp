// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/TimelineDrawing.h"

#include <algorithm>
#include <array>

namespace kelvasi::top {

namespace {

using survey::Spread;

constexpr std::array blocks{"\u2581", "\u2582", "\u2583", "\u2584", "\u2585", "\u2586", "\u2587", "\u2588"};
constexpr Style secondary{.role = Role::secondary};
constexpr Style accent{.role = Role::accent, .isBold = true};

int columnOf(const Timeline& timeline, Arrival time, int columns) {
  const auto length = static_cast<double>((timeline.to - timeline.from).count());
  if (length <= 0) return 0;
  const double place = static_cast<double>((time - timeline.from).count()) / length;
  return std::clamp(static_cast<int>(place * (columns - 1) + 0.5), 0, std::max(columns - 1, 0));
}

// What has been is brighter than what is to come.
TextLine ribbonLine(const Timeline& timeline, int columns) {
  double least = 1e9;
  double most = -1e9;
  for (const Spread& spread : timeline.ribbon) {
    if (spread.count == 0) continue;
    least = std::min<double>(least, spread.mean);
    most = std::max<double>(most, spread.mean);
  }
  TextLine line{.left = {{"", {.role = Role::accent}}, {"", {.role = Role::line}}}};
  const int here = columnOf(timeline, timeline.moment, columns);
  for (std::size_t at = 0; at < timeline.ribbon.size(); ++at) {
    const Spread& spread = timeline.ribbon[at];
    const double height = (spread.mean - least) / std::max(most - least, 8.0);
    line.left[static_cast<int>(at) <= here ? 0 : 1].text +=
        spread.count == 0 ? " " : blocks[static_cast<std::size_t>(std::clamp(height * 8, 0.0, 7.0))];
  }
  return line;
}

TextLine eventsLine(const Timeline& timeline, int columns) {
  std::vector<Piece> signs(static_cast<std::size_t>(std::max(columns, 0)),
                           Piece{"\u2500", {.role = Role::line}});
  const auto put = [&](Arrival time, Piece sign) {
    if (!signs.empty()) signs[static_cast<std::size_t>(columnOf(timeline, time, columns))] = std::move(sign);
  };
  for (const Arrival event : timeline.events) put(event, {"\u25CF", secondary});
  for (const Arrival mark : timeline.marks) put(mark, {"M", accent});
  put(timeline.moment, {"\u25B2", accent});
  return {.left = std::move(signs)};
}

TextLine timesLine(const Timeline& timeline, const cockpit::TextStyle& style) {
  TextLine line;
  line.left = {{cockpit::clockText(timeline.from, style) + "  ", secondary},
               {cockpit::dateText(timeline.moment, style), accent}};
  if (!timeline.level.empty()) line.left.push_back({"  " + timeline.level, secondary});
  if (!timeline.work.empty()) line.left.push_back({"  " + timeline.work});
  line.right = {{cockpit::clockText(timeline.to, style), secondary}};
  return line;
}

}  // namespace

Lines timelineLines(const Timeline& timeline, int columns, int rows, const cockpit::TextStyle& style,
                    const Look&) {
  if (rows < 3) return {timesLine(timeline, style)};
  return {ribbonLine(timeline, columns), eventsLine(timeline, columns), timesLine(timeline, style)};
}

Arrival momentAt(const Timeline& timeline, int column, int columns) {
  const double place = columns > 1 ? static_cast<double>(column) / (columns - 1) : 0;
  return timeline.from + std::chrono::nanoseconds(static_cast<std::int64_t>(
                             static_cast<double>((timeline.to - timeline.from).count()) * place));
}

}  // namespace kelvasi::top
