// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/RowCells.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace kelvasi {

void RowCells::show(RowRange rows, const CellForRow& cellForRow) {
  retireRowsOutside(rows);
  for (std::size_t row = rows.first; row < rows.end; ++row) {
    if (!shown_.contains(row)) shown_[row] = cellForRow(row);
  }
}

void RowCells::reload(RowRange rows, const CellForRow& cellForRow) {
  retireRowsOutside(rows);
  for (std::size_t row = rows.first; row < rows.end; ++row) {
    auto& cell = shown_[row];
    if (cell) waiting_.push_back(std::move(cell));
    cell = cellForRow(row);
  }
}

std::unique_ptr<TableViewCell> RowCells::dequeue(std::string_view identifier) {
  const auto isMeant = [&](const auto& cell) { return cell->reuseIdentifier() == identifier; };
  const auto found = std::ranges::find_if(waiting_.rbegin(), waiting_.rend(), isMeant);
  if (found == waiting_.rend()) return nullptr;
  auto cell = std::move(*found);
  waiting_.erase(std::next(found).base());
  return cell;
}

void RowCells::retireRowsOutside(RowRange rows) {
  for (auto entry = shown_.begin(); entry != shown_.end();) {
    const bool stays = rows.contains(entry->first);
    if (!stays) waiting_.push_back(std::move(entry->second));
    entry = stays ? std::next(entry) : shown_.erase(entry);
  }
}

}  // namespace kelvasi
