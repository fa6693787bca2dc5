// SPDX-License-Identifier: Apache-2.0
#include "Tests/Support/FakeMainQueue.h"

namespace kelvasi::test {

namespace {

// Reschedules itself for as long as the timer that it belongs to is there.
struct Repetition : std::enable_shared_from_this<Repetition> {
  Repetition(FakeMainQueue& itsQueue, std::chrono::milliseconds itsInterval, Task itsTask)
      : queue(itsQueue), interval(itsInterval), task(std::move(itsTask)) {}

  void schedule() {
    queue.postAfter(interval, [weak = weak_from_this()] {
      const auto self = weak.lock();
      if (!self) return;
      self->schedule();
      self->task();
    });
  }

  FakeMainQueue& queue;
  std::chrono::milliseconds interval;
  Task task;
};

struct FakeTimer : Timer {
  explicit FakeTimer(std::shared_ptr<Repetition> itsRepetition) : repetition(std::move(itsRepetition)) {}
  std::shared_ptr<Repetition> repetition;
};

}  // namespace

void FakeMainQueue::postAfter(Milliseconds delay, Task task) {
  tasks_.emplace(now_ + delay, std::move(task));
}

std::unique_ptr<Timer> FakeMainQueue::repeat(Milliseconds interval, Task task) {
  auto repetition = std::make_shared<Repetition>(*this, interval, std::move(task));
  repetition->schedule();
  return std::make_unique<FakeTimer>(std::move(repetition));
}

void FakeMainQueue::advance(Milliseconds duration) {
  const Milliseconds until = now_ + duration;
  while (!tasks_.empty() && tasks_.begin()->first <= until) {
    now_ = tasks_.begin()->first;
    const Task task = std::move(tasks_.begin()->second);
    tasks_.erase(tasks_.begin());
    task();
  }
  now_ = until;
}

}  // namespace kelvasi::test
