// SPDX-License-Identifier: Apache-2.0
// Says below the window's bar that an alarm was given, whatever is shown. A tap leads to the alarms.
#pragma once

#include <QTimer>
#include <QWidget>
#include <functional>
#include <string>

namespace kelvasi {

class AlarmBanner : public QWidget {
 public:
  AlarmBanner(QWidget& window, std::function<void()> open);

  // For a while; takes the place of what it said before.
  void say(const std::string& words);
  const QString& words() const { return words_; }

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;

 private:
  void place();

  std::function<void()> open_;
  QString words_;
  QTimer timer_;
};

}  // namespace kelvasi
