// SPDX-License-Identifier: Apache-2.0
// A table: only the rows in sight have widgets, however many there are.
#pragma once

#include <QAbstractScrollArea>
#include <QTimer>
#include <QVariantAnimation>
#include <algorithm>
#include <optional>

#include "Platform/QtWidgets/WidgetView.h"
#include "Platform/UserInterface/RowCells.h"
#include "Platform/UserInterface/TableView.h"

namespace kelvasi {

class CellWidget;
class QtScrollView;
class ScrollIndicator;

class TableWidget : public QAbstractScrollArea, public TableView, public HasWidget {
 public:
  explicit TableWidget(QWidget* parent = nullptr);
  ~TableWidget() override;

  // For the application.
  void setFrame(const Rect& frame) override { setGeometry(wholePoints(frame)); }
  Rect bounds() const override;
  void setDataSource(TableViewDataSource* source) override;
  // Put off until the table is seen.
  void reloadData() override;
  std::unique_ptr<TableViewCell> dequeueReusableCellWithIdentifier(std::string_view identifier) override;
  std::unique_ptr<CellBody> makeCellBody(CellStyle style) override;
  std::optional<IndexPath> indexPathForSelectedRow() const override;
  void deselectRowAtIndexPath(const IndexPath& indexPath, bool animated) override;
  // From now on the table is no higher than its rows.
  void sizeToFit() override;

  // For the toolkit.
  QWidget& widget() override { return *this; }
  // What a tap on the row does.
  void open(std::size_t row);
  // Marks the row as the one at which the keyboard is, and brings it into sight.
  void goTo(std::size_t row) { moveKeyboardTo(std::min(row, rows_ - 1)); }
  // In points of the viewport.
  std::optional<std::size_t> rowUnder(const QPoint& place) const { return rowAt(place); }
  // The widget of a row; null when the row is not in sight.
  CellWidget* cellAt(std::size_t row) const;
  // In order from the top.
  std::vector<CellWidget*> cellsInSight() const;
  // Of the row at which the keyboard is, in an active window or not; null before it is used, or out of sight.
  CellWidget* cellAtKeyboard() const { return keyboard_ ? cellAt(*keyboard_) : nullptr; }
  // Whether a key was pressed since the last tap.
  bool isKeyboardInUse() const { return isKeyboardInUse_; }
  std::size_t rows() const { return rows_; }
  // What stands in the place of rows where there is none; empty while there are some.
  QString emptyText() const;
  QSize sizeHint() const override;

 protected:
  bool viewportEvent(QEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseDoubleClickEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  void focusOutEvent(QFocusEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  void showEvent(QShowEvent* event) override;
  void scrollContentsBy(int dx, int dy) override;
  void paintEvent(QPaintEvent* event) override;
  bool event(QEvent* event) override;
  // The first Tab marks a row before the next one leaves the table.
  bool focusNextPrevChild(bool next) override;

 private:
  // Rows.
  void reloadNow();
  void fitRange();
  RowRange rowsInSight() const;
  std::unique_ptr<TableViewCell> askFor(std::size_t row);
  void showRows();
  void placeCells();
  void markCells();
  double markOf(std::size_t row) const;

  // Input.
  std::optional<std::size_t> rowAt(const QPointF& position) const;
  QtScrollView* scrollViewAt(std::size_t row) const;
  bool handleScroller(QEvent& event);
  void prepareScroll(class QScrollPrepareEvent& event);
  void scrollTo(const QPointF& position);
  void press(std::optional<std::size_t> row);
  void moveKeyboardTo(std::size_t row);
  bool moveKeyboard(int key);
  void askMore(std::size_t row);
  bool scrollSideways(int key);
  void setKeyboardInUse(bool inUse);

  TableViewDataSource* source_ = nullptr;
  std::size_t rows_ = 0;
  RowCells cells_;
  bool needsReload_ = true;
  bool fitsRows_ = false;

  std::optional<std::size_t> selected_;
  std::optional<std::size_t> pressed_;
  std::optional<std::size_t> grabbed_;   // the row that a finger scrolls sideways
  std::optional<std::size_t> keyboard_;  // the row at which the keyboard is
  bool isKeyboardInUse_ = false;         // its row is marked only once it is used
  std::size_t fading_ = 0;               // the row that was deselected
  QVariantAnimation fade_;
  QTimer hold_;
  ScrollIndicator* indicator_;  // a child
};

}  // namespace kelvasi
