// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Spinner.h"

#include <QPainter>
#include <chrono>

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr int diameter = 20;
constexpr int spokes = 12;
constexpr auto stepTime = 83ms;  // a turn a second

}  // namespace

Spinner::Spinner(QWidget* parent) : QWidget(parent) {
  setFixedSize(diameter, diameter);
  setAccessibleName(tr("Busy"));
  turn_.setInterval(stepTime);
  connect(&turn_, &QTimer::timeout, this, [this] {
    phase_ = (phase_ + 1) % spokes;
    update();
  });
}

void Spinner::setAnimating(bool animating, bool hidesWhenStopped) {
  isAnimating_ = animating;
  setVisible(animating || !hidesWhenStopped);
  if (animating && isVisible()) {
    if (!turn_.isActive()) turn_.start();
  } else {
    turn_.stop();
  }
}

void Spinner::showEvent(QShowEvent*) {
  if (isAnimating_) turn_.start();
}

void Spinner::hideEvent(QHideEvent*) {
  turn_.stop();
}

void Spinner::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.translate(width() / 2.0, height() / 2.0);
  painter.rotate(360.0 / spokes * phase_);
  QColor colour = palette().color(QPalette::PlaceholderText);
  for (int spoke = 0; spoke < spokes; ++spoke) {
    colour.setAlphaF(0.15F + 0.85F * static_cast<float>(spoke) / (spokes - 1));
    painter.setPen(QPen(colour, 1.8, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(QPointF(0, -4.5), QPointF(0, -8));
    painter.rotate(360.0 / spokes);
  }
}

}  // namespace kelvasi
