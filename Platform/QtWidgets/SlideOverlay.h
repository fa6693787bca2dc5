// SPDX-License-Identifier: Apache-2.0
// Pictures of what was shown and what is shown now, sliding past each other over the real thing.
#pragma once

#include <QPixmap>
#include <QVariantAnimation>
#include <QWidget>
#include <chrono>

namespace kelvasi {

class SlideOverlay : public QWidget {
 public:
  static constexpr std::chrono::milliseconds usualDuration{280};
  enum class Direction { leftwards, rightwards, downwards, upwards };

  struct Pictures {
    QPixmap before;
    QPixmap after;  // null for what lies beneath the overlay
  };

  // Over `area` of `parent`; destroys itself when it is through. The first `barHeight` points fade over
  // instead of sliding.
  SlideOverlay(QWidget& parent, const QRect& area, Pictures pictures, Direction direction, int barHeight = 0,
               std::chrono::milliseconds duration = usualDuration);

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  void paintBar(QPainter& painter) const;
  void paintSideways(QPainter& painter) const;
  void paintDownwards(QPainter& painter) const;
  void paintUpwards(QPainter& painter) const;

  Pictures pictures_;
  Direction direction_;
  int barHeight_;
  QVariantAnimation progress_;  // 0 to 1
  double at_ = 0;
};

}  // namespace kelvasi
