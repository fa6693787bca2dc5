// SPDX-License-Identifier: Apache-2.0
// A label of one line that ends in an ellipsis where there is no room for all of its text.
#pragma once

#include <QLabel>

namespace kelvasi {

class ElidedLabel : public QLabel {
 public:
  using QLabel::QLabel;

  QSize minimumSizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;
};

}  // namespace kelvasi
