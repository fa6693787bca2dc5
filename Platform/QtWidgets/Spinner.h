// SPDX-License-Identifier: Apache-2.0
// A small turning wheel: something is being waited for.
#pragma once

#include <QTimer>
#include <QWidget>

namespace kelvasi {

class Spinner : public QWidget {
 public:
  explicit Spinner(QWidget* parent = nullptr);

  void setAnimating(bool animating, bool hidesWhenStopped);
  bool isAnimating() const { return isAnimating_; }

 protected:
  void paintEvent(QPaintEvent* event) override;
  void showEvent(QShowEvent* event) override;
  void hideEvent(QHideEvent* event) override;

 private:
  bool isAnimating_ = false;
  int phase_ = 0;
  QTimer turn_;  // runs only while the wheel is seen
};

}  // namespace kelvasi
