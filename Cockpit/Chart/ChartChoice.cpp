// SPDX-License-Identifier: Apache-2.0
#include <algorithm>

#include "Cockpit/Chart/ChartLooks.h"
#include "Cockpit/Levels/LevelLooks.h"
#include "Cockpit/Serving/ServingLooks.h"

namespace kelvasi::cockpit {

namespace {

using survey::SeenCell;

struct Beside {
  std::uint32_t cell = 0;
  double level = 0;
};

// A row that names a part of a cell only is of the cell that was measured last.
const SeenCell* cellOf(const View& view, const CellIdentity& identity, const Quantity& quantity) {
  const SeenCell* newest = nullptr;
  for (const SeenCell& cell : view.survey.cells().all()) {
    if (!canBeSame(cell.identity, identity) || !cell.level(quantity)) continue;
    if (!newest || cell.level(quantity)->lastTime > newest->level(quantity)->lastTime) newest = &cell;
  }
  return newest;
}

// Those of the serving cell's family that are heard now, the best first.
std::vector<Beside> besides(const View& view, const SeenCell& serving, LevelKind kind, Arrival now) {
  std::vector<Beside> cells;
  for (const SeenCell& cell : view.survey.cells().all()) {
    if (&cell == &serving || cell.identity.family != serving.identity.family) continue;
    const auto level = latest(view, cell, kind);
    if (level && fadeOf(timeSince(level->time, now)) != Fade::gone)
      cells.push_back({cell.number, level->value});
  }
  std::ranges::sort(cells, std::ranges::greater(), &Beside::level);
  return cells;
}

}  // namespace

std::optional<ChartLineKey> chartLineOf(const View& view, std::string_view path) {
  const BookedRow* row = view.rows.find(path);
  const Quantity* quantity = row ? row->quantity() : nullptr;
  if (!quantity || !row->minimum) return std::nullopt;
  if (!row->cell || quantity->kind != QuantityKind::measurement) {
    if (view.rowSeries.whole({row->id, quantity}).count == 0) return std::nullopt;
    return ChartLineKey{.row = row->id};
  }
  const SeenCell* cell = cellOf(view, row->cell, *quantity);
  if (!cell) return std::nullopt;
  const auto kind = levelKindOf(row->cell.family, *quantity);
  return kind ? ChartLineKey{.cell = cell->number, .level = kind}
              : ChartLineKey{.cell = cell->number, .quantity = quantity};
}

std::vector<ChartLineKey> chartLinesOf(const View& view, Arrival now, std::optional<LevelKind> kind,
                                       std::size_t most) {
  std::vector<ChartLineKey> keys;
  const SeenCell* serving = servingCells(view.survey.cells(), now).first;
  if (!serving || most == 0) return keys;
  const auto kinds = levelsOf(serving->identity.family);
  if (!kind && kinds.empty()) return keys;
  const LevelKind chosen = kind ? *kind : kinds.front();
  keys.push_back({.cell = serving->number, .level = chosen});
  // What the receiver measures is no cell's.
  if (!receiverRow(serving->identity.family, chosen).empty()) return keys;
  for (const Beside& cell : besides(view, *serving, chosen, now)) {
    if (keys.size() == most) break;
    keys.push_back({.cell = cell.cell, .level = chosen});
  }
  return keys;
}

}  // namespace kelvasi::cockpit
