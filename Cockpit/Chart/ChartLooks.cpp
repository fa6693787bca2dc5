// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/ChartLooks.h"

#include <algorithm>
#include <cmath>

#include "Cockpit/Chart/ChartCursors.h"
#include "Cockpit/Chart/LineSource.h"

namespace kelvasi::cockpit {

namespace {

using survey::Spread;

constexpr std::size_t mostMarks = 200;

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
                             picture.placeOf(event.time), event.time, wordsOf(event)});
  }
  for (const MarkLine& mark : marks) {
    if (isIn(mark.time, picture))
      picture.marks.push_back({ChartMark::Kind::mark, picture.placeOf(mark.time), mark.time, mark.note});
  }
  std::ranges::stable_sort(picture.marks, {}, &ChartMark::time);
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
