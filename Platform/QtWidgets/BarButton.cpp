// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/BarButton.h"

#include <QFocusEvent>
#include <QPainter>
#include <cmath>

#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/Glyphs.h"

namespace kelvasi {

namespace {

constexpr int buttonHeight = 44;  // as much as a fingertip covers
constexpr int margin = 10;
constexpr int slack = 2;
constexpr double fontSize = 16;
constexpr double pressedOpacity = 0.4;

}  // namespace

BarButton::BarButton(QWidget* parent) : BarButton(QString(), parent) {}

BarButton::BarButton(const QString& text, QWidget* parent) : QPushButton(text, parent) {
  setFocusPolicy(Qt::TabFocus);
  setCursor(Qt::PointingHandCursor);
}

QFont BarButton::textFont() const {
  return qtFont(isDefault() ? Font::boldSystem(fontSize) : Font::system(fontSize));
}

void BarButton::setBack(bool back) {
  isBack_ = back;
  updateGeometry();
}

int BarButton::chevronWidth() const {
  return isBack_ ? 14 : 0;
}

// Fonts are up to a point wider on screens of another scale than their metrics say. The bold font keeps its
// room, whether the button is the default one or not.
QSize BarButton::sizeHint() const {
  const double width = QFontMetricsF(qtFont(Font::boldSystem(fontSize))).horizontalAdvance(text());
  return {static_cast<int>(std::ceil(width)) + slack + chevronWidth() + 2 * margin, buttonHeight};
}

QSize BarButton::minimumSizeHint() const {
  return {buttonHeight, buttonHeight};
}

// A button's own way is to click a tenth of a second later, and that is lost where the window closes before.
bool BarButton::event(QEvent* event) {
  if (event->type() != QEvent::Shortcut || dynamic_cast<QShortcutEvent&>(*event).isAmbiguous())
    return QPushButton::event(event);
  click();
  return true;
}

void BarButton::focusInEvent(QFocusEvent* event) {
  wasTabbedTo_ = event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason;
  QPushButton::focusInEvent(event);
}

void BarButton::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const QColor colour = palette().color(isEnabled() ? QPalette::Highlight : QPalette::PlaceholderText);
  if (hasFocus() && wasTabbedTo_) {
    painter.setPen(QPen(colour, 2));
    painter.drawRoundedRect(QRectF(rect()).adjusted(3, 6, -3, -6), 7, 7);
  }
  if (isDown()) painter.setOpacity(pressedOpacity);
  if (isBack_) drawGlyph(painter, Glyph::back, QRectF(margin, 0, 10, height()), colour);
  const QRect area = rect().adjusted(margin + chevronWidth(), 0, -margin, 0);
  painter.setPen(colour);
  painter.setFont(textFont());
  const Qt::Alignment alignment = (isBack_ ? Qt::AlignLeft : Qt::AlignHCenter) | Qt::AlignVCenter;
  painter.drawText(area, static_cast<int>(alignment) | Qt::TextSingleLine,
                   painter.fontMetrics().elidedText(text(), Qt::ElideRight, area.width()));
}

}  // namespace kelvasi
