// SPDX-License-Identifier: Apache-2.0
// A line edit as a text field.
#pragma once

#include <QLineEdit>

#include "Platform/QtWidgets/WidgetView.h"
#include "Platform/UserInterface/TextField.h"

namespace kelvasi {

class QtTextField : public QObject, public TextField, public HasWidget {
 public:
  explicit QtTextField(QLineEdit& edit);

  void setFrame(const Rect& frame) override { edit_.setGeometry(wholePoints(frame)); }
  Rect bounds() const override;
  void setDelegate(TextFieldDelegate* delegate) override { delegate_ = delegate; }
  std::optional<std::string> text() const override { return edit_.text().toStdString(); }
  void setText(std::string_view text) override;
  // The keyboard then works the form around the field.
  void resignFirstResponder() override;
  QWidget& widget() override { return edit_; }

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  QLineEdit& edit_;
  TextFieldDelegate* delegate_ = nullptr;
};

}  // namespace kelvasi
