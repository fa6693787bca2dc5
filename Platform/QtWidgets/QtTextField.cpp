// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/QtTextField.h"

#include <QGuiApplication>
#include <QInputMethod>
#include <QKeyEvent>

namespace kelvasi {

QtTextField::QtTextField(QLineEdit& edit) : edit_(edit) {
  edit.installEventFilter(this);
}

// The return key is the field's own only where the delegate lets it have it.
bool QtTextField::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() == QEvent::KeyPress && delegate_) {
    const int key = dynamic_cast<QKeyEvent&>(*event).key();
    const bool isReturn = key == Qt::Key_Return || key == Qt::Key_Enter;
    if (isReturn && !delegate_->textFieldShouldReturn(*this)) return true;
  }
  return QObject::eventFilter(watched, event);
}

Rect QtTextField::bounds() const {
  return {0, 0, static_cast<double>(edit_.width()), static_cast<double>(edit_.height())};
}

void QtTextField::setText(std::string_view text) {
  edit_.setText(QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size())));
}

void QtTextField::resignFirstResponder() {
  if (!edit_.hasFocus()) return;
  edit_.clearFocus();
  QGuiApplication::inputMethod()->hide();
}

}  // namespace kelvasi
