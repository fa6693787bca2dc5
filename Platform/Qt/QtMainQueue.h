// SPDX-License-Identifier: Apache-2.0
// The main queue on Qt's event loop. Used from the main thread only.
#pragma once

#include <deque>
#include <memory>

#include "Platform/MainQueue.h"

class QObject;
class QTimer;

namespace kelvasi {

// Tasks of a destroyed queue never run; its timers stop with it. A task that throws ends the process.
class QtMainQueue : public MainQueue {
 public:
  QtMainQueue();
  ~QtMainQueue() override;
  QtMainQueue(const QtMainQueue&) = delete;
  QtMainQueue& operator=(const QtMainQueue&) = delete;

  // Runs in the loop's next turn, after those posted before; tasks that post without end starve nobody.
  void post(Task task) override;
  void postAfter(std::chrono::milliseconds delay, Task task) override;
  // The task may destroy its own timer.
  std::unique_ptr<Timer> repeat(std::chrono::milliseconds interval, Task task) override;

 private:
  void runPosted() noexcept;

  std::shared_ptr<std::deque<Task>> posted_ = std::make_shared<std::deque<Task>>();
  std::unique_ptr<QObject> context_;  // owner of everything that waits in Qt
  QTimer* nextTurn_;                  // owned by the context
};

}  // namespace kelvasi
