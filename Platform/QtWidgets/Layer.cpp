// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Layer.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>

namespace kelvasi {

Layer::Layer(QWidget& parent) : QWidget(&parent), focusBefore_(QApplication::focusWidget()) {
  parent.installEventFilter(this);
  setGeometry(parent.rect());
}

Layer::~Layer() {
  const QWidget* const now = QApplication::focusWidget();
  if (now && !isAncestorOf(now)) return;  // another layer has it
  QWidget* const next = focusBefore_ && focusBefore_->isVisible() ? focusBefore_.data() : parentWidget();
  next->setFocus();
}

// A key that is held since before the layer came does not work its buttons.
bool Layer::event(QEvent* event) {
  if (event->type() == QEvent::ShortcutOverride && dynamic_cast<QKeyEvent&>(*event).isAutoRepeat())
    event->accept();
  return QWidget::event(event);
}

bool Layer::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() == QEvent::Resize && watched == parent()) setGeometry(parentWidget()->rect());
  return isTabOfNobody(watched, *event) || QWidget::eventFilter(watched, event);
}

// Where no widget has the keyboard, its keys go to the window, which would hand it to what lies beneath.
bool Layer::isTabOfNobody(QObject* watched, QEvent& event) {
  if (event.type() != QEvent::KeyPress || watched != parent() || QApplication::focusWidget()) return false;
  const int key = dynamic_cast<QKeyEvent&>(event).key();
  return (key == Qt::Key_Tab || key == Qt::Key_Backtab) && focusNextPrevChild(key == Qt::Key_Tab);
}

bool Layer::focusNextPrevChild(bool next) {
  QWidget* const focused = QApplication::focusWidget();
  QWidget* const from = focused ? focused : this;
  for (QWidget* widget = from;;) {
    widget = next ? widget->nextInFocusChain() : widget->previousInFocusChain();
    if (widget == from || !widget) return true;
    const bool takesTab = (widget->focusPolicy() & Qt::TabFocus) != 0;
    if (!isAncestorOf(widget) || !takesTab || !widget->isVisible() || !widget->isEnabled()) continue;
    widget->setFocus(next ? Qt::TabFocusReason : Qt::BacktabFocusReason);
    return true;
  }
}

// Nothing beneath is touched through a layer.
void Layer::mousePressEvent(QMouseEvent* event) {
  event->accept();
}

}  // namespace kelvasi
