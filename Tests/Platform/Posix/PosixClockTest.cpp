// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PosixClock.h"

#include <gtest/gtest.h>

#include <chrono>
#include <limits>

#include "Tests/Platform/Posix/Surroundings.h"

namespace kelvasi {
namespace {

using testing::Variable;

constexpr PlistDate winter{1705320000};  // 2024-01-15 12:00:00 UTC
constexpr PlistDate summer{1721044800};  // 2024-07-15 12:00:00 UTC
constexpr const char* centralEurope = "CET-1CEST,M3.5.0,M10.5.0/3";

TEST(PosixClock, NowLiesBetweenTwoReadingsOfTheSystemsClock) {
  const auto read = [] {
    return std::chrono::duration<double>(std::chrono::system_clock::now().time_since_epoch()).count();
  };
  const double before = read();
  const double now = PosixClock().now().secondsSince1970;
  EXPECT_GE(now, before);
  EXPECT_LE(now, read());
}

TEST(PosixClock, ZonesWestOfGreenwichAreNegative) {
  const Variable zone("TZ", "<-0330>3:30");
  EXPECT_EQ(PosixClock().localZone(winter).secondsFromGmt, -12600);
  EXPECT_FALSE(PosixClock().localZone(summer).isDaylightSaving);
}

TEST(PosixClock, ZonesEastOfGreenwichArePositive) {
  const Variable zone("TZ", "<+0545>-5:45");
  EXPECT_EQ(PosixClock().localZone(winter).secondsFromGmt, 20700);
}

TEST(PosixClock, DaylightSavingComesWithItsHour) {
  const Variable zone("TZ", centralEurope);
  EXPECT_EQ(PosixClock().localZone(winter).secondsFromGmt, 3600);
  EXPECT_FALSE(PosixClock().localZone(winter).isDaylightSaving);
  EXPECT_EQ(PosixClock().localZone(summer).secondsFromGmt, 7200);
  EXPECT_TRUE(PosixClock().localZone(summer).isDaylightSaving);
}

TEST(PosixClock, DaylightSavingBeginsOnTheSecond) {
  const Variable zone("TZ", centralEurope);
  constexpr double change = 1711846800;  // 2024-03-31 01:00:00 UTC
  EXPECT_FALSE(PosixClock().localZone({change - 0.25}).isDaylightSaving);
  EXPECT_TRUE(PosixClock().localZone({change}).isDaylightSaving);
}

TEST(PosixClock, FollowsAChangeOfTheZone) {
  const PosixClock clock;
  const Variable before("TZ", "<+0545>-5:45");
  EXPECT_EQ(clock.localZone(winter).secondsFromGmt, 20700);
  const Variable after("TZ", "UTC0");
  EXPECT_EQ(clock.localZone(winter).secondsFromGmt, 0);
}

TEST(PosixClock, MomentsOutOfReachAreAtGmt) {
  const Variable zone("TZ", "<+0545>-5:45");
  for (const double moment :
       {std::numeric_limits<double>::infinity(), -1e300, 1e17, std::numeric_limits<double>::quiet_NaN()}) {
    EXPECT_EQ(PosixClock().localZone({moment}).secondsFromGmt, 0) << moment;
  }
  EXPECT_EQ(PosixClock().localZone({-1e9}).secondsFromGmt, 20700);
}

}  // namespace
}  // namespace kelvasi
