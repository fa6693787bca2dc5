// SPDX-License-Identifier: Apache-2.0
// A repeating timer of the main queue.
#pragma once

#include <QPointer>
#include <QTimer>

#include "Platform/MainQueue.h"

namespace kelvasi {

class QtTimer : public Timer {
 public:
  // The timer's Qt side belongs to `owner` and stops with it at the latest.
  QtTimer(QObject& owner, std::chrono::milliseconds interval, Task task);
  ~QtTimer() override;
  QtTimer(const QtTimer&) = delete;
  QtTimer& operator=(const QtTimer&) = delete;

 private:
  QPointer<QTimer> timer_;
};

}  // namespace kelvasi
