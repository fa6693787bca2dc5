// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/TickSchedule.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

// The ticks of messages that arrive at these milliseconds, the one after the last message included.
std::vector<long> ticks(std::vector<long> arrivals) {
  TickSchedule schedule;
  std::vector<long> times;
  const auto note = [&](std::optional<TickSchedule::Time> tick) {
    if (tick) times.push_back(tick->count() / 1'000'000);
  };
  for (const long arrival : arrivals) note(schedule.tickBefore(std::chrono::milliseconds(arrival)));
  note(schedule.lastTick());
  return times;
}

TEST(TickSchedule, HasNoTickWithoutAMessage) {
  EXPECT_THAT(ticks({}), IsEmpty());
}

TEST(TickSchedule, TicksOnceAfterTheLastMessage) {
  EXPECT_THAT(ticks({5000}), ElementsAre(5000));
  EXPECT_THAT(ticks({5000, 5500, 6999}), ElementsAre(6999));
}

TEST(TickSchedule, TicksTwoSecondsAfterTheFirstMessageAndAheadOfOneThatComesJustThen) {
  EXPECT_THAT(ticks({5000, 7000}), ElementsAre(7000, 7000));
  EXPECT_THAT(ticks({5000, 7001}), ElementsAre(7000, 7001));
}

TEST(TickSchedule, KeepsItsPaceWhateverTheMessagesDo) {
  EXPECT_THAT(ticks({0, 1900, 2100, 3900, 4100}), ElementsAre(2000, 4000, 4100));
}

TEST(TickSchedule, LeavesOutTicksWithoutMessages) {
  EXPECT_THAT(ticks({0, 100'500, 102'500}), ElementsAre(2000, 102'000, 102'500));
}

TEST(TickSchedule, TakesAStampThatGoesBackForNoTimePassing) {
  EXPECT_THAT(ticks({10'000, 11'500, 3000, 3400, 3600}), ElementsAre(3500, 3600));
}

}  // namespace
}  // namespace kelvasi
