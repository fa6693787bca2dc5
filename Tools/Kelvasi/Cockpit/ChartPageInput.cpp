// SPDX-License-Identifier: Apache-2.0
// What fingers, mouse, wheel and keyboard do to a chart.
#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QNativeGestureEvent>
#include <QTouchEvent>
#include <QWheelEvent>
#include <algorithm>
#include <cmath>

#include "Tools/Kelvasi/Cockpit/ChartPage.h"

namespace kelvasi {

namespace {

using namespace cockpit;

constexpr double nearer = 0.7;      // of the window, for each step of + and the wheel
constexpr double step = 0.25;       // of the window, for each arrow
constexpr double wheelStep = 120;   // of an angle, as Qt counts it
constexpr double tapRange = 8;      // points
constexpr double leastSpread = 24;  // points between two fingers
constexpr int cursorSteps = 60;     // to the window

}  // namespace

void ChartPage::change(const Change& change) {
  change(around_.time);
  refresh();
}

// Without a place about the newest while it follows, else about the middle.
void ChartPage::zoom(double factor, std::optional<double> place) {
  change([&](Chart& time) { time.zoom(factor, place.value_or(time.follows() ? 1 : 0.5), around_.now()); });
}

void ChartPage::setCursor(std::size_t which, const QPointF& position) {
  change([&](Chart& time) { time.setCursor(which, time.timeAt(placeOf(position), around_.now())); });
}

// One that is not there yet begins in the middle, the second at the first.
void ChartPage::moveCursor(std::size_t which, int steps) {
  change([&](Chart& time) {
    const Arrival now = around_.now();
    const Arrival middle = time.timeAt(0.5, now);
    const Arrival at = time.cursors()[which].value_or(time.cursors()[0].value_or(middle));
    time.setCursor(which,
                   std::clamp(at + time.length() / cursorSteps * steps, time.beginAt(now), time.endAt(now)));
  });
}

bool ChartPage::takeKey(const QKeyEvent& event) {
  switch (event.key()) {
    case Qt::Key_Plus:
    case Qt::Key_Equal:
      zoom(nearer);
      return true;
    case Qt::Key_Minus:
      zoom(1 / nearer);
      return true;
    case Qt::Key_Left:
    case Qt::Key_Right:
      if (event.modifiers() & (Qt::AltModifier | Qt::ControlModifier)) return false;
      change([&](Chart& time) { time.pan(event.key() == Qt::Key_Left ? -step : step, around_.now()); });
      return true;
    case Qt::Key_Comma:
    case Qt::Key_Period:
      moveCursor(0, event.key() == Qt::Key_Comma ? -1 : 1);
      return true;
    case Qt::Key_Less:
    case Qt::Key_Greater:
      moveCursor(1, event.key() == Qt::Key_Less ? -1 : 1);
      return true;
    case Qt::Key_Home:
      change([](Chart& time) {
        time.follow();
        time.setCursor(0, std::nullopt);
        time.setCursor(1, std::nullopt);
      });
      return true;
    case Qt::Key_S:
      if (event.modifiers() != Qt::NoModifier || !save_) return false;
      save_();
      return true;
    default:
      return false;
  }
}

void ChartPage::keyPressEvent(QKeyEvent* event) {
  if (!takeKey(*event)) event->ignore();
}

void ChartPage::wheelEvent(QWheelEvent* event) {
  const QPoint turn = event->angleDelta();
  if (std::abs(turn.x()) <= std::abs(turn.y()))
    return zoom(std::pow(nearer, turn.y() / wheelStep), placeOf(event->position()));
  change([&](Chart& time) { time.pan(-turn.x() / wheelStep * step / 2, around_.now()); });
}

void ChartPage::press(const QPointF& position) {
  pressed_ = position;
  isDragged_ = false;
  hold_.start();
}

void ChartPage::drag(const QPointF& position) {
  if (!pressed_) return;
  const double way = position.x() - pressed_->x();
  if (!isDragged_ && std::abs(way) < tapRange) return;
  isDragged_ = true;
  hold_.stop();
  const double wide = ChartPainting(picture_, room(), around_.now()).plot().width();
  change([&](Chart& time) { time.pan(-way / wide, around_.now()); });
  pressed_ = position;
}

void ChartPage::letGo(const QPointF& position, bool isSecond) {
  const bool isTap = pressed_ && !isDragged_;
  pressed_.reset();
  hold_.stop();
  const bool hasFirst = around_.time.cursors()[0].has_value();
  if (isTap) setCursor(isSecond && hasFirst ? 1 : 0, position);
}

void ChartPage::mousePressEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton) return event->ignore();
  press(event->position());
}

void ChartPage::mouseMoveEvent(QMouseEvent* event) {
  drag(event->position());
}

void ChartPage::mouseReleaseEvent(QMouseEvent* event) {
  letGo(event->position(), event->modifiers().testFlag(Qt::ShiftModifier));
}

void ChartPage::contextMenuEvent(QContextMenuEvent* event) {
  press(event->pos());
  letGo(event->pos(), true);
}

bool ChartPage::event(QEvent* event) {
  switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
      touch(dynamic_cast<QTouchEvent&>(*event));
      event->accept();
      return true;
    case QEvent::TouchCancel:
      pressed_.reset();
      fingers_.reset();
      hold_.stop();
      return true;
    case QEvent::NativeGesture: {
      const auto& gesture = dynamic_cast<QNativeGestureEvent&>(*event);
      if (gesture.gestureType() != Qt::ZoomNativeGesture) break;
      zoom(1 / std::max(0.1, 1 + gesture.value()), placeOf(gesture.position()));
      return true;
    }
    case QEvent::ApplicationFontChange:
    case QEvent::PaletteChange:
      refresh();
      break;
    default:
      break;
  }
  return CockpitPage::event(event);
}

// One finger is as a mouse; two zoom, and are a finger no more until all are off.
void ChartPage::touch(const QTouchEvent& event) {
  const auto& points = event.points();
  if (points.size() >= 2) return pinch(points[0].position(), points[1].position());
  const QPointF at = points.isEmpty() ? QPointF() : points[0].position();
  if (event.type() == QEvent::TouchEnd) {
    if (!fingers_) letGo(at, false);
    fingers_.reset();
    return;
  }
  if (fingers_) return;
  if (event.type() == QEvent::TouchBegin) return press(at);
  drag(at);
}

// What was between the fingers stays there.
void ChartPage::pinch(const QPointF& one, const QPointF& other) {
  pressed_.reset();
  hold_.stop();
  const QLineF now(one, other);
  const auto before = std::exchange(fingers_, now);
  if (!before) return;
  const double way = now.center().x() - before->center().x();
  const double factor = std::max(leastSpread, before->length()) / std::max(leastSpread, now.length());
  const double wide = ChartPainting(picture_, room(), around_.now()).plot().width();
  const double place = placeOf(before->center());
  change([&](Chart& time) {
    time.zoom(factor, place, around_.now());
    if (way != 0) time.pan(-way / wide, around_.now());
  });
}

}  // namespace kelvasi
