// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/CockpitCard.h"

#include <QKeyEvent>
#include <QMouseEvent>

#include "Platform/QtWidgets/Fonts.h"
#include "Tools/Kelvasi/Cockpit/FaceBlocks.h"

namespace kelvasi {

namespace {

constexpr double handleHeight = 16;
constexpr double dragToOpen = 40;  // points upwards
constexpr double leastHeight = 150;
constexpr int usualHeight = 480;

}  // namespace

CockpitCard::CockpitCard(Look look, std::function<void()> open)
    : look_(std::move(look)), open_(std::move(open)) {
  setFocusPolicy(Qt::TabFocus);
  setCursor(Qt::PointingHandCursor);
  setAccessibleName(tr("Cockpit"));
  hide();
}

QSize CockpitCard::minimumSizeHint() const {
  return {100, static_cast<int>(leastHeight * textScale())};
}

QSize CockpitCard::sizeHint() const {
  return {390, usualHeight};
}

void CockpitCard::refresh() {
  if (!isVisible()) return;
  snapshot_ = look_();
  QStringList spoken;
  for (const Block& block : cardBlocks(snapshot_, width(), height() - handleHeight))
    spoken.append(block.spoken);
  setAccessibleDescription(spoken.join(QStringLiteral(". ")));
  update();
}

void CockpitCard::showEvent(QShowEvent*) {
  refresh();
}

void CockpitCard::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const CockpitColours& colours = coloursFor(palette());
  const Canvas canvas(painter, colours);
  painter.fillRect(rect(), colours.ground);
  painter.setPen(QPen(colours.line, 1));
  painter.setBrush(colours.surface);
  painter.drawRoundedRect(QRectF(rect()).adjusted(-0.5, 0.5, 0.5, 24), 16, 16);
  canvas.fill({width() / 2.0 - 18, 6, 36, 4}, colours.stale, 2);
  QRectF area(0, handleHeight, width(), 0);
  for (const Block& block : cardBlocks(snapshot_, width(), height() - handleHeight)) {
    area.setHeight(block.height);
    block.paint(canvas, area);
    area.moveTop(area.bottom());
  }
  if (!hasFocus()) return;
  painter.setPen(QPen(colours.accent, 2));
  painter.setBrush(Qt::NoBrush);
  painter.drawRoundedRect(QRectF(rect()).adjusted(2, 2, -2, -2), 14, 14);
}

void CockpitCard::openNow() {
  pressed_.reset();
  open_();
}

void CockpitCard::mousePressEvent(QMouseEvent* event) {
  if (event->button() == Qt::LeftButton) pressed_ = event->position();
}

void CockpitCard::mouseMoveEvent(QMouseEvent* event) {
  if (pressed_ && pressed_->y() - event->position().y() > dragToOpen) openNow();
}

void CockpitCard::mouseReleaseEvent(QMouseEvent* event) {
  const bool isTap = pressed_ && (event->position() - *pressed_).manhattanLength() < dragToOpen / 2;
  if (isTap) openNow();
  pressed_.reset();
}

void CockpitCard::keyPressEvent(QKeyEvent* event) {
  const int key = event->key();
  if (key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Space) return openNow();
  event->ignore();
}

}  // namespace kelvasi
