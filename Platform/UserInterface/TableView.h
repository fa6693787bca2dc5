// SPDX-License-Identifier: Apache-2.0
// A plain table of rows, and what it asks of whoever fills it.
#pragma once

#include <cstddef>
#include <memory>
#include <optional>
#include <string_view>

#include "Platform/UserInterface/TableViewCell.h"

namespace kelvasi {

class TableView;

struct IndexPath {
  std::size_t section = 0;
  std::size_t row = 0;
  bool operator==(const IndexPath&) const = default;
};

class TableViewDataSource {
 public:
  virtual std::size_t numberOfSectionsInTableView(TableView& tableView);  // one
  virtual std::size_t tableViewNumberOfRowsInSection(TableView& tableView, std::size_t section) = 0;
  virtual std::unique_ptr<TableViewCell> tableViewCellForRowAtIndexPath(TableView& tableView,
                                                                        const IndexPath& indexPath) = 0;
  // A row was tapped, or opened by the keyboard. It is selected already.
  virtual void tableViewDidSelectRowAtIndexPath(TableView& tableView,
                                                const std::optional<IndexPath>& indexPath) = 0;

 protected:
  ~TableViewDataSource() = default;
};

// Only the first section is shown.
class TableView : public View {
 public:
  // Null for none; the source outlives the table or takes itself off.
  virtual void setDataSource(TableViewDataSource* source) = 0;
  // Asks anew for the number of rows and for every cell in sight, which first may reuse its own row's cell.
  // Keeps scroll position and selection.
  virtual void reloadData() = 0;
  // A cell of this identifier that is no longer shown, as it was left; null when there is none.
  virtual std::unique_ptr<TableViewCell> dequeueReusableCellWithIdentifier(std::string_view identifier) = 0;
  // The toolkit's half of a new cell, as wide as the table.
  virtual std::unique_ptr<CellBody> makeCellBody(CellStyle style) = 0;
  virtual std::optional<IndexPath> indexPathForSelectedRow() const = 0;
  virtual void deselectRowAtIndexPath(const IndexPath& indexPath, bool animated) = 0;
  virtual void sizeToFit() = 0;
};

}  // namespace kelvasi
