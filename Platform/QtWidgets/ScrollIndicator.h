// SPDX-License-Identifier: Apache-2.0
// The thin mark at the edge that tells where in a table one is; it shows while the table scrolls.
#pragma once

#include <QTimer>
#include <QVariantAnimation>
#include <QWidget>

class QScrollBar;

namespace kelvasi {

class ScrollIndicator : public QWidget {
 public:
  // Follows `bar`, at the right edge of `table`.
  ScrollIndicator(QWidget& table, const QScrollBar& bar);
  // To be called when the table's size changed.
  void fit();

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  void flash();

  const QScrollBar& bar_;
  double strength_ = 0;
  QTimer rest_;
  QVariantAnimation fade_;
};

}  // namespace kelvasi
