// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtMainQueue.h"

#include <QObject>
#include <QTimer>

#include "Platform/Qt/QtTimer.h"

namespace kelvasi {

// A timer of no interval rather than a queued event: the loop looks at its sockets between two turns.
QtMainQueue::QtMainQueue() : context_(std::make_unique<QObject>()), nextTurn_(new QTimer(context_.get())) {
  nextTurn_->setSingleShot(true);
  QObject::connect(nextTurn_, &QTimer::timeout, [this] { runPosted(); });
}

QtMainQueue::~QtMainQueue() {
  posted_->clear();
}

void QtMainQueue::post(Task task) {
  posted_->push_back(std::move(task));
  if (!nextTurn_->isActive()) nextTurn_->start(0);
}

void QtMainQueue::postAfter(std::chrono::milliseconds delay, Task task) {
  auto* timer = new QTimer(context_.get());  // whose own it is
  timer->setSingleShot(true);
  timer->setTimerType(Qt::PreciseTimer);
  QObject::connect(timer, &QTimer::timeout, [timer, task = std::move(task)]() noexcept {
    timer->deleteLater();
    task();
  });
  timer->start(delay);
}

std::unique_ptr<Timer> QtMainQueue::repeat(std::chrono::milliseconds interval, Task task) {
  return std::make_unique<QtTimer>(*context_, interval, std::move(task));
}

// A task may destroy the queue: what is left of the turn is then gone, and nothing of the queue is touched.
void QtMainQueue::runPosted() noexcept {
  const auto posted = posted_;
  for (std::size_t left = posted->size(); left > 0 && !posted->empty(); --left) {
    const Task task = std::move(posted->front());
    posted->pop_front();
    task();
  }
  if (!posted->empty()) nextTurn_->start(0);
}

}  // namespace kelvasi
