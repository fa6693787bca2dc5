// SPDX-License-Identifier: Apache-2.0
// Touches that mean the same wherever they are: two fingers at once, put down and lifted, and a swipe to the
// right from the left edge. What lies under them sees the swipe's touches not at all.
#pragma once

#include <QObject>
#include <QPointF>
#include <functional>
#include <optional>

class QTouchEvent;
class QWindow;

namespace kelvasi {

class TouchWatch : public QObject {
 public:
  struct Handlers {
    std::function<void()> twoFingers;
    std::function<void()> fromEdge;
  };

  TouchWatch(QWindow& window, Handlers handlers);

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  bool take(const QTouchEvent& event);
  void begin(const QTouchEvent& event);
  void follow(const QTouchEvent& event);
  void end(const QTouchEvent& event);
  void letGoOfWhatLiesUnder();

  QWindow& window_;
  Handlers handlers_;
  quint64 beganAt_ = 0;  // milliseconds
  std::optional<QPointF> edge_;
  qsizetype mostFingers_ = 0;
  bool hasMoved_ = false;
};

}  // namespace kelvasi
