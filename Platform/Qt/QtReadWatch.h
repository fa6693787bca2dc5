// SPDX-License-Identifier: Apache-2.0
// Watches a descriptor from the event loop.
#pragma once

#include <memory>

#include "Platform/MainQueue.h"

class QSocketNotifier;

namespace kelvasi {

class QtReadWatch {
 public:
  // `task` runs whenever there is something to read from `descriptor`, which stays the caller's, or its other
  // side has gone. A task that throws ends the process.
  QtReadWatch(int descriptor, Task task);
  ~QtReadWatch();
  QtReadWatch(const QtReadWatch&) = delete;
  QtReadWatch& operator=(const QtReadWatch&) = delete;

 private:
  std::unique_ptr<QSocketNotifier> notifier_;
};

}  // namespace kelvasi
