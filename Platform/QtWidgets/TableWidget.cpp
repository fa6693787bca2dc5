// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/TableWidget.h"

#include <QPainter>
#include <QResizeEvent>
#include <QScrollBar>
#include <QScroller>
#include <algorithm>

#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/ScrollIndicator.h"
#include "Platform/QtWidgets/TableMetrics.h"

namespace kelvasi {

namespace {

constexpr int deselectionTime = 300;
constexpr int holdTime = 500;  // milliseconds

CellWidget& widgetOf(const TableViewCell& cell) {
  return dynamic_cast<CellWidget&>(cell.body());
}

void setUpScroller(QWidget& viewport) {
  QScroller::grabGesture(&viewport, QScroller::LeftMouseButtonGesture);
  QScrollerProperties properties = QScroller::scroller(&viewport)->scrollerProperties();
  properties.setScrollMetric(QScrollerProperties::AxisLockThreshold, 0.8);
  properties.setScrollMetric(QScrollerProperties::DragStartDistance, 0.003);
  properties.setScrollMetric(QScrollerProperties::HorizontalOvershootPolicy,
                             QScrollerProperties::OvershootAlwaysOff);
  properties.setScrollMetric(QScrollerProperties::VerticalOvershootPolicy,
                             QScrollerProperties::OvershootAlwaysOff);
  QScroller::scroller(&viewport)->setScrollerProperties(properties);
}

}  // namespace

TableWidget::TableWidget(QWidget* parent)
    : QAbstractScrollArea(parent), indicator_(new ScrollIndicator(*this, *verticalScrollBar())) {
  setFrameShape(QFrame::NoFrame);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setFocusPolicy(Qt::StrongFocus);
  viewport()->setBackgroundRole(QPalette::Base);
  setUpScroller(*viewport());
  hold_.setSingleShot(true);
  hold_.setInterval(holdTime);
  connect(&hold_, &QTimer::timeout, this, [this] {
    const auto row = pressed_;
    press(std::nullopt);
    if (row) askMore(*row);
  });
  fade_.setDuration(deselectionTime);
  fade_.setStartValue(1.0);
  fade_.setEndValue(0.0);
  connect(&fade_, &QVariantAnimation::valueChanged, this, [this] { markCells(); });
}

TableWidget::~TableWidget() = default;

Rect TableWidget::bounds() const {
  return {0, 0, static_cast<double>(width()), static_cast<double>(height())};
}

void TableWidget::setDataSource(TableViewDataSource* source) {
  source_ = source;
  reloadData();
}

void TableWidget::reloadData() {
  needsReload_ = true;
  if (isVisible()) reloadNow();
}

// Rows that stay keep their widgets where they are, so that only texts that changed are drawn anew.
void TableWidget::reloadNow() {
  needsReload_ = false;
  if (rows_ == 0) viewport()->update();
  const std::size_t before = rows_;
  rows_ = source_ ? source_->tableViewNumberOfRowsInSection(*this, 0) : 0;
  if (selected_ && *selected_ >= rows_) selected_.reset();
  if (keyboard_ && *keyboard_ >= rows_) keyboard_ = rows_ > 0 ? std::optional(rows_ - 1) : std::nullopt;
  if (rows_ != before) updateGeometry();
  fitRange();
  cells_.reload(rowsInSight(), [this](std::size_t row) { return askFor(row); });
  placeCells();
}

void TableWidget::fitRange() {
  const int whole = static_cast<int>(rows_) * rowHeight;
  verticalScrollBar()->setPageStep(viewport()->height());
  verticalScrollBar()->setSingleStep(rowHeight);
  verticalScrollBar()->setRange(0, std::max(0, whole - viewport()->height()));
  if (!fitsRows_) return;
  setMaximumHeight(whole);
  updateGeometry();
}

RowRange TableWidget::rowsInSight() const {
  const auto first = static_cast<std::size_t>(verticalScrollBar()->value() / rowHeight);
  const auto end = static_cast<std::size_t>(
      (verticalScrollBar()->value() + viewport()->height() + rowHeight - 1) / rowHeight);
  return {std::min(first, rows_), std::min(end, rows_)};
}

std::unique_ptr<TableViewCell> TableWidget::askFor(std::size_t row) {
  return source_->tableViewCellForRowAtIndexPath(*this, {0, row});
}

std::unique_ptr<TableViewCell> TableWidget::dequeueReusableCellWithIdentifier(std::string_view identifier) {
  auto cell = cells_.dequeue(identifier);
  if (cell) widgetOf(*cell).resize(viewport()->width(), rowHeight);
  return cell;
}

std::unique_ptr<CellBody> TableWidget::makeCellBody(CellStyle style) {
  auto cell = std::make_unique<CellWidget>(*viewport(), style);
  cell->resize(viewport()->width(), rowHeight);
  return cell;
}

void TableWidget::showRows() {
  if (!source_ || needsReload_) return;
  cells_.show(rowsInSight(), [this](std::size_t row) { return askFor(row); });
  placeCells();
}

void TableWidget::placeCells() {
  for (const auto& cell : cells_.waiting()) widgetOf(*cell).hide();
  for (const auto& [row, cell] : cells_.shown()) {
    CellWidget& widget = widgetOf(*cell);
    widget.showRow(row);
    widget.move(0, static_cast<int>(row) * rowHeight - verticalScrollBar()->value());
    widget.show();
    widget.tellChanges();
  }
  markCells();
}

void TableWidget::markCells() {
  for (const auto& [row, cell] : cells_.shown()) {
    widgetOf(*cell).setMark(markOf(row));
    widgetOf(*cell).setFocusMark(isKeyboardInUse_ && hasFocus() && keyboard_ == row);
  }
}

double TableWidget::markOf(std::size_t row) const {
  if (pressed_ == row || selected_ == row) return 1;
  const bool isFading = fading_ == row && fade_.state() == QAbstractAnimation::Running;
  return isFading ? fade_.currentValue().toDouble() : 0;
}

std::optional<IndexPath> TableWidget::indexPathForSelectedRow() const {
  return selected_ ? std::optional(IndexPath{0, *selected_}) : std::nullopt;
}

void TableWidget::deselectRowAtIndexPath(const IndexPath& indexPath, bool animated) {
  if (selected_ != indexPath.row) return;
  fade_.stop();
  fading_ = *selected_;
  selected_.reset();
  if (animated) fade_.start();
  markCells();
}

void TableWidget::sizeToFit() {
  fitsRows_ = true;
  rows_ = source_ ? source_->tableViewNumberOfRowsInSection(*this, 0) : 0;
  fitRange();
}

QSize TableWidget::sizeHint() const {
  return {QAbstractScrollArea::sizeHint().width(), static_cast<int>(rows_) * rowHeight};
}

void TableWidget::open(std::size_t row) {
  if (!source_ || row >= rows_) return;
  selected_ = keyboard_ = row;
  markCells();
  source_->tableViewDidSelectRowAtIndexPath(*this, IndexPath{0, row});
}

CellWidget* TableWidget::cellAt(std::size_t row) const {
  const auto cell = cells_.shown().find(row);
  return cell == cells_.shown().end() ? nullptr : &widgetOf(*cell->second);
}

std::vector<CellWidget*> TableWidget::cellsInSight() const {
  std::vector<CellWidget*> cells;
  for (const auto& [row, cell] : cells_.shown()) cells.push_back(&widgetOf(*cell));
  return cells;
}

QString TableWidget::emptyText() const {
  return rows_ == 0 && !fitsRows_ ? tr("Nothing received yet") : QString();
}

void TableWidget::paintEvent(QPaintEvent*) {
  const QString text = emptyText();
  if (text.isEmpty()) return;
  QPainter painter(viewport());
  painter.setFont(qtFont(Font::system(17)));
  painter.setPen(palette().color(QPalette::PlaceholderText));
  painter.drawText(viewport()->rect(), Qt::AlignCenter | Qt::TextWordWrap, text);
}

// Texts of another size lay out every row anew.
bool TableWidget::event(QEvent* event) {
  if (event->type() == QEvent::ApplicationFontChange) reloadData();
  return QAbstractScrollArea::event(event);
}

void TableWidget::scrollContentsBy(int, int) {
  showRows();
}

// Another width lays out every row anew; another height only shows more or fewer.
void TableWidget::resizeEvent(QResizeEvent* event) {
  QAbstractScrollArea::resizeEvent(event);
  indicator_->fit();
  if (!isVisible() || needsReload_) return;
  if (event->size().width() != event->oldSize().width()) return reloadNow();
  fitRange();
  showRows();
}

void TableWidget::showEvent(QShowEvent* event) {
  QAbstractScrollArea::showEvent(event);
  if (needsReload_) reloadNow();
}

}  // namespace kelvasi
