// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/StackWidget.h"

#include <QAbstractButton>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QVBoxLayout>
#include <algorithm>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Platform/QtWidgets/Toolbar.h"

namespace kelvasi {

namespace {

bool isBack(const QKeyEvent& event) {
  switch (event.key()) {
    case Qt::Key_Escape:
    case Qt::Key_Backspace:
    case Qt::Key_Back:
      return true;
    case Qt::Key_Left:
      return event.modifiers().testFlag(Qt::AltModifier);
    default:
      return false;
  }
}

// Not with the keyboard in it: Qt would hand that on as if Tab had been pressed.
void takeAway(QWidget& page) {
  if (QWidget* const focused = page.focusWidget()) focused->clearFocus();
  page.hide();
}

}  // namespace

StackWidget::StackWidget(std::function<void()> goBack)
    : goBack_(std::move(goBack)),
      bar_(new NavigationBar(this, goBack_)),
      content_(new QWidget(this)),
      toolbar_(new Toolbar(this)) {
  auto* const layout = new QVBoxLayout(this);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->setSpacing(0);
  layout->addWidget(bar_);
  layout->addWidget(content_, 1);
  layout->addWidget(toolbar_);
  content_->installEventFilter(this);
}

void StackWidget::showPage(QWidget& page) {
  if (page_ && page_ != &page) takeAway(*page_);
  page_ = &page;
  page.setParent(content_);
  placePage();
  page.show();
  setFocusProxy(&page);
}

void StackWidget::placePage() {
  if (layout()) layout()->activate();
  const QRect all = content_->rect();
  const int high = heightOfFoot();
  if (page_) page_->setGeometry(all.adjusted(0, 0, 0, -high));
  if (!foot_) return;
  foot_->setGeometry(all.left(), all.bottom() + 1 - high, all.width(), high);
  foot_->setVisible(high > 0);
}

int StackWidget::heightOfFoot() const {
  const auto* const table = dynamic_cast<TableWidget*>(page_.data());
  if (!foot_ || !table || table->rows() == 0 || !bar_->backButton().isHidden()) return 0;
  const int left = content_->height() - table->sizeHint().height();
  return left < foot_->minimumSizeHint().height() ? 0 : std::min(left, foot_->sizeHint().height());
}

void StackWidget::setFoot(QWidget* foot) {
  if (foot_ == foot) return placePage();
  if (foot_) foot_->hide();
  foot_ = foot;
  if (foot) foot->setParent(content_);
  placePage();
}

// A page that has other rows leaves another room.
bool StackWidget::eventFilter(QObject* watched, QEvent* event) {
  if (watched == content_ && event->type() == QEvent::LayoutRequest) placePage();
  return QWidget::eventFilter(watched, event);
}

QRect StackWidget::slidingArea() const {
  return bar_->geometry().united(content_->geometry());
}

void StackWidget::resizeEvent(QResizeEvent* event) {
  QWidget::resizeEvent(event);
  placePage();
}

// The toolbar's coming and going changes the room for the page too.
bool StackWidget::event(QEvent* event) {
  const bool isHandled = QWidget::event(event);
  if (event->type() == QEvent::LayoutRequest) placePage();
  return isHandled;
}

void StackWidget::keyPressEvent(QKeyEvent* event) {
  if (isBack(*event)) return goBack_();
  QAbstractButton* const save = toolbar_->saveButton();
  if (!save || !event->matches(QKeySequence::Save)) return event->ignore();
  if (!event->isAutoRepeat()) save->click();
}

void StackWidget::mousePressEvent(QMouseEvent* event) {
  if (event->button() == Qt::BackButton) goBack_();
}

}  // namespace kelvasi
