// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/ChartCursors.h"

#include <algorithm>

namespace kelvasi::cockpit {

namespace {

using namespace std::chrono_literals;
using survey::Spread;

// The second that the moment is in; where nothing came in it, the newest that counts as live.
std::optional<double> valueAt(const LineSource& source, Arrival time) {
  const Arrival second = std::chrono::floor<std::chrono::seconds>(time);
  const auto now = pointsOf(source.series, second, second + 1s, 1);
  if (now.front().count > 0) return now.front().mean;
  const auto before = pointsOf(source.series, second - 3s, second, 3);
  const auto last =
      std::find_if(before.rbegin(), before.rend(), [](const Spread& each) { return each.count > 0; });
  return last == before.rend() ? std::nullopt : std::optional<double>(last->mean);
}

ChartCursor cursorAt(Arrival time, const std::vector<LineSource>& sources, const ChartPicture& picture,
                     const TextStyle& style) {
  ChartCursor cursor;
  cursor.time = time;
  cursor.place = picture.placeOf(time);
  cursor.timeText = clockText(time, style);
  for (const LineSource& source : sources) {
    const auto value = valueAt(source, time);
    cursor.values.push_back({value ? valueText(source, *value, style) : "no value", value});
  }
  return cursor;
}

std::string betweenText(Arrival time) {
  const auto seconds = std::chrono::round<std::chrono::seconds>(std::chrono::abs(time)).count();
  if (seconds < 60) return std::to_string(seconds) + " s";
  const std::string rest = seconds % 60 == 0 ? "" : " " + std::to_string(seconds % 60) + " s";
  if (seconds < 3600) return std::to_string(seconds / 60) + " min" + rest;
  return std::to_string(seconds / 3600) + " h " + std::to_string(seconds / 60 % 60) + " min" + rest;
}

}  // namespace

void addCursors(ChartPicture& picture, const Chart& chart, const std::vector<LineSource>& sources,
                const TextStyle& style) {
  for (const auto& time : chart.cursors()) {
    if (time) picture.cursors.push_back(cursorAt(*time, sources, picture, style));
  }
  if (picture.cursors.size() < 2) return;
  const auto& [first, second] = std::pair(picture.cursors[0], picture.cursors[1]);
  picture.cursorTime = betweenText(second.time - first.time);
  for (std::size_t line = 0; line < sources.size(); ++line) {
    std::string text;
    if (first.values[line].value && second.values[line].value) {
      const double difference = *second.values[line].value - *first.values[line].value;
      text = valueText(sources[line], difference, style);
      if (difference > 0) text.insert(0, 1, '+');
    }
    picture.differences.push_back(std::move(text));
  }
}

}  // namespace kelvasi::cockpit
