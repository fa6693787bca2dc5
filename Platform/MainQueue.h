// SPDX-License-Identifier: Apache-2.0
// The main thread's queue: tasks run one after another, never inside the call that posts them.
#pragma once

#include <chrono>
#include <functional>
#include <memory>

namespace kelvasi {

using Task = std::function<void()>;

// A repeating timer; destroying it stops it.
class Timer {
 public:
  virtual ~Timer() = default;
};

class MainQueue {
 public:
  virtual ~MainQueue() = default;

  virtual void post(Task task) = 0;
  virtual void postAfter(std::chrono::milliseconds delay, Task task) = 0;
  // Runs `task` every `interval`, the first time after one interval.
  virtual std::unique_ptr<Timer> repeat(std::chrono::milliseconds interval, Task task) = 0;
};

}  // namespace kelvasi
