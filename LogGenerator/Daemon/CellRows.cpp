#include "LogGenerator/Daemon/CellRows.h"

#include <algorithm>

#include "Platform/SystemLog.h"

namespace kelvasi {

bool CellTable::takes(const PlistValue& cell) const {
  return cell.dictionary() && std::ranges::any_of(technologies, [&](std::string_view technology) {
           return isCell(*cell.dictionary(), technology, type);
         });
}

void showCell(const PlistDictionary& cell, std::span<const CellRow> rows, RowWriter& writer, SystemLog& log) {
  for (const CellRow& row : rows) {
    const auto number = cellNumber(cell, row.cellKey);
    if (!number) {
      if (!row.failure.empty()) log.write(LogPriority::error, row.failure);
    } else if (row.isMeasurement && *number == notMeasured) {
      writer.text(row.key, std::string_view());
    } else {
      writer.number(row.key, std::int64_t{*number} * row.factor, row.unit);
    }
  }
}

const PlistArray* cellsOf(const CellInfoArray& cellInfo, SystemLog& log) {
  if (cellInfo.holdsNothing()) log.write(LogPriority::error, "Failed to get Cell Array\n");
  return cellInfo.cells();
}

void showFirstCell(const Platform& platform, RecordView record, const CellTable& table,
                   PlistDictionary& section) {
  const CellInfoArray cellInfo(platform, record.payload());
  const PlistArray* cells = cellsOf(cellInfo, platform.log);
  if (!cells) return;
  const auto cell = std::ranges::find_if(*cells, [&](const PlistValue& each) { return table.takes(each); });
  if (cell == cells->end()) return;
  RowWriter writer(section);
  showCell(*cell->dictionary(), table.rows, writer, platform.log);
}

}  // namespace kelvasi
