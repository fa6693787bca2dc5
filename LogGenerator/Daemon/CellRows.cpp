// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Daemon/CellRows.h"

#include <algorithm>

#include "Platform/SystemLog.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

bool CellTable::takes(const PlistValue& cell) const {
  return cell.dictionary() && std::ranges::any_of(technologies, [&](std::string_view technology) {
           return isCell(*cell.dictionary(), technology, type);
         });
}

void CellTable::describe(std::string_view section, RowCatalog& catalog) const {
  for (const CellRow& each : rows) {
    catalog.add({.section = std::string(section),
                 .key = std::string(each.row.key),
                 .logCode = cellInfoLogCode,
                 .row = &each.row,
                 .source = std::string(each.cellKey),
                 .cells = this});
  }
}

ServingCells::Word CellTable::identityOf(const PlistDictionary& cell) const {
  const auto number = [&](std::string_view key) {
    const auto stated = key.empty() ? std::nullopt : cellNumber(cell, key);
    return stated && *stated >= 0 ? std::int64_t{*stated} : CellIdentity::unknown;
  };
  const auto cellId = cellNumber(cell, kTelvonCellMonitorCellId);
  return {.cell = {keys.family, number(keys.channel), number(keys.code)},
          .cellId = cellId ? std::optional<std::int64_t>(*cellId) : std::nullopt};
}

void showCell(const PlistDictionary& cell, const CellTable& table, RowWriter& writer, SystemLog& log) {
  for (const auto& [row, cellKey, failure] : table.rows) {
    if (const auto number = cellNumber(cell, cellKey)) {
      writer.write(row, *number);
    } else if (!failure.empty()) {
      log.write(LogPriority::error, failure);
    }
  }
  Readings* const readings = writer.readings();
  if (!readings || table.keys.family == RadioFamily::none) return;
  const ServingCells::Word word = table.identityOf(cell);
  const bool isServing = table.type == kTelvonCellMonitorCellTypeServing;
  if (isServing) readings->servingCells().say(cellInfoLogCode, word);
  writer.identify(word.cell);
}

const PlistArray* cellsOf(const CellInfoArray& cellInfo, SystemLog& log) {
  if (cellInfo.holdsNothing()) log.write(LogPriority::error, "Failed to get Cell Array\n");
  return cellInfo.cells();
}

bool showFirstCell(const Platform& platform, RecordView record, const CellTable& table,
                   PlistDictionary& section, const ReadingPlace& place) {
  const CellInfoArray cellInfo(platform, record.payload());
  const PlistArray* cells = cellsOf(cellInfo, platform.log);
  if (!cells) return false;
  const auto cell = std::ranges::find_if(*cells, [&](const PlistValue& each) { return table.takes(each); });
  if (cell == cells->end()) return true;
  RowWriter writer(section, place);
  showCell(*cell->dictionary(), table, writer, platform.log);
  return true;
}

}  // namespace kelvasi
