// SPDX-License-Identifier: Apache-2.0
// The one lock of the process: taken around replacing, clearing and walking the arrays of a display.
#pragma once

#include <cstdint>
#include <mutex>

namespace kelvasi {

class ArrayLock {
 public:
  static void lockArray();
  // Releases the lock only when the nesting counter is back at 0, so a nested pair leaves it held once more
  // than it was released; harmless while all callers run on the main queue.
  static void unlockArray();

 private:
  // NOLINTBEGIN(cppcoreguidelines-avoid-non-const-global-variables): the one process-wide thing
  static std::recursive_mutex lock_;
  static std::uint8_t nesting_;
  // NOLINTEND(cppcoreguidelines-avoid-non-const-global-variables)
};

// Holds the array lock for a scope.
class ArrayGuard {
 public:
  ArrayGuard() { ArrayLock::lockArray(); }
  ~ArrayGuard() { ArrayLock::unlockArray(); }
  ArrayGuard(const ArrayGuard&) = delete;
  ArrayGuard& operator=(const ArrayGuard&) = delete;
};

}  // namespace kelvasi
