// SPDX-License-Identifier: Apache-2.0
// Says below the window's bar what has just come, whatever is shown: an alarm, to which a tap leads, or what
// a gesture did.
#pragma once

#include <QTimer>
#include <QWidget>
#include <chrono>
#include <functional>
#include <string>

namespace kelvasi {

class AlarmBanner : public QWidget {
 public:
  AlarmBanner(QWidget& window, std::function<void()> open);

  // An alarm, for a while; takes the place of what it said before.
  void say(const std::string& words);
  // What a gesture did, for a moment.
  void tell(const std::string& words);
  const QString& words() const { return words_; }

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;

 private:
  void place();
  void showFor(std::chrono::milliseconds time);

  std::function<void()> open_;
  QString words_;
  bool isAlarm_ = false;
  QTimer timer_;
};

}  // namespace kelvasi
