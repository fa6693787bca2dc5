// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtMainQueue.h"

#include <csignal>

#include "Tests/Platform/Qt/PortTest.h"

namespace kelvasi::test {
namespace {

using namespace std::chrono_literals;

class QtMainQueueTest : public PortTest {
 protected:
  void note(const std::string& what) { notes += what + " "; }

  std::optional<QtMainQueue> queue{std::in_place};
  std::string notes;
};

TEST_F(QtMainQueueTest, RunsTasksInTheOrderOfPostingAndNeverInsideTheCall) {
  queue->post([this] { note("first"); });
  queue->post([this] {
    queue->post([this] { note("third"); });
    note("second");
  });
  EXPECT_EQ(notes, "");
  EXPECT_TRUE(runUntil([this] { return notes == "first second third "; })) << notes;
}

TEST_F(QtMainQueueTest, RunsDelayedTasksInTheOrderOfTheirDelays) {
  queue->postAfter(40ms, [this] { note("later"); });
  queue->postAfter(1ms, [this] { note("soon"); });
  queue->post([this] { note("now"); });
  EXPECT_TRUE(runUntil([this] { return notes == "now soon later "; })) << notes;
}

TEST_F(QtMainQueueTest, RepeatsUntilTheTimerIsDestroyed) {
  auto timer = queue->repeat(1ms, [this] { note("tick"); });
  EXPECT_TRUE(runUntil([this] { return notes.starts_with("tick tick tick "); }));
  timer.reset();
  notes.clear();
  loop.runFor(20ms);
  EXPECT_EQ(notes, "");
}

TEST_F(QtMainQueueTest, LetsATaskDestroyItsOwnTimer) {
  std::unique_ptr<Timer> timer;
  const auto owned = std::make_shared<std::string>("owned by the task");
  timer = queue->repeat(1ms, [&, owned] {
    timer.reset();
    note(*owned);
  });
  EXPECT_TRUE(runUntil([this] { return !notes.empty(); }));
  loop.runFor(10ms);
  EXPECT_EQ(notes, "owned by the task ");
}

TEST_F(QtMainQueueTest, DropsTheTasksOfADestroyedQueue) {
  queue->post([this] { note("posted"); });
  queue->postAfter(0ms, [this] { note("without delay"); });
  queue->postAfter(1ms, [this] { note("delayed"); });
  const auto timer = queue->repeat(1ms, [this] { note("tick"); });
  queue.reset();
  loop.runFor(20ms);
  EXPECT_EQ(notes, "");
}

TEST_F(QtMainQueueTest, LetsATaskDestroyTheQueue) {
  queue->post([this] {
    queue.reset();
    note("last");
  });
  queue->post([this] { note("dropped"); });
  loop.runFor(10ms);
  EXPECT_EQ(notes, "last ");
}

TEST_F(QtMainQueueTest, LetsADelayedTaskDestroyTheQueue) {
  queue->postAfter(1ms, [this] {
    queue.reset();
    note("last");
  });
  queue->postAfter(2ms, [this] { note("dropped"); });
  loop.runFor(20ms);
  EXPECT_EQ(notes, "last ");
}

TEST_F(QtMainQueueTest, StarvesNobodyWithATaskThatPostsItself) {
  std::function<void()> again = [&] { queue->post(again); };
  again();
  queue->postAfter(1ms, [this] { loop.quit(); });
  EXPECT_EQ(loop.run(), 0);
}

TEST_F(QtMainQueueTest, EndsTheLoopOnATerminationAndSaysSo) {
  queue->post([] { ::raise(SIGTERM); });
  EXPECT_EQ(loop.run(), SIGTERM);
}

TEST_F(QtMainQueueTest, EndsTheLoopOnAnInterruptAndSaysSo) {
  queue->post([] { ::raise(SIGINT); });
  EXPECT_EQ(loop.runFor(60s), SIGINT);
}

TEST_F(QtMainQueueTest, HandsSignalsBackAfterTheFirst) {
  EXPECT_EXIT(
      {
        queue->post([] { ::raise(SIGTERM); });
        loop.run();
        ::raise(SIGTERM);
      },
      testing::KilledBySignal(SIGTERM), "");
}

TEST_F(QtMainQueueTest, RunsForAsLongAsAsked) {
  EXPECT_EQ(loop.runFor(1ms), 0);
}

}  // namespace
}  // namespace kelvasi::test
