// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/BlockView.h"

#include <QAccessible>
#include <QContextMenuEvent>
#include <QFocusEvent>
#include <QKeyEvent>
#include <QScrollBar>
#include <QScrollPrepareEvent>
#include <QScroller>
#include <algorithm>
#include <chrono>
#include <cmath>
#include <utility>

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto holdTime = 500ms;
constexpr int arrowStep = 48;

}  // namespace

BlockView::BlockView(QWidget* parent, Make make) : QAbstractScrollArea(parent), make_(std::move(make)) {
  setFrameShape(QFrame::NoFrame);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
  setFocusPolicy(Qt::StrongFocus);
  viewport()->setBackgroundRole(QPalette::Base);
  QScroller::grabGesture(viewport(), QScroller::LeftMouseButtonGesture);
  hold_.setSingleShot(true);
  hold_.setInterval(holdTime);
  connect(&hold_, &QTimer::timeout, this, [this] {
    if (const auto place = std::exchange(pressed_, std::nullopt)) askMore(*place);
    tellHold();
  });
}

void BlockView::refresh() {
  if (!isVisible()) return;
  const Blocks before = std::exchange(blocks_, make_(viewport()->width()));
  whole_ = 0;
  for (const Block& block : blocks_) whole_ += block.height;
  if (selected_ && !isUsable(*selected_)) selected_.reset();
  verticalScrollBar()->setPageStep(viewport()->height());
  verticalScrollBar()->setSingleStep(arrowStep);
  verticalScrollBar()->setRange(0, std::max(0, static_cast<int>(std::ceil(whole_)) - viewport()->height()));
  viewport()->update();
  if (QAccessible::isActive()) tellChanges(before);
}

// The value as its description too, for readers that know no values of texts.
void BlockView::tellChanges(const Blocks& before) {
  const auto tell = [](QAccessibleEvent& event, std::size_t place) {
    event.setChild(static_cast<int>(place));
    QAccessible::updateAccessibility(&event);
  };
  for (std::size_t place = 0; place < std::min(before.size(), blocks_.size()); ++place) {
    const Block& block = blocks_[place];
    QAccessibleEvent renamed(this, QAccessible::NameChanged);
    if (before[place].name != block.name) tell(renamed, place);
    if (before[place].value == block.value) continue;
    QAccessibleEvent described(this, QAccessible::DescriptionChanged);
    tell(described, place);
    QAccessibleValueChangeEvent changed(this, block.value);
    tell(changed, place);
  }
}

QRectF BlockView::areaInView(std::size_t place) const {
  return {0, topOf(place) - verticalScrollBar()->value(), 1.0 * viewport()->width(), blocks_[place].height};
}

QRect BlockView::areaOnScreen(std::size_t place) const {
  const QRect area = areaInView(place).toRect();
  return {viewport()->mapToGlobal(area.topLeft()), area.size()};
}

bool BlockView::isUsable(std::size_t place) const {
  return place < blocks_.size() && blocks_[place].action;
}

double BlockView::topOf(std::size_t place) const {
  double top = 0;
  for (std::size_t at = 0; at < place; ++at) top += blocks_[at].height;
  return top;
}

std::optional<std::size_t> BlockView::blockAt(const QPointF& position) const {
  double bottom = -verticalScrollBar()->value();
  for (std::size_t place = 0; place < blocks_.size(); ++place) {
    bottom += blocks_[place].height;
    if (position.y() < bottom) return place;
  }
  return std::nullopt;
}

void BlockView::paintEvent(QPaintEvent* event) {
  QPainter painter(viewport());
  painter.setRenderHint(QPainter::Antialiasing);
  const Canvas canvas(painter, coloursFor(palette()));
  QRectF area(0, -verticalScrollBar()->value(), viewport()->width(), 0);
  for (std::size_t place = 0; place < blocks_.size(); ++place) {
    area.setHeight(blocks_[place].height);
    if (area.intersects(event->rect())) {
      if (pressed_ == place && isUsable(place))
        painter.fillRect(area, palette().color(QPalette::AlternateBase));
      blocks_[place].paint(canvas, area);
      if (selected_ == place && hasFocus()) {
        painter.setPen(QPen(canvas.colours.accent, 2));
        painter.setBrush(Qt::NoBrush);
        painter.drawRoundedRect(area.adjusted(2, 2, -2, -3), 6, 6);
      }
    }
    area.moveTop(area.bottom());
  }
}

bool BlockView::viewportEvent(QEvent* event) {
  if (event->type() == QEvent::ScrollPrepare) {
    auto& prepare = dynamic_cast<QScrollPrepareEvent&>(*event);
    prepare.setViewportSize(viewport()->size());
    prepare.setContentPosRange({0, 0, 0, static_cast<double>(verticalScrollBar()->maximum())});
    prepare.setContentPos({0, static_cast<double>(verticalScrollBar()->value())});
    prepare.accept();
    return true;
  }
  if (event->type() == QEvent::Scroll) {
    press(std::nullopt);
    verticalScrollBar()->setValue(qRound(dynamic_cast<QScrollEvent&>(*event).contentPos().y()));
    return true;
  }
  return QAbstractScrollArea::viewportEvent(event);
}

bool BlockView::event(QEvent* event) {
  if (event->type() == QEvent::ApplicationFontChange || event->type() == QEvent::PaletteChange) refresh();
  return QAbstractScrollArea::event(event);
}

void BlockView::resizeEvent(QResizeEvent* event) {
  QAbstractScrollArea::resizeEvent(event);
  refresh();
}

void BlockView::showEvent(QShowEvent* event) {
  QAbstractScrollArea::showEvent(event);
  refresh();
}

void BlockView::scrollContentsBy(int, int) {
  viewport()->update();
}

bool BlockView::select(bool next) {
  const auto count = static_cast<std::ptrdiff_t>(blocks_.size());
  std::ptrdiff_t at = selected_ ? static_cast<std::ptrdiff_t>(*selected_) : next ? -1 : count;
  const std::ptrdiff_t step = next ? 1 : -1;
  for (at += step; at >= 0 && at < count; at += step) {
    if (!isUsable(static_cast<std::size_t>(at))) continue;
    selected_ = static_cast<std::size_t>(at);
    bringIntoSight(*selected_);
    QAccessibleEvent focus(this, QAccessible::Focus);
    focus.setChild(static_cast<int>(at));
    QAccessible::updateAccessibility(&focus);
    tellHold();
    viewport()->update();
    return true;
  }
  return false;
}

void BlockView::bringIntoSight(std::size_t place) {
  const int top = static_cast<int>(topOf(place));
  const int highest = top + static_cast<int>(std::ceil(blocks_[place].height)) - viewport()->height();
  verticalScrollBar()->setValue(std::clamp(verticalScrollBar()->value(), std::min(highest, top), top));
}

void BlockView::keyPressEvent(QKeyEvent* event) {
  const int key = event->key();
  if (key == Qt::Key_Down || key == Qt::Key_Up) {
    const bool isDown = key == Qt::Key_Down;
    if (!select(isDown))
      verticalScrollBar()->setValue(verticalScrollBar()->value() + (isDown ? 1 : -1) * arrowStep);
    return;
  }
  if (key == Qt::Key_PageDown || key == Qt::Key_PageUp || key == Qt::Key_Home || key == Qt::Key_End)
    return QAbstractScrollArea::keyPressEvent(event);
  const bool isEnter = key == Qt::Key_Return || key == Qt::Key_Enter;
  if (isEnter && selected_) return act(*selected_);
  if (key == Qt::Key_Space && selected_) return askMore(*selected_);
  event->ignore();
}

// Copies: what is done may make the blocks anew.
void BlockView::act(std::size_t place) {
  if (!isUsable(place)) return;
  const auto action = blocks_[place].action;
  action();
}

void BlockView::askMore(std::size_t place) {
  if (place >= blocks_.size()) return;
  const auto more = blocks_[place].more ? blocks_[place].more : blocks_[place].action;
  if (more) more();
}

void BlockView::press(std::optional<std::size_t> place) {
  if (std::exchange(pressed_, place) == place) return;
  if (place) {
    hold_.start();
  } else {
    hold_.stop();
  }
  tellHold();
  viewport()->update();
}

void BlockView::tellHold() {
  const bool isHeld = pressed_ || (selected_ && hasFocus());
  if (std::exchange(isHeld_, isHeld) != isHeld && onHold_) onHold_(isHeld);
}

void BlockView::mousePressEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton) return event->ignore();
  selected_.reset();
  press(blockAt(event->position()));
}

void BlockView::mouseMoveEvent(QMouseEvent* event) {
  if (pressed_ && blockAt(event->position()) != pressed_) press(std::nullopt);
}

void BlockView::mouseReleaseEvent(QMouseEvent* event) {
  const auto place = pressed_;
  press(std::nullopt);
  if (place && blockAt(event->position()) == place) act(*place);
}

void BlockView::contextMenuEvent(QContextMenuEvent* event) {
  press(std::nullopt);
  if (const auto place = blockAt(event->pos())) askMore(*place);
}

void BlockView::focusInEvent(QFocusEvent* event) {
  QAbstractScrollArea::focusInEvent(event);
  const bool isTabbed = event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason;
  if (isTabbed && !selected_) select(true);
  tellHold();
  viewport()->update();
}

void BlockView::focusOutEvent(QFocusEvent* event) {
  QAbstractScrollArea::focusOutEvent(event);
  tellHold();
  viewport()->update();
}

}  // namespace kelvasi
