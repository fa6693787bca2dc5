// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtTimer.h"

namespace kelvasi {

QtTimer::QtTimer(QObject& owner, std::chrono::milliseconds interval, Task task) : timer_(new QTimer(&owner)) {
  timer_->setTimerType(Qt::PreciseTimer);
  // The copy lives through a task that destroys its timer.
  QObject::connect(timer_, &QTimer::timeout,
                   [task = std::make_shared<const Task>(std::move(task))]() noexcept {
                     const auto running = task;  // NOLINT(performance-unnecessary-copy-initialization)
                     (*running)();
                   });
  timer_->start(interval);
}

QtTimer::~QtTimer() {
  if (!timer_) return;
  timer_->stop();
  timer_->disconnect();
  // Later, as this may be the timer's own task.
  timer_->deleteLater();
}

}  // namespace kelvasi
