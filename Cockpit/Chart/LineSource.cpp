// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/LineSource.h"

#include <algorithm>

#include "Cockpit/Rows/QuantityWords.h"
#include "Cockpit/Rows/RowPath.h"
#include "Cockpit/Serving/CellWords.h"
#include "Cockpit/Serving/ServingLooks.h"

namespace kelvasi::cockpit {

namespace {

using survey::SeenCell;

constexpr int rowDecimals = 2;

void nameLevel(LineSource& source, const SeenCell& cell, LevelKind kind) {
  const LevelDefinition& definition = definitionOf(kind);
  source.name = cellName(cell.identity) + " " + std::string(definition.name);
  source.unit = definition.unit;
  source.decimals = definition.decimals;
}

LineSource sourceOfCell(const View& view, const SeenCell& cell, const ChartLineKey& key, Arrival now) {
  LineSource source;
  const ServingCells serving = servingCells(view.survey.cells(), now);
  source.isServing = serving.first == &cell || serving.second == &cell;
  if (key.level) {
    nameLevel(source, cell, *key.level);
    source.series = seriesOf(view, cell, *key.level);
  } else if (key.quantity) {
    source.name = cellName(cell.identity) + " " + std::string(wordsOf(*key.quantity).name);
    source.unit = key.quantity->unit;
    source.decimals = rowDecimals;
    source.series = {{view.survey.series(), {cell.number, key.quantity}}};
  }
  return source;
}

LineSource sourceOfRow(const View& view, std::uint32_t id) {
  LineSource source;
  const auto& rows = view.rows.all();
  const auto row = std::ranges::find_if(rows, [&](const auto& each) { return each.second.id == id; });
  if (row == rows.end()) return source;
  source.name = rowNameOf(row->first);
  source.decimals = rowDecimals;
  const Quantity* quantity = row->second.quantity();
  if (!quantity) return source;
  source.unit = quantity->unit;
  source.series = {{&view.rowSeries, {id, quantity}}};
  return source;
}

}  // namespace

LineSource sourceOf(const View& view, const ChartLineKey& key, Arrival now) {
  if (key.row != 0) return sourceOfRow(view, key.row);
  const SeenCell* cell = view.survey.cells().find(key.cell);
  return cell ? sourceOfCell(view, *cell, key, now) : LineSource();
}

std::string valueText(const LineSource& source, double value, const TextStyle& style) {
  std::string text = source.decimals == rowDecimals ? shortNumberText(value, rowDecimals, style)
                                                    : numberText(value, source.decimals, style);
  if (!source.unit.empty()) text += " " + source.unit;
  return text;
}

}  // namespace kelvasi::cockpit
