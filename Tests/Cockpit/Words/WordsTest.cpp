// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include "Cockpit/Words/Age.h"
#include "Cockpit/Words/TextStyle.h"

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;

TEST(Age, IsLiveUpToThreeSeconds) {
  EXPECT_EQ(ageText(0s), "live");
  EXPECT_EQ(ageText(3s), "live");
  EXPECT_EQ(ageText(3s + 1ns), "3 s");
}

TEST(Age, CountsWholeOnes) {
  EXPECT_EQ(ageText(6900ms), "6 s");
  EXPECT_EQ(ageText(41s), "41 s");
  EXPECT_EQ(ageText(59999ms), "59 s");
  EXPECT_EQ(ageText(60s), "1 min");
  EXPECT_EQ(ageText(3min + 59s), "3 min");
  EXPECT_EQ(ageText(119min), "119 min");
  EXPECT_EQ(ageText(2h), "2 h");
  EXPECT_EQ(ageText(95h), "95 h");
  EXPECT_EQ(ageText(96h), "4 days");
  EXPECT_EQ(durationText(0s), "0 s");
}

TEST(Age, FadesInTwoStepsUntilItIsGone) {
  EXPECT_EQ(fadeOf(5999ms), Fade::none);
  EXPECT_EQ(fadeOf(6s), Fade::faded);
  EXPECT_EQ(fadeOf(14999ms), Fade::faded);
  EXPECT_EQ(fadeOf(15s), Fade::faint);
  EXPECT_EQ(fadeOf(29999ms), Fade::faint);
  EXPECT_EQ(fadeOf(30s), Fade::gone);
}

TEST(Age, SaysThatItIsGone) {
  EXPECT_EQ(ageOf(100s, 129s).text, "29 s");
  EXPECT_EQ(ageOf(100s, 130s).text, "gone 30 s");
  EXPECT_EQ(ageOf(100s, 114s, true).text, "gone 14 s");
  EXPECT_EQ(ageOf(100s, 114s, true).fade, Fade::gone);
}

TEST(Age, IsNeverLessThanNothing) {
  EXPECT_EQ(ageOf(100s, 90s).time, 0s);
  EXPECT_EQ(ageOf(100s, 90s).text, "live");
}

TEST(NumberText, RoundsAndSigns) {
  EXPECT_EQ(numberText(-95.25, 0), "-95");
  EXPECT_EQ(numberText(-7.25, 1), "-7.2");
  EXPECT_EQ(numberText(-7.3, 1), "-7.3");
  EXPECT_EQ(numberText(12, 1), "12.0");
  EXPECT_EQ(numberText(-95, 0, {.minus = "\u2212"}), "\u221295");
}

TEST(NumberText, NothingHasNoSign) {
  EXPECT_EQ(numberText(-0.4, 0), "0");
  EXPECT_EQ(numberText(-0.04, 1), "0.0");
  EXPECT_EQ(differenceText(0.3, 0), "0");
  EXPECT_EQ(differenceText(-0.3, 0), "0");
}

TEST(NumberText, ShortOnesDropZeros) {
  EXPECT_EQ(shortNumberText(12, 2), "12");
  EXPECT_EQ(shortNumberText(-7.50, 2), "-7.5");
  EXPECT_EQ(shortNumberText(100, 0), "100");
}

TEST(NumberText, DifferencesHaveBothSigns) {
  EXPECT_EQ(differenceText(3.6, 0), "+4");
  EXPECT_EQ(differenceText(-10, 0), "-10");
  EXPECT_EQ(differenceText(-10, 0, {.minus = "\u2212"}), "\u221210");
}

TEST(CountText, SetsCommas) {
  EXPECT_EQ(countText(0), "0");
  EXPECT_EQ(countText(999), "999");
  EXPECT_EQ(countText(1000), "1,000");
  EXPECT_EQ(countText(1234567), "1,234,567");
}

TEST(ClockText, IsLocal) {
  constexpr Arrival time = std::chrono::hours(24) * 19782 + 14h + 7min + 9s;  // 29 February 2024
  EXPECT_EQ(clockText(time), "14:07:09");
  EXPECT_EQ(minuteText(time), "14:07");
  EXPECT_EQ(dateText(time), "2024-02-29 14:07:09");
  TextStyle style;
  style.eastOfUtc = [](Arrival) { return 10h; };
  EXPECT_EQ(dateText(time, style), "2024-03-01 00:07:09");
}

TEST(ClockText, AlsoBefore1970) {
  EXPECT_EQ(dateText(-1ns), "1969-12-31 23:59:59");
}

}  // namespace
}  // namespace kelvasi::cockpit
