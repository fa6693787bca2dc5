// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/QtWindow.h"

#include <QVBoxLayout>

#include "Platform/UserInterface/NavigationStack.h"

namespace kelvasi {

QtWindow::QtWindow(const Rect& frame, bool fullScreen)
    : widget_(std::make_unique<TopWidget>()), isFullScreen_(fullScreen) {
  if (fullScreen) {
    widget_->resize(wholePoints(frame).size());
  } else {
    widget_->setWindowedSize(wholePoints(frame).size());
  }
  auto* const layout = new QVBoxLayout(widget_.get());
  layout->setContentsMargins(0, 0, 0, 0);
}

// What destroys itself goes with the window; the rest is somebody else's.
QtWindow::~QtWindow() {
  for (QWidget* const subview : widget_->findChildren<QWidget*>(Qt::FindDirectChildrenOnly)) {
    if (subview->testAttribute(Qt::WA_DeleteOnClose)) continue;
    subview->hide();
    subview->setParent(nullptr);
  }
}

Rect QtWindow::bounds() const {
  return {0, 0, static_cast<double>(widget_->width()), static_cast<double>(widget_->height())};
}

void QtWindow::addSubview(View& view) {
  widget_->layout()->addWidget(&widgetOf(view));
  widget_->setFocusProxy(&widgetOf(view));
}

void QtWindow::makeKeyAndVisible() {
  widget_->layout()->activate();
  if (root_) root_->willAppear();
  if (isFullScreen_) {
    widget_->showFilling();
  } else {
    widget_->show();
  }
  widget_->activateWindow();
}

}  // namespace kelvasi
