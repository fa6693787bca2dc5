// SPDX-License-Identifier: Apache-2.0
// A button that is a text in the colour of what can be pressed: in bars, forms and alerts. The default
// button's is bold.
#pragma once

#include <QPushButton>

namespace kelvasi {

class BarButton : public QPushButton {
 public:
  explicit BarButton(QWidget* parent = nullptr);
  explicit BarButton(const QString& text, QWidget* parent = nullptr);

  // A back button has a chevron before its text, which then ends in an ellipsis where it is too long.
  void setBack(bool back);

  QSize sizeHint() const override;
  QSize minimumSizeHint() const override;

 protected:
  bool event(QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;

 private:
  QFont textFont() const;
  int chevronWidth() const;

  bool isBack_ = false;
  bool wasTabbedTo_ = false;  // the keyboard is marked only where it was moved by hand
};

}  // namespace kelvasi
