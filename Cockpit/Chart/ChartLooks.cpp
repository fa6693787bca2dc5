// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/ChartLooks.h"

#include <algorithm>
#include <cmath>

#include "Cockpit/Chart/LineSource.h"

namespace kelvasi::cockpit {

namespace {

using namespace std::chrono_literals;
using survey::Spread;

constexpr std::size_t mostMarks = 200;

double placeIn(Arrival time, const ChartPicture& picture) {
  return static_cast<double>((time - picture.from).count()) /
         static_cast<double>((picture.to - picture.from).count());
}

// What is newest in the picture.
std::string newestText(const LineSource& source, const std::vector<Spread>& points, const TextStyle& style) {
  const auto last =
      std::find_if(points.rbegin(), points.rend(), [](const Spread& each) { return each.count > 0; });
  return last == points.rend() ? std::string() : valueText(source, last->mean, style);
}

ChartLine lineOf(const View& view, const ChartLineKey& key, const LineSource& source,
                 const ChartPicture& picture, std::size_t columns) {
  ChartLine line;
  line.key = key;
  line.name = source.name;
  line.unit = source.unit;
  line.isServing = source.isServing;
  line.points = pointsOf(source.series, picture.from, picture.to, columns);
  line.newest = newestText(source, line.points, view.style);
  return line;
}

// From round number to round number around all values, at least so much that noise does not fill it.
void addValueAxis(ChartPicture& picture) {
  constexpr double leastSpan = 10;
  Spread all;
  for (const ChartLine& line : picture.lines) {
    for (const Spread& point : line.points) all.add(point);
  }
  if (all.count == 0) return;
  double least = all.minimum;
  double most = all.maximum;
  const double lack = leastSpan - (most - least);
  if (lack > 0) {
    least -= lack / 2;
    most += lack / 2;
  }
  const double step = roundStep(least, most, 2 * mostTicks);
  picture.least = std::floor(least / step) * step;
  picture.most = std::ceil(most / step) * step;
}

void addBands(ChartPicture& picture, const Thresholds& thresholds) {
  const auto kind = picture.lines.empty() ? std::nullopt : picture.lines.front().key.level;
  const bool isOne =
      std::ranges::all_of(picture.lines, [&](const ChartLine& line) { return line.key.level == kind; });
  if (!kind || !isOne || !thresholds.of(*kind)) return;
  double upper = 1;
  const auto add = [&](Verdict verdict, double lower) {
    const double from = std::clamp(lower, 0.0, 1.0);
    if (from < upper) picture.bands.push_back({verdict, from, upper});
    upper = std::min(upper, from);
  };
  auto verdict = static_cast<int>(Verdict::excellent);
  for (const double step : *thresholds.of(*kind))
    add(static_cast<Verdict>(verdict++), picture.heightOf(step));
  add(Verdict::veryPoor, 0);
}

bool isIn(Arrival time, const ChartPicture& picture) {
  return time >= picture.from && time < picture.to;
}

void addMarks(ChartPicture& picture, const View& view, std::span<const MarkLine> marks) {
  const auto& events = view.survey.events();
  for (std::size_t at = events.size(); at-- > 0 && picture.marks.size() < mostMarks;) {
    const survey::Event& event = events.at(at);
    if (!isIn(event.time, picture)) continue;
    const bool isChange = event.kind == survey::EventKind::cellChange;
    picture.marks.push_back({isChange ? ChartMark::Kind::cellChange : ChartMark::Kind::event,
                             placeIn(event.time, picture), event.time, wordsOf(event)});
  }
  for (const MarkLine& mark : marks) {
    if (isIn(mark.time, picture))
      picture.marks.push_back({ChartMark::Kind::mark, placeIn(mark.time, picture), mark.time, mark.note});
  }
  std::ranges::stable_sort(picture.marks, {}, &ChartMark::time);
}

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
  cursor.place = placeIn(time, picture);
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

std::string commonUnit(const std::vector<ChartLine>& lines) {
  if (lines.empty()) return {};
  const bool isOne =
      std::ranges::all_of(lines, [&](const ChartLine& line) { return line.unit == lines.front().unit; });
  return isOne ? lines.front().unit : std::string();
}

}  // namespace

ChartPicture pictureOf(const View& view, const Chart& chart, std::span<const MarkLine> marks, Arrival now,
                       std::size_t columns) {
  ChartPicture picture;
  picture.from = chart.beginAt(now);
  picture.to = chart.endAt(now);
  std::vector<LineSource> sources;
  for (const ChartLineKey& key : chart.lines()) {
    sources.push_back(sourceOf(view, key, now));
    picture.lines.push_back(lineOf(view, key, sources.back(), picture, columns));
  }
  picture.unit = commonUnit(picture.lines);
  addValueAxis(picture);
  picture.valueTicks = valueTicks(picture.least, picture.most, view.style);
  picture.timeTicks = timeTicks(picture.from, picture.to, view.style);
  addMarks(picture, view, marks);
  addBands(picture, view.thresholds);
  addCursors(picture, chart, sources, view.style);
  const bool isEmpty =
      std::ranges::all_of(picture.lines, [](const ChartLine& line) { return line.newest.empty(); });
  if (isEmpty) picture.why = picture.lines.empty() ? "No value chosen yet" : "No values in this time";
  return picture;
}

}  // namespace kelvasi::cockpit
