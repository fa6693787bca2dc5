// SPDX-License-Identifier: Apache-2.0
#include <algorithm>

#include "Cockpit/Chart/ChartLooks.h"
#include "Cockpit/Chart/LineSource.h"

namespace kelvasi::cockpit {

namespace {

using survey::Spread;

constexpr std::string_view lineEnd = "\r\n";
constexpr int csvDecimals = 3;

std::string quoted(const std::string& text) {
  if (text.find_first_of(",\"\r\n") == std::string::npos) return text;
  std::string result = "\"";
  for (const char character : text) {
    if (character == '"') result += '"';
    result += character;
  }
  return result + '"';
}

std::string header(const std::vector<LineSource>& sources) {
  std::string line = "time";
  for (const LineSource& source : sources) {
    const std::string unit = source.unit.empty() ? "" : " (" + source.unit + ")";
    for (const char* what : {" minimum", " mean", " maximum"})
      line += "," + quoted(source.name + what + unit);
  }
  return line;
}

std::string utcText(Arrival time) {
  std::string text = dateText(time);
  text[text.find(' ')] = 'T';
  return text + "Z";
}

void appendValues(std::string& csv, const Spread& point) {
  for (const float value : {point.minimum, point.mean, point.maximum}) {
    csv += ',';
    if (point.count > 0) csv += shortNumberText(static_cast<double>(value), csvDecimals);
  }
}

}  // namespace

std::string csvOf(const View& view, const Chart& chart, Arrival now) {
  const Arrival from = std::chrono::floor<std::chrono::seconds>(chart.beginAt(now));
  const auto seconds = std::chrono::ceil<std::chrono::seconds>(chart.endAt(now) - from);
  const auto count = static_cast<std::size_t>(seconds.count());
  std::vector<LineSource> sources;
  std::vector<std::vector<Spread>> points;
  for (const ChartLineKey& key : chart.lines()) {
    sources.push_back(sourceOf(view, key, now));
    points.push_back(pointsOf(sources.back().series, from, from + seconds, count));
  }
  std::string csv = header(sources);
  csv += lineEnd;
  for (std::size_t at = 0; at < count; ++at) {
    if (std::ranges::none_of(points, [&](const auto& line) { return line[at].count > 0; })) continue;
    csv += utcText(from + std::chrono::seconds(at));
    for (const auto& line : points) appendValues(csv, line[at]);
    csv += lineEnd;
  }
  return csv;
}

}  // namespace kelvasi::cockpit
