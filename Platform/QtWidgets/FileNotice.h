// SPDX-License-Identifier: Apache-2.0
// Says for a while where a file is, above the bar at the foot of the window, and copies its path.
#pragma once

#include <QWidget>

namespace kelvasi {

class FileNotice : public QWidget {
 public:
  // Takes the place of an earlier one. Destroys itself after a while, or when it is pressed.
  FileNotice(QWidget& window, const QString& message, const QString& path);

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  void fill(const QString& message, const QString& path);
  void place();
};

}  // namespace kelvasi
