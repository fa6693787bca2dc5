#include "Platform/QtWidgets/QtTextField.h"

#include <QGuiApplication>
#include <QInputMethod>

namespace kelvasi {

QtTextField::QtTextField(QLineEdit& edit) : edit_(edit) {
  QObject::connect(&edit, &QLineEdit::returnPressed, &edit, [this] {
    if (delegate_) delegate_->textFieldShouldReturn(*this);
  });
}

Rect QtTextField::bounds() const {
  return {0, 0, static_cast<double>(edit_.width()), static_cast<double>(edit_.height())};
}

void QtTextField::resignFirstResponder() {
  if (!edit_.hasFocus()) return;
  edit_.clearFocus();
  QGuiApplication::inputMethod()->hide();
}

}  // namespace kelvasi
