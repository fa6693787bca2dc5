// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/ScrollIndicator.h"

#include <QPainter>
#include <QScrollBar>
#include <algorithm>
#include <chrono>

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr int stripWidth = 8;
constexpr double thickness = 3;
constexpr double shortest = 36;
constexpr auto restTime = 800ms;
constexpr int fadeTime = 250;

}  // namespace

ScrollIndicator::ScrollIndicator(QWidget& table, const QScrollBar& bar) : QWidget(&table), bar_(bar) {
  setAttribute(Qt::WA_TransparentForMouseEvents);
  rest_.setSingleShot(true);
  fade_.setDuration(fadeTime);
  fade_.setStartValue(1.0);
  fade_.setEndValue(0.0);
  connect(&rest_, &QTimer::timeout, this, [this] { fade_.start(); });
  connect(&fade_, &QVariantAnimation::valueChanged, this, [this](const QVariant& value) {
    strength_ = value.toDouble();
    update();
  });
  connect(&bar, &QScrollBar::valueChanged, this, [this] { flash(); });
}

void ScrollIndicator::fit() {
  const QWidget& table = *parentWidget();
  setGeometry(table.width() - stripWidth, 0, stripWidth, table.height());
  raise();
}

void ScrollIndicator::flash() {
  fade_.stop();
  strength_ = 1;
  rest_.start(restTime);
  update();
}

void ScrollIndicator::paintEvent(QPaintEvent*) {
  if (strength_ <= 0 || bar_.maximum() <= 0) return;
  const double room = height() - 4.0;
  const double whole = bar_.maximum() + bar_.pageStep();
  const double length = std::max(shortest, room * bar_.pageStep() / whole);
  const double top = 2 + (room - length) * bar_.value() / bar_.maximum();
  QColor colour = palette().color(QPalette::PlaceholderText);
  colour.setAlphaF(static_cast<float>(0.6 * strength_));
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(Qt::NoPen);
  painter.setBrush(colour);
  painter.drawRoundedRect(QRectF(stripWidth - thickness - 2, top, thickness, length), thickness / 2,
                          thickness / 2);
}

}  // namespace kelvasi
