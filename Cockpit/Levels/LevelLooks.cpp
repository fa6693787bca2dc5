// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Levels/LevelLooks.h"

#include <algorithm>

namespace kelvasi::cockpit {

namespace {

using survey::SeenCell;
using survey::Spread;

std::optional<LevelValue> latestOfReceiver(const View& view, std::string_view path) {
  const BookedRow* row = view.rows.find(path);
  if (!row || !row->isPresent) return std::nullopt;
  const auto number = row->number();
  if (!number) return std::nullopt;
  return LevelValue{*number, row->last};
}

Spread scaled(const Spread& spread, const ScaledSeries& series) {
  const auto scale = [&](float value) { return static_cast<float>(value * series.factor + series.offset); };
  return {scale(spread.minimum), scale(spread.maximum), scale(spread.mean), spread.count};
}

}  // namespace

std::optional<LevelValue> latest(const View& view, const SeenCell& cell, LevelKind kind) {
  const auto receiver = receiverRow(cell.identity.family, kind);
  if (!receiver.empty()) return latestOfReceiver(view, receiver);
  std::optional<LevelValue> newest;
  for (const LevelSource& source : definitionOf(kind).sources) {
    const survey::CellLevel* level = cell.level(*source.quantity);
    if (level && (!newest || level->lastTime > newest->time))
      newest = LevelValue{source.of(level->last), level->lastTime};
  }
  return newest;
}

std::vector<ScaledSeries> seriesOf(const View& view, const SeenCell& cell, LevelKind kind) {
  std::vector<ScaledSeries> series;
  const auto receiver = receiverRow(cell.identity.family, kind);
  if (!receiver.empty()) {
    if (const BookedRow* row = view.rows.find(receiver))
      series.push_back({&view.rowSeries, {row->id, &quantity::rxPower}});
    return series;
  }
  for (const LevelSource& source : definitionOf(kind).sources)
    series.push_back({view.survey.series(), {cell.number, source.quantity}, source.factor, source.offset});
  return series;
}

std::vector<Spread> pointsOf(const std::vector<ScaledSeries>& series, Arrival from, Arrival to,
                             std::size_t points) {
  std::vector<Spread> sum(points);
  std::vector<Spread> part(points);
  for (const ScaledSeries& each : series) {
    if (!each.store) continue;
    each.store->query(each.key, from, to, part);
    for (std::size_t at = 0; at < points; ++at) sum[at].add(scaled(part[at], each));
  }
  return sum;
}

// Whole seconds, so that points do not waver from look to look; the second at hand is the last.
Line lineOf(const View& view, const SeenCell& cell, LevelKind kind, Arrival now) {
  Line line;
  line.to = std::chrono::floor<std::chrono::seconds>(now) + std::chrono::seconds(1);
  line.from = line.to - lineLength;
  line.points =
      pointsOf(seriesOf(view, cell, kind), line.from, line.to, static_cast<std::size_t>(lineLength.count()));
  return line;
}

Level levelOf(const View& view, const SeenCell& cell, LevelKind kind, Arrival now, bool withLine) {
  const LevelDefinition& definition = definitionOf(kind);
  Level level;
  level.kind = kind;
  level.name = definition.name;
  level.unit = definition.unit;
  level.text = notReported;
  const auto newest = latest(view, cell, kind);
  if (!newest) return level;
  level.value = newest->value;
  level.text = numberText(newest->value, definition.decimals, view.style);
  level.verdict = view.thresholds.verdict(kind, newest->value);
  level.verdictWord = wordOf(level.verdict);
  level.age = ageOf(newest->time, now);
  if (!withLine) return level;
  level.line = lineOf(view, cell, kind, now);
  level.trend = trendOf(level.line);
  return level;
}

std::string valueText(LevelKind kind, double value, const TextStyle& style) {
  const LevelDefinition& definition = definitionOf(kind);
  return numberText(value, definition.decimals, style) + " " + std::string(definition.unit);
}

}  // namespace kelvasi::cockpit
