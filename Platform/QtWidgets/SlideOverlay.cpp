// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/SlideOverlay.h"

#include <QPainter>
#include <utility>

namespace kelvasi {

namespace {

constexpr double lowerPaneShare = 0.3;  // of the way that the upper pane takes
constexpr double shade = 0.12;          // of the lower pane at its furthest

}  // namespace

SlideOverlay::SlideOverlay(QWidget& parent, const QRect& area, Pictures pictures, Direction direction,
                           int barHeight, std::chrono::milliseconds duration)
    : QWidget(&parent), pictures_(std::move(pictures)), direction_(direction), barHeight_(barHeight) {
  setAttribute(Qt::WA_TransparentForMouseEvents);
  setAttribute(Qt::WA_DeleteOnClose);
  setGeometry(area);
  progress_.setDuration(static_cast<int>(duration.count()));
  progress_.setEasingCurve(QEasingCurve::OutCubic);
  progress_.setStartValue(0.0);
  progress_.setEndValue(1.0);
  connect(&progress_, &QVariantAnimation::valueChanged, this, [this](const QVariant& value) {
    at_ = value.toDouble();
    update();
  });
  connect(&progress_, &QVariantAnimation::finished, this, &QObject::deleteLater);
  show();
  raise();
  progress_.start();
}

void SlideOverlay::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  if (direction_ == Direction::downwards) return paintDownwards(painter);
  if (direction_ == Direction::upwards) return paintUpwards(painter);
  paintBar(painter);
  painter.setClipRect(rect().adjusted(0, barHeight_, 0, 0));
  paintSideways(painter);
}

void SlideOverlay::paintBar(QPainter& painter) const {
  painter.setClipRect(QRect(0, 0, width(), barHeight_));
  painter.drawPixmap(0, 0, pictures_.before);
  painter.setOpacity(at_);
  painter.drawPixmap(0, 0, pictures_.after);
  painter.setOpacity(1);
}

// The deeper pane lies above the other, which moves less and lies in its shade.
void SlideOverlay::paintSideways(QPainter& painter) const {
  const bool isPush = direction_ == Direction::leftwards;
  const QPixmap& lower = isPush ? pictures_.before : pictures_.after;
  const QPixmap& upper = isPush ? pictures_.after : pictures_.before;
  const double covered = isPush ? at_ : 1 - at_;
  const double edge = width() * (1 - covered);
  painter.drawPixmap(QPointF(-width() * lowerPaneShare * covered, 0), lower);
  QColor dark = palette().color(QPalette::Shadow);
  dark.setAlphaF(static_cast<float>(shade * covered));
  painter.fillRect(QRectF(0, 0, edge, height()), dark);
  painter.drawPixmap(QPointF(edge, 0), upper);
}

void SlideOverlay::paintDownwards(QPainter& painter) const {
  painter.drawPixmap(QPointF(0, height() * at_), pictures_.before);
}

void SlideOverlay::paintUpwards(QPainter& painter) const {
  painter.drawPixmap(0, 0, pictures_.before);
  painter.drawPixmap(QPointF(0, height() * (1 - at_)), pictures_.after);
}

}  // namespace kelvasi
