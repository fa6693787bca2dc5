// SPDX-License-Identifier: Apache-2.0
#include "Survey/Alarms/AlarmRule.h"

#include <gtest/gtest.h>

namespace kelvasi::survey {
namespace {

using namespace std::chrono_literals;

AlarmRule ruleOf(std::string_view text) {
  const auto parsed = parseAlarmRule(text);
  if (const auto* error = std::get_if<AlarmRuleError>(&parsed)) {
    ADD_FAILURE() << text << ": " << error->text();
    return {};
  }
  return std::get<AlarmRule>(parsed);
}

std::string errorOf(std::string_view text) {
  const auto parsed = parseAlarmRule(text);
  const auto* error = std::get_if<AlarmRuleError>(&parsed);
  return error ? error->text() : "no error";
}

TEST(AlarmRule, BelowAThreshold) {
  const AlarmRule rule = ruleOf("rsrp < -115 for 10s");
  EXPECT_EQ(rule.text, "rsrp < -115 for 10s");
  EXPECT_EQ(rule.kind, AlarmRule::Kind::leavesBand);
  EXPECT_EQ(rule.quantity, &quantity::rsrp);
  EXPECT_TRUE(rule.band.holds(-115));
  EXPECT_FALSE(rule.band.holds(-115.25));
  EXPECT_TRUE(rule.band.holds(1e30));
  EXPECT_EQ(rule.holdsFor, 10s);
}

TEST(AlarmRule, TheFourComparisons) {
  EXPECT_FALSE(ruleOf("rsrq <= -15").band.holds(-15));
  EXPECT_TRUE(ruleOf("rsrq <= -15").band.holds(-14.5));
  EXPECT_TRUE(ruleOf("tx_power > 20").band.holds(20));
  EXPECT_FALSE(ruleOf("tx_power > 20").band.holds(20.5));
  EXPECT_FALSE(ruleOf("tx_power >= 20").band.holds(20));
  EXPECT_TRUE(ruleOf("tx_power >= 20").band.holds(19.5));
}

TEST(AlarmRule, ABand) {
  const AlarmRule rule = ruleOf("rscp leaves -110..-60.5 hysteresis 2 every 5min");
  EXPECT_TRUE(rule.band.holds(-110));
  EXPECT_TRUE(rule.band.holds(-60.5));
  EXPECT_FALSE(rule.band.holds(-110.5));
  EXPECT_FALSE(rule.band.holds(-60));
  EXPECT_EQ(rule.hysteresis, 2);
  EXPECT_EQ(rule.atMostEvery, 5min);
}

TEST(AlarmRule, Absence) {
  const AlarmRule rule = ruleOf("ecno absent for 1.5min");
  EXPECT_EQ(rule.kind, AlarmRule::Kind::absent);
  EXPECT_EQ(rule.quantity, &quantity::ecno);
  EXPECT_EQ(rule.holdsFor, 90s);
}

TEST(AlarmRule, AnEvent) {
  const AlarmRule rule = ruleOf("event service_lost every 1h");
  EXPECT_EQ(rule.kind, AlarmRule::Kind::event);
  EXPECT_EQ(rule.event, EventKind::serviceLost);
  EXPECT_EQ(rule.atMostEvery, 1h);
}

TEST(AlarmRule, BlanksAndTheUnitMayStand) {
  const AlarmRule rule = ruleOf("  rsrp<-115 dBm for  500 ms ");
  EXPECT_FALSE(rule.band.holds(-116));
  EXPECT_EQ(rule.holdsFor, 500ms);
  EXPECT_TRUE(ruleOf("rsrp < -115dBm").band.holds(-115));
}

TEST(AlarmRule, OptionsInAnyOrder) {
  const AlarmRule rule = ruleOf("rsrp < -100 every 2s hysteresis 3 for 1s");
  EXPECT_EQ(rule.atMostEvery, 2s);
  EXPECT_EQ(rule.hysteresis, 3);
  EXPECT_EQ(rule.holdsFor, 1s);
}

struct Wrong {
  std::string_view text;
  std::string_view error;
};

TEST(AlarmRule, WhatIsWrongIsSaidWithItsPlace) {
  constexpr std::string_view quantityWanted =
      "expected a measured quantity such as rsrp, rsrq, rscp, ecno or rssi, or \"event\"";
  const std::vector<Wrong> wrongs{
      {"rsrp", R"(at 5: expected <, <=, >, >=, "leaves" or "absent")"},
      {"rsrp = -115", R"(at 6: expected <, <=, >, >=, "leaves" or "absent", found "=")"},
      {"rsrp < weak", R"(at 8: expected a number, found "weak")"},
      {"rsrp < ", "at 8: expected a number"},
      {"rsrp < -", R"(at 8: expected a number, found "-")"},
      {"rsrp < 1.2.3", R"(at 11: expected "for", "hysteresis", "every" or the end, found ".3")"},
      {"rsrp < -115 for", "at 16: expected a duration such as 10s, 500ms, 5min or 1h"},
      {"rsrp < -115 for 10", R"(at 17: expected a duration such as 10s, 500ms, 5min or 1h, found "10")"},
      {"rsrp < -115 for 10d", R"(at 17: expected a duration such as 10s, 500ms, 5min or 1h, found "10")"},
      {"rsrp < -115 for -3s", R"(at 17: expected a duration such as 10s, 500ms, 5min or 1h, found "-3")"},
      {"rsrp < -115 soon", R"(at 13: expected "for", "hysteresis", "every" or the end, found "soon")"},
      {"rsrp leaves -110", R"(at 17: expected ".." and the upper end of the band)"},
      {"rsrp leaves -60..-110", "at 18: expected an upper end of the band above the lower one"},
      {"rsrp leaves -110..-100 hysteresis 6", "at 35: expected a hysteresis of at most half the band"},
      {"rsrp < -110 hysteresis -1", "at 24: expected a hysteresis of 0 or more"},
      {"rsrp absent", R"(at 12: expected "for" with a duration, after which no value is an alarm)"},
      {"rsrp absent hysteresis 2", R"(at 13: expected "for", "every" or the end, found "hysteresis")"},
      {"event rain",
       R"(at 7: expected an event: cell_change, rat_change, state_change, reject, service_lost, )"
       R"(service_back, link_lost, link_back or unknown_record, found "rain")"},
      {"event reject for 3s", R"(at 14: expected "every" or the end, found "for")"},
  };
  for (const Wrong& wrong : wrongs) EXPECT_EQ(errorOf(wrong.text), wrong.error) << wrong.text;
  EXPECT_EQ(errorOf(""), "at 1: " + std::string(quantityWanted));
  EXPECT_EQ(errorOf("weather < 3"), "at 1: " + std::string(quantityWanted) + ", found \"weather\"");
  EXPECT_EQ(errorOf("mm_state < 3"), "at 1: " + std::string(quantityWanted) + ", found \"mm_state\"");
}

}  // namespace
}  // namespace kelvasi::survey
