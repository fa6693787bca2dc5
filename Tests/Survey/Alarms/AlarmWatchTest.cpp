// SPDX-License-Identifier: Apache-2.0
#include "Survey/Alarms/AlarmWatch.h"

#include <gtest/gtest.h>

namespace kelvasi::survey {
namespace {

using namespace std::chrono_literals;

constexpr auto noon = std::chrono::hours(480000);
constexpr CellIdentity here{RadioFamily::lte, 3350, 404};

AlarmRule ruleOf(std::string_view text) {
  return std::get<AlarmRule>(parseAlarmRule(text));
}

// A watch for one rule; what it gave, in words.
struct Watch {
  explicit Watch(std::string_view rule)
      : watch({ruleOf(rule)}, [this](const Alarm& alarm) {
          given.push_back(
              std::to_string(std::chrono::duration_cast<std::chrono::seconds>(alarm.time - noon).count()));
          last = alarm.value;
          since = alarm.since - noon;
          heldBack = alarm.heldBack;
          cell = alarm.cell;
        }) {}

  void rsrp(std::chrono::nanoseconds after, double value) {
    watch.value(quantity::rsrp, noon + after, value, here);
  }

  AlarmWatch watch;
  std::vector<std::string> given;  // seconds
  std::optional<double> last;
  std::chrono::nanoseconds since{0};
  std::uint64_t heldBack = 0;
  CellIdentity cell;
};

using Given = std::vector<std::string>;

TEST(AlarmWatch, AThresholdIsAnAlarmOnce) {
  Watch watch("rsrp < -115");
  watch.rsrp(0s, -115);
  EXPECT_EQ(watch.given, Given{});
  watch.rsrp(1s, -115.5);
  watch.rsrp(2s, -120);
  EXPECT_EQ(watch.given, Given{"1"});
  EXPECT_EQ(watch.last, -115.5);
  EXPECT_EQ(watch.cell, here);
}

TEST(AlarmWatch, ItComesAgainAfterTheValueCameBack) {
  Watch watch("rsrp < -115");
  watch.rsrp(0s, -116);
  watch.rsrp(1s, -110);
  watch.rsrp(2s, -116);
  EXPECT_EQ(watch.given, (Given{"0", "2"}));
}

TEST(AlarmWatch, HysteresisKeepsItFromComingAgainAtOnce) {
  Watch watch("rsrp < -115 hysteresis 3");
  watch.rsrp(0s, -116);
  watch.rsrp(1s, -113);
  watch.rsrp(2s, -116);
  EXPECT_EQ(watch.given, Given{"0"});
  watch.rsrp(3s, -112);
  watch.rsrp(4s, -116);
  EXPECT_EQ(watch.given, (Given{"0", "4"}));
}

TEST(AlarmWatch, WhatHasToLastMustLast) {
  Watch watch("rsrp < -115 for 10s");
  for (int second = 0; second < 10; ++second) watch.rsrp(second * 1s, -120);
  EXPECT_EQ(watch.given, Given{});
  watch.rsrp(10s, -121);
  EXPECT_EQ(watch.given, Given{"10"});
  EXPECT_EQ(watch.since, 0s);
  EXPECT_EQ(watch.last, -121);
}

TEST(AlarmWatch, AValueInOrderBeginsItAnew) {
  Watch watch("rsrp < -115 for 10s");
  for (int second = 0; second < 9; ++second) watch.rsrp(second * 1s, -120);
  watch.rsrp(9s, -100);
  for (int second = 10; second < 20; ++second) watch.rsrp(second * 1s, -120);
  EXPECT_EQ(watch.given, Given{});
  watch.rsrp(20s, -120);
  EXPECT_EQ(watch.given, Given{"20"});
}

TEST(AlarmWatch, AGapBeginsItAnew) {
  Watch watch("rsrp < -115 for 10s");
  watch.rsrp(0s, -120);
  watch.rsrp(5s, -120);
  watch.rsrp(11s, -120);  // 6 s without a value
  watch.rsrp(15s, -120);
  EXPECT_EQ(watch.given, Given{});
  watch.rsrp(20s, -120);
  watch.rsrp(21s, -120);
  EXPECT_EQ(watch.given, Given{"21"});
}

TEST(AlarmWatch, SlowValuesMayLastToo) {
  Watch watch("rsrp < -115 for 1min");
  for (int second = 0; second <= 60; second += 20) watch.rsrp(second * 1s, -120);
  EXPECT_EQ(watch.given, Given{"60"});
}

TEST(AlarmWatch, AClockThatStepsBackBeginsItAnew) {
  Watch watch("rsrp < -115 for 10s");
  watch.rsrp(1000s, -120);
  watch.rsrp(1s, -120);
  watch.rsrp(6s, -120);
  watch.rsrp(11s, -120);
  EXPECT_EQ(watch.given, Given{"11"});
}

TEST(AlarmWatch, ABandIsLeftAtBothEnds) {
  Watch watch("rsrp leaves -110..-60 hysteresis 2");
  watch.rsrp(0s, -110);
  watch.rsrp(1s, -59);
  watch.rsrp(2s, -61);  // back, not by the hysteresis
  watch.rsrp(3s, -62);
  watch.rsrp(4s, -111);
  EXPECT_EQ(watch.given, (Given{"1", "4"}));
}

TEST(AlarmWatch, AtMostSoOftenAndWhatIsHeldBackIsCounted) {
  Watch watch("rsrp < -115 every 1min");
  for (int second = 0; second < 60; second += 2) {
    watch.rsrp(second * 1s, -120);
    watch.rsrp((second + 1) * 1s, -90);
  }
  EXPECT_EQ(watch.given, Given{"0"});
  watch.rsrp(60s, -120);
  EXPECT_EQ(watch.given, (Given{"0", "60"}));
  EXPECT_EQ(watch.heldBack, 29U);
}

TEST(AlarmWatch, AnAbsentValue) {
  Watch watch("rsrp absent for 30s");
  watch.watch.pass(noon);
  watch.rsrp(10s, -80);
  watch.watch.pass(noon + 39s);
  EXPECT_EQ(watch.given, Given{});
  watch.watch.pass(noon + 40s);
  watch.watch.pass(noon + 41s);
  EXPECT_EQ(watch.given, Given{"40"});
  EXPECT_EQ(watch.since, 10s);
  EXPECT_EQ(watch.last, std::nullopt);
  EXPECT_EQ(watch.cell, here);
  watch.rsrp(50s, -80);
  watch.watch.pass(noon + 80s);
  EXPECT_EQ(watch.given, (Given{"40", "80"}));
}

TEST(AlarmWatch, AValueThatNeverCame) {
  Watch watch("rsrp absent for 30s");
  watch.watch.pass(noon);
  watch.watch.pass(noon + 30s);
  EXPECT_EQ(watch.given, Given{"30"});
  EXPECT_FALSE(watch.cell);
}

TEST(AlarmWatch, AnAbsenceThatIsToldOfByItsEnd) {
  Watch watch("rsrp absent for 30s");
  watch.rsrp(0s, -80);
  watch.rsrp(60s, -80);
  EXPECT_EQ(watch.given, Given{"60"});
  EXPECT_EQ(watch.since, 0s);
}

TEST(AlarmWatch, AnEventIsAnAlarmEachTime) {
  Watch watch("event reject every 10s");
  watch.watch.event(EventKind::reject, noon, "LOCATION_AREA_NOT_ALLOWED", here);
  watch.watch.event(EventKind::cellChange, noon + 1s, "404 to 362", here);
  watch.watch.event(EventKind::reject, noon + 9s, "LOCATION_AREA_NOT_ALLOWED", here);
  watch.watch.event(EventKind::reject, noon + 10s, "LOCATION_AREA_NOT_ALLOWED", here);
  EXPECT_EQ(watch.given, (Given{"0", "10"}));
  EXPECT_EQ(watch.heldBack, 1U);
  EXPECT_EQ(watch.watch.given(), 2U);
}

TEST(AlarmWatch, OtherQuantitiesDoNotCount) {
  Watch watch("rsrp < -115");
  watch.watch.value(quantity::rsrq, noon, -120, here);
  EXPECT_EQ(watch.given, Given{});
}

TEST(AlarmWatch, WhatHasBegunGoesOnWhenOtherRulesChange) {
  Watch watch("rsrp < -115 for 10s");
  const auto rule = [](const char* text) { return std::get<AlarmRule>(parseAlarmRule(text)); };
  for (int second = 0; second < 6; ++second) watch.rsrp(second * 1s, -120);
  watch.watch.change({rule("event reject"), rule("rsrp < -115 for 10s")});
  for (int second = 6; second < 12; ++second) watch.rsrp(second * 1s, -120);
  EXPECT_EQ(watch.given, Given{"10"});
  ASSERT_EQ(watch.watch.rules(), 2U);
  EXPECT_EQ(watch.watch.rule(0).text, "event reject");
  EXPECT_FALSE(watch.watch.isRaised(0));
  EXPECT_TRUE(watch.watch.isRaised(1));
  watch.watch.change({rule("event reject")});
  for (int second = 12; second < 60; ++second) watch.rsrp(second * 1s, -120);
  EXPECT_EQ(watch.given, Given{"10"});
}

}  // namespace
}  // namespace kelvasi::survey
