// SPDX-License-Identifier: Apache-2.0
#include "Tests/Support/UserInterface/MemoryTable.h"

#include <algorithm>

namespace kelvasi::test {

void MemoryTable::reloadData() {
  ++reloads;
  if (reloaded) reloaded();
  cells_.reload(rowsInSight(), [this](std::size_t row) { return askFor(row); });
}

std::unique_ptr<CellBody> MemoryTable::makeCellBody(CellStyle style) {
  ++cellsMade;
  return std::make_unique<MemoryCellBody>(style, contentArea);
}

void MemoryTable::deselectRowAtIndexPath(const IndexPath& indexPath, bool animated) {
  deselections.push_back({indexPath, animated});
  if (selected == indexPath) selected.reset();
}

void MemoryTable::show(RowRange range) {
  inSight = range;
  cells_.show(rowsInSight(), [this](std::size_t row) { return askFor(row); });
}

void MemoryTable::tap(std::size_t row) {
  selected = IndexPath{0, row};
  source_->tableViewDidSelectRowAtIndexPath(*this, selected);
}

RowRange MemoryTable::rowsInSight() {
  const std::size_t count = rows();
  return {std::min(inSight.first, count), std::min(inSight.end, count)};
}

std::unique_ptr<TableViewCell> MemoryTable::askFor(std::size_t row) {
  return source_->tableViewCellForRowAtIndexPath(*this, {0, row});
}

}  // namespace kelvasi::test
