// SPDX-License-Identifier: Apache-2.0
// What the desktop frames as the viewer's window, with the keys that every window has: F11 fills the screen
// or gives it back, Ctrl+W closes, Ctrl+Q ends the program.
#pragma once

#include <QWidget>
#include <functional>

namespace kelvasi {

class TopWidget : public QWidget {
 public:
  TopWidget();

  // The size outside full screen.
  QSize windowedSize() const { return windowedSize_; }
  void setWindowedSize(const QSize& size);
  void showFilling();
  // Before other windows and with the keyboard, as far as the desktop allows.
  void bringToFront();
  // Keys that nobody else took go to `keys` first, which says whether it took them.
  void setKeys(std::function<bool(QKeyEvent& event)> keys) { keys_ = std::move(keys); }

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;

 private:
  void showWindowed();

  QSize windowedSize_;
  std::function<bool(QKeyEvent&)> keys_;
};

}  // namespace kelvasi
