// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/CellWidget.h"

#include <QAccessible>
#include <QPainter>
#include <algorithm>
#include <utility>

#include "Platform/QtWidgets/Glyphs.h"

namespace kelvasi {

namespace {

constexpr double lineIndent = 10;   // where the names of panes begin
constexpr double labelIndent = 16;  // of the one-label style
constexpr double glyphWidth = 34;
constexpr int widestColumn = 600;

// Applications put texts flush with the content area's right edge: it keeps off the screen's edge.
double rightInset(CellAccessory accessory) {
  return accessory == CellAccessory::none ? lineIndent : glyphWidth;
}

QColor mixed(const QColor& from, const QColor& to, double share) {
  const auto part = [&](int a, int b) { return static_cast<int>(a + (b - a) * share); };
  return {part(from.red(), to.red()), part(from.green(), to.green()), part(from.blue(), to.blue())};
}

}  // namespace

CellWidget::CellWidget(QWidget& table, CellStyle style) : QWidget(&table), style_(style) {
  setAttribute(Qt::WA_OpaquePaintEvent);
  setAttribute(Qt::WA_TransparentForMouseEvents);
  textLabel_.setElided(true);
  content_.addSubview(textLabel_);
}

// On a card all of the row, which is no wider than the card.
QRect CellWidget::column() const {
  const int wide = style_ == CellStyle::oneLabel ? width() : std::min(width(), widestColumn);
  return {(width() - wide) / 2, 0, wide, height()};
}

void CellWidget::layOutStandard() {
  const QRect used = column();
  content_.setFrame({static_cast<double>(used.left()), 0, used.width() - rightInset(accessory_),
                     static_cast<double>(height())});
  const double indent = style_ == CellStyle::oneLabel ? labelIndent : lineIndent;
  textLabel_.setFrame({indent, 0, content_.area.width - indent, content_.area.height});
}

void CellWidget::setAccessory(CellAccessory accessory) {
  if (std::exchange(accessory_, accessory) != accessory) update();
}

void CellWidget::showRow(std::size_t row) {
  if (std::exchange(row_, row) == row) return;
  update();
  if (QtScrollView* view = scrollView()) view->scrollTo(0);
}

void CellWidget::setMark(double strength) {
  if (std::exchange(mark_, strength) != strength) update();
}

void CellWidget::setFocusMark(bool marked) {
  if (std::exchange(hasFocusMark_, marked) != marked) update();
}

QStringList CellWidget::texts() const {
  QStringList all;
  content_.group.collectTexts(all);
  return all;
}

void CellWidget::tellChanges() {
  const QStringList now = texts();
  const QStringList before = std::exchange(told_, now);
  if (before.isEmpty() || before == now) return;
  const auto tell = [this](QAccessible::Event kind) {
    QAccessibleEvent event(this, kind);
    QAccessible::updateAccessibility(&event);
  };
  if (before.value(0) != now.value(0)) tell(QAccessible::NameChanged);
  if (before.mid(1) == now.mid(1)) return;
  tell(QAccessible::DescriptionChanged);
  QAccessibleValueChangeEvent changed(this, spokenValue());
  QAccessible::updateAccessibility(&changed);
}

QColor CellWidget::ground() const {
  return mixed(palette().color(QPalette::Base), palette().color(QPalette::AlternateBase), mark_);
}

void CellWidget::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.fillRect(rect(), ground());
  painter.setBrush(ground());
  painter.setPen(palette().color(QPalette::Text));
  painter.translate(content_.area.x, 0);
  if (opens()) painter.setClipRect(qtRect({0, 0, content_.area.width, content_.area.height}));
  content_.group.paint(painter);
  painter.setClipping(false);
  painter.translate(-content_.area.x, 0);
  paintAccessory(painter);
  paintLine(painter);
  if (hasFocusMark_) paintFocus(painter);
}

void CellWidget::paintAccessory(QPainter& painter) const {
  const QRect used = column();
  const QRectF area(used.left() + used.width() - glyphWidth, 0, glyphWidth, height());
  if (opens()) drawGlyph(painter, Glyph::disclosure, area, palette().color(QPalette::Dark));
  if (isChecked()) drawGlyph(painter, Glyph::checkmark, area, palette().color(QPalette::Highlight));
}

// One pixel of the screen, whatever its scale. One-label rows lie on a card: lines are only between them.
void CellWidget::paintLine(QPainter& painter) const {
  const double thickness = 1 / devicePixelRatioF();
  const bool isOnCard = style_ == CellStyle::oneLabel;
  if (isOnCard && row_ == 0) return;
  const double indent = isOnCard ? labelIndent : lineIndent;
  const QRect used = column();
  const double right = used.width() == width() ? 0 : lineIndent;
  painter.fillRect(QRectF(used.left() + indent, isOnCard ? 0 : height() - thickness,
                          used.width() - indent - right, thickness),
                   palette().color(QPalette::Mid));
}

void CellWidget::paintFocus(QPainter& painter) const {
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(QPen(palette().color(QPalette::Highlight), 2));
  painter.setBrush(Qt::NoBrush);
  painter.drawRoundedRect(QRectF(column()).adjusted(2, 2, -2, -3), 6, 6);
}

}  // namespace kelvasi
