// SPDX-License-Identifier: Apache-2.0
// What fingers, mouse, wheel and keyboard do to a table.
#include <QAccessible>
#include <QContextMenuEvent>
#include <QCoreApplication>
#include <QFocusEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollBar>
#include <QScroller>
#include <QWheelEvent>
#include <algorithm>
#include <utility>

#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/TableMetrics.h"
#include "Platform/QtWidgets/TableWidget.h"

namespace kelvasi {

namespace {
constexpr double sidewaysStep = 60;  // points, for each press of an arrow key
}

std::optional<std::size_t> TableWidget::rowAt(const QPointF& position) const {
  const double y = position.y() + verticalScrollBar()->value();
  const auto row = static_cast<std::size_t>(std::max(0.0, y) / rowHeight);
  const bool isInside = QRectF(viewport()->rect()).contains(position);
  return isInside && row < rows_ ? std::optional(row) : std::nullopt;
}

QtScrollView* TableWidget::scrollViewAt(std::size_t row) const {
  const CellWidget* const cell = cellAt(row);
  return cell ? cell->scrollView() : nullptr;
}

bool TableWidget::viewportEvent(QEvent* event) {
  return handleScroller(*event) || QAbstractScrollArea::viewportEvent(event);
}

// One finger scrolls the table up and down and the row under it sideways.
bool TableWidget::handleScroller(QEvent& event) {
  if (event.type() == QEvent::ScrollPrepare) {
    prepareScroll(dynamic_cast<QScrollPrepareEvent&>(event));
    return true;
  }
  if (event.type() == QEvent::Scroll) {
    scrollTo(dynamic_cast<QScrollEvent&>(event).contentPos());
    return true;
  }
  return false;
}

void TableWidget::prepareScroll(QScrollPrepareEvent& event) {
  grabbed_ = rowAt(event.startPos());
  const QtScrollView* const view = grabbed_ ? scrollViewAt(*grabbed_) : nullptr;
  event.setViewportSize(viewport()->size());
  event.setContentPosRange(
      {0, 0, view ? view->furthestOffset() : 0.0, static_cast<double>(verticalScrollBar()->maximum())});
  event.setContentPos({view ? view->offset() : 0.0, static_cast<double>(verticalScrollBar()->value())});
  event.accept();
}

void TableWidget::scrollTo(const QPointF& position) {
  if (QtScrollView* const view = grabbed_ ? scrollViewAt(*grabbed_) : nullptr) view->scrollTo(position.x());
  verticalScrollBar()->setValue(qRound(position.y()));
}

void TableWidget::press(std::optional<std::size_t> row) {
  pressed_ = row;
  if (row) {
    hold_.start();
  } else {
    hold_.stop();
  }
  markCells();
}

void TableWidget::mousePressEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton) return event->ignore();
  setKeyboardInUse(false);
  press(rowAt(event->position()));
}

// The press of a second tap that comes soon after the first.
void TableWidget::mouseDoubleClickEvent(QMouseEvent* event) {
  mousePressEvent(event);
}

void TableWidget::mouseMoveEvent(QMouseEvent* event) {
  if (pressed_ && rowAt(event->position()) != pressed_) press(std::nullopt);
}

void TableWidget::mouseReleaseEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton) return;
  const auto row = pressed_;
  press(std::nullopt);
  if (row && rowAt(event->position()) == row) open(*row);
}

// A wheel that turns sideways, or with Shift held, moves the row under it.
void TableWidget::wheelEvent(QWheelEvent* event) {
  const bool isShifted = event->modifiers().testFlag(Qt::ShiftModifier);
  const QPoint turn = event->pixelDelta().isNull() ? event->angleDelta() / 2 : event->pixelDelta();
  const int sideways = turn.x() != 0 ? turn.x() : isShifted ? turn.y() : 0;
  const auto row = rowAt(event->position());
  QtScrollView* const view = row ? scrollViewAt(*row) : nullptr;
  if (sideways == 0 || !view) return QAbstractScrollArea::wheelEvent(event);
  view->scrollTo(view->offset() - sideways);
}

void TableWidget::keyPressEvent(QKeyEvent* event) {
  const int key = event->key();
  const bool isOpening = key == Qt::Key_Return || key == Qt::Key_Enter;
  if (isOpening && keyboard_) return open(*keyboard_);
  if (key == Qt::Key_Space && keyboard_) return askMore(*keyboard_);
  if (event->modifiers().testFlag(Qt::AltModifier)) return event->ignore();
  if (!moveKeyboard(key) && !scrollSideways(key)) event->ignore();
}

// As a right click on the row does; whoever knows more of rows answers.
void TableWidget::askMore(std::size_t row) {
  CellWidget* const cell = cellAt(row);
  if (!cell) return;
  const QPoint middle = cell->rect().center();
  QContextMenuEvent asked(QContextMenuEvent::Keyboard, middle, cell->mapToGlobal(middle));
  QCoreApplication::sendEvent(window(), &asked);
}

bool TableWidget::moveKeyboard(int key) {
  if (rows_ == 0) return false;
  const std::size_t last = rows_ - 1;
  const std::size_t page = static_cast<std::size_t>(std::max(1, viewport()->height() / rowHeight - 1));
  // The first press marks the row that is there.
  const std::size_t at = keyboard_.value_or(rowsInSight().first);
  const std::size_t one = keyboard_ ? 1 : 0;
  switch (key) {
    case Qt::Key_Down:
      moveKeyboardTo(std::min(last, at + one));
      return true;
    case Qt::Key_Up:
      moveKeyboardTo(at - std::min(at, one));
      return true;
    case Qt::Key_PageDown:
      moveKeyboardTo(std::min(last, at + page));
      return true;
    case Qt::Key_PageUp:
      moveKeyboardTo(at - std::min(at, page));
      return true;
    case Qt::Key_Home:
      moveKeyboardTo(0);
      return true;
    case Qt::Key_End:
      moveKeyboardTo(last);
      return true;
    default:
      return false;
  }
}

void TableWidget::moveKeyboardTo(std::size_t row) {
  keyboard_ = row;
  const int top = static_cast<int>(row) * rowHeight;
  const int highest = top + rowHeight - viewport()->height();
  const int value = verticalScrollBar()->value();
  verticalScrollBar()->setValue(std::clamp(value, std::min(highest, top), top));
  setKeyboardInUse(true);
  if (CellWidget* const cell = cellAt(row)) {
    QAccessibleEvent focused(cell, QAccessible::Focus);
    QAccessible::updateAccessibility(&focused);
  }
}

bool TableWidget::focusNextPrevChild(bool next) {
  if (!next || rows_ == 0 || isKeyboardInUse_) return QAbstractScrollArea::focusNextPrevChild(next);
  moveKeyboardTo(keyboard_.value_or(rowsInSight().first));
  return true;
}

bool TableWidget::scrollSideways(int key) {
  if (key != Qt::Key_Left && key != Qt::Key_Right) return false;
  QtScrollView* const view = keyboard_ ? scrollViewAt(*keyboard_) : nullptr;
  if (!view) return false;
  view->scrollTo(view->offset() + (key == Qt::Key_Right ? sidewaysStep : -sidewaysStep));
  return true;
}

void TableWidget::setKeyboardInUse(bool inUse) {
  isKeyboardInUse_ = inUse;
  markCells();
}

void TableWidget::focusInEvent(QFocusEvent* event) {
  QAbstractScrollArea::focusInEvent(event);
  const bool isTabbed = event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason;
  if (isTabbed && !keyboard_ && rows_ > 0) keyboard_ = rowsInSight().first;
  setKeyboardInUse(isKeyboardInUse_ || isTabbed);
}

void TableWidget::focusOutEvent(QFocusEvent* event) {
  QAbstractScrollArea::focusOutEvent(event);
  markCells();
}

}  // namespace kelvasi
