// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/NavigationBar.h"

#include <QPainter>
#include <algorithm>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {

constexpr int barHeight = 44;
constexpr int margin = 12;
constexpr double titleSize = 17;

}  // namespace

NavigationBar::NavigationBar(QWidget* parent, std::function<void()> goBack)
    : QWidget(parent), back_(new BarButton(this)) {
  setFixedHeight(barHeight);
  takeFont();
  back_->setBack(true);
  back_->setObjectName(QStringLiteral("back"));
  back_->hide();
  connect(back_, &QAbstractButton::clicked, this, [goBack = std::move(goBack)] { goBack(); });
}

void NavigationBar::takeFont() {
  setFont(qtFont(Font::boldSystem(titleSize)));
}

bool NavigationBar::event(QEvent* event) {
  const bool isHandled = QWidget::event(event);
  if (event->type() != QEvent::ApplicationFontChange) return isHandled;
  takeFont();
  placeBackButton();
  update();
  return isHandled;
}

void NavigationBar::show(const QString& title, const std::optional<QString>& back) {
  const QString below = back.value_or(QString());
  if (title_ == title && back_->text() == below && back_->isHidden() == !back) return;
  title_ = title;
  setAccessibleName(title);
  back_->setVisible(back.has_value());
  back_->setText(below);
  back_->setAccessibleName(below.isEmpty() ? tr("Back") : tr("Back to %1").arg(below));
  placeBackButton();
  update();
}

// At least a third of the bar, and what a short title in the middle leaves.
void NavigationBar::placeBackButton() {
  const int besideTitle = (width() - fontMetrics().horizontalAdvance(title_)) / 2 - margin;
  back_->setGeometry(0, 0, std::min(back_->sizeHint().width(), std::max(width() / 3, besideTitle)),
                     barHeight);
}

void NavigationBar::resizeEvent(QResizeEvent*) {
  placeBackButton();
}

// The title stands in the middle, unless it is so long that it would run into the button.
void NavigationBar::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.fillRect(rect(), palette().color(QPalette::Window));
  const double line = 1 / devicePixelRatioF();
  painter.fillRect(QRectF(0, barHeight - line, width(), line), palette().color(QPalette::Mid));
  const int left = back_->isHidden() ? margin : back_->width() + margin / 2;
  const int wanted = fontMetrics().horizontalAdvance(title_);
  const bool fitsInMiddle = (width() - wanted) / 2 >= left;
  const QRect area = fitsInMiddle ? rect() : rect().adjusted(left, 0, -margin, 0);
  painter.setPen(palette().color(QPalette::WindowText));
  painter.drawText(area, Qt::AlignCenter, fontMetrics().elidedText(title_, Qt::ElideRight, area.width()));
}

}  // namespace kelvasi
