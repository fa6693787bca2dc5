// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/TouchWatch.h"

#include <QCoreApplication>
#include <QMouseEvent>
#include <QTouchEvent>
#include <QWindow>
#include <algorithm>
#include <cmath>

namespace kelvasi {

namespace {

constexpr double edgeWidth = 16;  // points
constexpr double swipeWay = 60;   // points to the right
constexpr double tapRange = 12;   // points that a finger may move
constexpr quint64 tapTime = 400;  // milliseconds

}  // namespace

TouchWatch::TouchWatch(QWindow& window, Handlers handlers)
    : QObject(&window), window_(window), handlers_(std::move(handlers)) {
  window.installEventFilter(this);
}

bool TouchWatch::eventFilter(QObject* watched, QEvent* event) {
  switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
      if (!take(dynamic_cast<QTouchEvent&>(*event))) break;
      event->accept();
      return true;
    case QEvent::TouchCancel:
      edge_.reset();
      mostFingers_ = 0;
      break;
    default:
      break;
  }
  return QObject::eventFilter(watched, event);
}

// Whether the event goes no further.
bool TouchWatch::take(const QTouchEvent& event) {
  if (event.type() == QEvent::TouchBegin) begin(event);
  follow(event);
  const bool isFromEdge = edge_.has_value();
  if (event.type() == QEvent::TouchEnd) end(event);
  return isFromEdge;
}

void TouchWatch::begin(const QTouchEvent& event) {
  const QPointF first = event.points().front().position();
  beganAt_ = event.timestamp();
  mostFingers_ = 0;
  hasMoved_ = false;
  edge_ = first.x() < edgeWidth ? std::optional(first) : std::nullopt;
}

void TouchWatch::follow(const QTouchEvent& event) {
  const auto fingers = event.points().size();
  if (fingers == 2 && mostFingers_ < 2 && !edge_) letGoOfWhatLiesUnder();
  mostFingers_ = std::max(mostFingers_, fingers);
  for (const QEventPoint& point : event.points())
    if ((point.position() - point.pressPosition()).manhattanLength() > tapRange) hasMoved_ = true;
}

void TouchWatch::end(const QTouchEvent& event) {
  const QPointF way = edge_ ? event.points().front().position() - *edge_ : QPointF();
  const bool isSwipe = edge_ && mostFingers_ == 1 && way.x() > swipeWay && std::abs(way.y()) < way.x() / 2;
  const bool isTap = mostFingers_ == 2 && !hasMoved_ && event.timestamp() - beganAt_ <= tapTime;
  edge_.reset();
  mostFingers_ = 0;
  if (isSwipe) handlers_.fromEdge();
  if (isTap) handlers_.twoFingers();
}

// The first finger is a mouse's button to what does not know touches; without this it would press it.
void TouchWatch::letGoOfWhatLiesUnder() {
  constexpr QPointF nowhere(-1000, -1000);
  QMouseEvent away(QEvent::MouseMove, nowhere, nowhere, Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
  QCoreApplication::sendEvent(&window_, &away);
}

}  // namespace kelvasi
