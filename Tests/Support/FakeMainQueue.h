// SPDX-License-Identifier: Apache-2.0
// A main queue whose time the test pushes.
#pragma once

#include <map>
#include <memory>

#include "Platform/MainQueue.h"

namespace kelvasi::test {

class FakeMainQueue : public MainQueue {
 public:
  using Milliseconds = std::chrono::milliseconds;

  void post(Task task) override { postAfter(Milliseconds(0), std::move(task)); }
  void postAfter(Milliseconds delay, Task task) override;
  std::unique_ptr<Timer> repeat(Milliseconds interval, Task task) override;

  // Runs everything that falls due within `duration`, in order of time.
  void advance(Milliseconds duration);
  // Runs what was posted, without time passing.
  void runPosted() { advance(Milliseconds(0)); }

  Milliseconds now() const { return now_; }
  std::size_t waiting() const { return tasks_.size(); }

 private:
  Milliseconds now_{0};
  std::multimap<Milliseconds, Task> tasks_;
};

}  // namespace kelvasi::test
