// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/TopWidget.h"

#include <QApplication>
#include <QKeyEvent>

namespace kelvasi {

namespace {
constexpr QSize smallest(240, 320);
}

TopWidget::TopWidget() {
  setMinimumSize(smallest);
  setWindowTitle(QApplication::applicationName());
}

void TopWidget::setWindowedSize(const QSize& size) {
  windowedSize_ = size;
  resize(size);
}

void TopWidget::showFilling() {
  showFullScreen();
}

void TopWidget::bringToFront() {
  setWindowState(windowState() & ~Qt::WindowMinimized);
  raise();
  activateWindow();
}

void TopWidget::showWindowed() {
  const QSize size = windowedSize_;
  showNormal();
  if (size.isValid()) resize(size);
}

void TopWidget::resizeEvent(QResizeEvent* event) {
  QWidget::resizeEvent(event);
  const bool isWhole = (windowState() & (Qt::WindowFullScreen | Qt::WindowMaximized)) != 0;
  if (!isWhole) windowedSize_ = size();
}

void TopWidget::keyPressEvent(QKeyEvent* event) {
  if (keys_ && keys_(*event)) return;
  const bool isControl = event->modifiers() == Qt::ControlModifier;
  if (event->key() == Qt::Key_F11) return isFullScreen() ? showWindowed() : showFilling();
  if (isControl && event->key() == Qt::Key_W) return static_cast<void>(close());
  if (isControl && event->key() == Qt::Key_Q) return QApplication::closeAllWindows();
  QWidget::keyPressEvent(event);
}

}  // namespace kelvasi
