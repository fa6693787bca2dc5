// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Levels/Thresholds.h"

#include <gtest/gtest.h>

#include <cmath>

namespace kelvasi::cockpit {
namespace {

struct Row {
  LevelKind kind;
  double excellent, good, fair, poor;
};

// Typed beside the table itself.
constexpr Row rows[] = {
    {LevelKind::rsrp, -80, -90, -100, -110},   {LevelKind::rsrq, -8, -11, -14, -17},
    {LevelKind::sinr, 20, 13, 5, 0},           {LevelKind::rscp, -75, -85, -95, -105},
    {LevelKind::ecno, -6, -9, -12, -15},       {LevelKind::ecio, -6, -9, -12, -15},
    {LevelKind::gsmLevel, -65, -75, -85, -95},
};

TEST(Thresholds, EachVerdictBeginsAtItsThreshold) {
  const Thresholds thresholds;
  for (const Row& row : rows) {
    SCOPED_TRACE(definitionOf(row.kind).name);
    const auto word = [&](double level) { return wordOf(thresholds.verdict(row.kind, level)); };
    EXPECT_EQ(word(row.excellent + 30), "excellent");
    EXPECT_EQ(word(row.excellent), "excellent");
    EXPECT_EQ(word(row.excellent - 0.1), "good");
    EXPECT_EQ(word(row.good), "good");
    EXPECT_EQ(word(row.good - 0.1), "fair");
    EXPECT_EQ(word(row.fair), "fair");
    EXPECT_EQ(word(row.fair - 0.1), "poor");
    EXPECT_EQ(word(row.poor), "poor");
    EXPECT_EQ(word(row.poor - 0.1), "very poor");
    EXPECT_EQ(word(row.poor - 30), "very poor");
  }
}

TEST(Thresholds, RssiHasNone) {
  EXPECT_EQ(Thresholds().verdict(LevelKind::rssi, -60), Verdict::none);
  EXPECT_EQ(wordOf(Verdict::none), "");
}

TEST(Thresholds, AUserChangesThem) {
  Thresholds thresholds;
  EXPECT_EQ(thresholds.change("rsrp -70 -80.5 -90 -100"), "");
  EXPECT_EQ(thresholds.verdict(LevelKind::rsrp, -75), Verdict::good);
  EXPECT_EQ(thresholds.verdict(LevelKind::rsrp, -80.6), Verdict::fair);
  EXPECT_EQ(thresholds.verdict(LevelKind::rsrq, -8), Verdict::excellent);
  EXPECT_EQ(thresholds.change("rssi -60 -70 -80 -90"), "");
  EXPECT_EQ(thresholds.verdict(LevelKind::rssi, -60), Verdict::excellent);
}

TEST(Thresholds, WhatIsWrongChangesNothing) {
  Thresholds thresholds;
  const std::string before = thresholds.text();
  EXPECT_EQ(thresholds.change("rsrx -70 -80 -90 -100"), "\"rsrx\" is no level with thresholds");
  EXPECT_EQ(thresholds.change("rsrp -70 -80 -90"), "expected four numbers: excellent, good, fair and poor");
  EXPECT_EQ(thresholds.change("rsrp -70 -80 x -100"), "\"x\" is no number");
  EXPECT_EQ(thresholds.change("rsrp -70 -80 nan -100"), "\"nan\" is no number");
  EXPECT_EQ(thresholds.change("rsrp -70 -80 -80 -100"), "each number has to be less than the one before it");
  EXPECT_EQ(thresholds.change(""), "");
  EXPECT_EQ(thresholds.change("# rsrp 1 2 3 4"), "");
  EXPECT_EQ(thresholds.text(), before);
}

TEST(Thresholds, TheirTextReadsBack) {
  Thresholds thresholds;
  ASSERT_EQ(thresholds.change("rsrq -7.5 -10 -13 -16"), "");
  const std::string text = thresholds.text();
  EXPECT_NE(text.find("rsrp -80 -90 -100 -110\nrsrq -7.5 -10 -13 -16\n"), std::string::npos);
  Thresholds others;
  for (std::size_t at = 0; at < text.size(); at = text.find('\n', at) + 1)
    EXPECT_EQ(others.change(text.substr(at, text.find('\n', at) - at)), "");
  EXPECT_EQ(others.text(), text);
}

}  // namespace
}  // namespace kelvasi::cockpit
