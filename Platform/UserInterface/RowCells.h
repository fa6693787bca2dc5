// SPDX-License-Identifier: Apache-2.0
// The cells of a table: one for each row in sight, the others waiting to be used again. Shared by the
// toolkits.
#pragma once

#include <cstddef>
#include <functional>
#include <map>
#include <memory>
#include <string_view>
#include <vector>

#include "Platform/UserInterface/TableViewCell.h"

namespace kelvasi {

// Rows from `first` up to, not including, `end`.
struct RowRange {
  std::size_t first = 0;
  std::size_t end = 0;
  bool contains(std::size_t row) const { return row >= first && row < end; }
  bool operator==(const RowRange&) const = default;
};

class RowCells {
 public:
  using Cells = std::map<std::size_t, std::unique_ptr<TableViewCell>>;
  // Makes or reuses the cell of a row; called from show() and reload().
  using CellForRow = std::function<std::unique_ptr<TableViewCell>(std::size_t row)>;

  // Shows these rows: rows that left are kept for reuse, rows that are new are asked for.
  void show(RowRange rows, const CellForRow& cellForRow);
  // The same, but asks for every row; each is offered the cell it had before any other.
  void reload(RowRange rows, const CellForRow& cellForRow);
  // Null when no cell of the identifier waits.
  std::unique_ptr<TableViewCell> dequeue(std::string_view identifier);

  const Cells& shown() const { return shown_; }
  const std::vector<std::unique_ptr<TableViewCell>>& waiting() const { return waiting_; }

 private:
  void retireRowsOutside(RowRange rows);

  Cells shown_;
  std::vector<std::unique_ptr<TableViewCell>> waiting_;  // the next one to be used comes last
};

}  // namespace kelvasi
