// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/Axis.h"

#include <gtest/gtest.h>

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;

constexpr Arrival noon = std::chrono::hours(480012);

std::string texts(const std::vector<Tick>& ticks) {
  std::string text;
  for (const Tick& tick : ticks) text += (text.empty() ? "" : " ") + tick.text;
  return text;
}

TEST(ValueTicks, AreRoundNumbers) {
  EXPECT_EQ(texts(valueTicks(-120, -80, {})), "-120 -100 -80");
  EXPECT_EQ(texts(valueTicks(-101, -93, {})), "-100 -98 -96 -94");
  EXPECT_EQ(texts(valueTicks(0, 1, {})), "0.0 0.5 1.0");
  EXPECT_EQ(texts(valueTicks(-7, 23, {})), "0 10 20");
  EXPECT_EQ(texts(valueTicks(0, 4e9, {})), "0 2000000000 4000000000");
  EXPECT_EQ(texts(valueTicks(-120, -80, {.minus = "\u2212"})), "\u2212120 \u2212100 \u221280");
}

TEST(ValueTicks, StandWhereTheyBelong) {
  const auto ticks = valueTicks(-120, -80, {});
  EXPECT_DOUBLE_EQ(ticks[0].place, 0);
  EXPECT_DOUBLE_EQ(ticks[1].place, 0.5);
  EXPECT_DOUBLE_EQ(ticks[2].place, 1);
}

TEST(ValueTicks, OfNoRangeThereAreNone) {
  EXPECT_EQ(valueTicks(5, 5, {}).size(), 0U);
  EXPECT_EQ(valueTicks(5, 4, {}).size(), 0U);
}

TEST(Ticks, AreNeverMoreThanFour) {
  for (int least = -200; least < 200; least += 7) {
    for (int span = 1; span < 400; span += 3) {
      const auto count = valueTicks(least, least + span, {}).size();
      ASSERT_GE(count, 1U) << least << " " << span;
      ASSERT_LE(count, 4U) << least << " " << span;
    }
  }
  for (Arrival span = 60s; span <= 24h; span += 37s) {
    const auto count = timeTicks(noon + span / 3, noon + span / 3 + span, {}).size();
    ASSERT_GE(count, 1U) << span.count();
    ASSERT_LE(count, 4U) << span.count();
  }
}

TEST(TimeTicks, AreRoundTimes) {
  EXPECT_EQ(texts(timeTicks(noon + 5s, noon + 65s, {})), "12:00:15 12:00:30 12:00:45 12:01:00");
  EXPECT_EQ(texts(timeTicks(noon, noon + 5min, {})), "12:00 12:02 12:04");
  EXPECT_EQ(texts(timeTicks(noon + 1min, noon + 61min, {})), "12:15 12:30 12:45 13:00");
  EXPECT_EQ(texts(timeTicks(noon, noon + 24h, {})), "16:00 00:00 08:00");
}

TEST(TimeTicks, AreRoundByTheLocalTime) {
  TextStyle style;
  style.eastOfUtc = [](Arrival) { return 5h + 45min; };
  EXPECT_EQ(texts(timeTicks(noon, noon + 3h, style)), "18:00 19:00 20:00");
}

TEST(TimeTicks, OfNoTimeThereAreNone) {
  EXPECT_EQ(timeTicks(noon, noon, {}).size(), 0U);
}

}  // namespace
}  // namespace kelvasi::cockpit
