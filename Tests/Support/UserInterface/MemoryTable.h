// SPDX-License-Identifier: Apache-2.0
// A table that is never drawn: rows come into sight when the test says so.
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <vector>

#include "Platform/UserInterface/RowCells.h"
#include "Platform/UserInterface/TableView.h"
#include "Tests/Support/UserInterface/MemoryViews.h"

namespace kelvasi::test {

class MemoryCellBody : public CellBody {
 public:
  MemoryCellBody(CellStyle itsStyle, const Rect& itsContent) : style(itsStyle), content_(itsContent) {}

  MemoryContainer<Container>& contentView() override { return contentView_; }
  void layOutStandard() override {
    ++layouts;
    laidOutWith = accessory;
    contentView_.content = content_;
  }
  void setAccessory(CellAccessory itsAccessory) override { accessory = itsAccessory; }
  MemoryLabel& textLabel() override { return label_; }

  const CellStyle style;
  CellAccessory accessory = CellAccessory::none;
  int layouts = 0;
  std::optional<CellAccessory> laidOutWith;  // the accessory at the last layout

 private:
  // Empty until it is laid out, so that a layout that is forgotten shows.
  struct Content : MemoryContainer<Container> {
    Rect bounds() const override { return content; }
    Rect content;
  };
  Rect content_;
  Content contentView_;
  MemoryLabel label_;
};

class MemoryTable : public MemoryView<TableView> {
 public:
  struct Deselection {
    IndexPath indexPath;
    bool animated;
    bool operator==(const Deselection&) const = default;
  };

  void setDataSource(TableViewDataSource* source) override { source_ = source; }
  void reloadData() override;
  std::unique_ptr<TableViewCell> dequeueReusableCellWithIdentifier(std::string_view identifier) override {
    return cells_.dequeue(identifier);
  }
  std::unique_ptr<CellBody> makeCellBody(CellStyle style) override;
  std::optional<IndexPath> indexPathForSelectedRow() const override { return selected; }
  void deselectRowAtIndexPath(const IndexPath& indexPath, bool animated) override;
  void sizeToFit() override { ++fittings; }

  // Scrolls so that these rows are in sight; rows past the end are left out.
  void show(RowRange rows);
  // A tap on a row.
  void tap(std::size_t row);
  // A selection of no row.
  void selectNothing() { source_->tableViewDidSelectRowAtIndexPath(*this, std::nullopt); }

  std::size_t rows() { return source_ ? source_->tableViewNumberOfRowsInSection(*this, 0) : 0; }
  std::size_t sections() { return source_->numberOfSectionsInTableView(*this); }
  bool hasSource() const { return source_ != nullptr; }
  TableViewCell& cell(std::size_t row) const { return *cells_.shown().at(row); }
  MemoryCellBody& body(std::size_t row) const { return static_cast<MemoryCellBody&>(cell(row).body()); }

  Rect contentArea{0, 0, 320, 44};  // of every cell
  RowRange inSight{0, 20};
  int cellsMade = 0;
  int reloads = 0;
  std::function<void()> reloaded;  // for tables that may go before they can be asked
  int fittings = 0;
  std::optional<IndexPath> selected;
  std::vector<Deselection> deselections;

 private:
  RowRange rowsInSight();
  std::unique_ptr<TableViewCell> askFor(std::size_t row);

  TableViewDataSource* source_ = nullptr;
  RowCells cells_;
};

}  // namespace kelvasi::test
