// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ArrayLock.h"

#include <gtest/gtest.h>

#include <atomic>
#include <future>

namespace kelvasi {
namespace {

// Whether another thread gets the lock while this one does not wait for it longer than need be.
std::future<void> lockElsewhere(std::atomic<bool>& locked) {
  return std::async(std::launch::async, [&locked] {
    const ArrayGuard guard;
    locked = true;
  });
}

TEST(ArrayLock, KeepsAnotherThreadOutUntilItIsReleased) {
  std::atomic<bool> locked = false;
  std::future<void> other;
  {
    const ArrayGuard guard;
    other = lockElsewhere(locked);
    EXPECT_FALSE(locked);
  }
  other.get();
  EXPECT_TRUE(locked);
}

TEST(ArrayLock, CanBeTakenAgainByItsHolder) {
  // On a thread of its own: the pair inside leaves the lock held once more than it was released, for good.
  EXPECT_EXIT(
      {
        {
          const ArrayGuard outer;
          const ArrayGuard inner;
        }
        const ArrayGuard again;
        std::_Exit(0);
      },
      testing::ExitedWithCode(0), "");
}

TEST(ArrayLock, ANestedPairLeavesItHeld) {
  EXPECT_EXIT(
      {
        {
          const ArrayGuard outer;
          const ArrayGuard inner;
        }
        std::atomic<bool> locked = false;
        auto other = lockElsewhere(locked);
        std::_Exit(other.wait_for(std::chrono::milliseconds(200)) == std::future_status::timeout ? 0 : 1);
      },
      testing::ExitedWithCode(0), "");
}

}  // namespace
}  // namespace kelvasi
