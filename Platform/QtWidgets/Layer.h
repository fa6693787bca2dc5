// SPDX-License-Identifier: Apache-2.0
// What lies over the whole window for a while: as large as its parent, and the keyboard stays in it.
#pragma once

#include <QPointer>
#include <QWidget>

namespace kelvasi {

class Layer : public QWidget {
 public:
  explicit Layer(QWidget& parent);
  // The keyboard goes back to where it was.
  ~Layer() override;

 protected:
  bool event(QEvent* event) override;
  bool eventFilter(QObject* watched, QEvent* event) override;
  bool focusNextPrevChild(bool next) override;
  void mousePressEvent(QMouseEvent* event) override;

 private:
  bool isTabOfNobody(QObject* watched, QEvent& event);

  QPointer<QWidget> focusBefore_;
};

}  // namespace kelvasi
