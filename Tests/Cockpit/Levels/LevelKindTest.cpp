// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Levels/LevelKind.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

constexpr CellIdentity gsmCell{RadioFamily::gsm, 62, 17};
constexpr CellIdentity umtsCell{RadioFamily::umts, 10663, 288};
constexpr CellIdentity tddCell{RadioFamily::utraTdd, 10079, 64};

std::vector<std::string> textsOf(const ServingCell& serving) {
  std::vector<std::string> texts;
  for (const Level& level : serving.levels)
    texts.push_back(
        std::string(level.name) + " " + level.text +
        (level.isReported() ? " " + std::string(level.unit) + " " + std::string(level.verdictWord) : ""));
  return texts;
}

TEST(LevelKind, IdsAreFoundAgain) {
  for (std::size_t at = 0; at < levelKinds; ++at) {
    const auto kind = static_cast<LevelKind>(at);
    EXPECT_EQ(definitionOf(kind).kind, kind);
    EXPECT_EQ(levelKindOf(definitionOf(kind).id), kind);
  }
  EXPECT_EQ(levelKindOf("snr"), std::nullopt);
}

TEST(Levels, OfLte) {
  Fed fed;
  fed.take(
      served(0s, cell404, -95).serving(cell404, quantity::rsrq, -12).serving(cell404, quantity::rssi, -66));
  EXPECT_EQ(textsOf(fed.at(0s).serving), (std::vector<std::string>{"RSRP -95 dBm fair", "RSRQ -12.0 dB fair",
                                                                   "SINR not reported", "RSSI -66 dBm "}));
}

TEST(Levels, OfUmts) {
  Fed fed;
  fed.take(Message(0s)
               .serving(umtsCell, quantity::scramblingCode, 288)
               .serving(umtsCell, quantity::rscp, -93)
               .serving(umtsCell, quantity::ecno, -7));
  EXPECT_EQ(textsOf(fed.at(0s).serving),
            (std::vector<std::string>{"RSCP -93 dBm fair", "Ec/No -7.0 dB good"}));
}

TEST(Levels, OfUtraTddAreCountedFromTheScale) {
  Fed fed;
  // 16 parts of 256; RSCP_LEV 16 is -100 dBm.
  Message message(0s);
  message.serving(tddCell, quantity::cellParameter, 64).level(tddCell, quantity::rscpLevel, 0.0625);
  fed.take(message);
  EXPECT_EQ(textsOf(fed.at(0s).serving), (std::vector<std::string>{"RSCP -100 dBm poor"}));
}

TEST(Levels, OfGsmAreTheNewestOfTwoScales) {
  Fed fed;
  fed.take(Message(0s).serving(gsmCell, quantity::arfcn, 62).serving(gsmCell, quantity::rxlev, 42));
  EXPECT_EQ(textsOf(fed.at(0s).serving), (std::vector<std::string>{"Level -68 dBm good"}));
  fed.take(Message(1s).serving(gsmCell, quantity::arfcn, 62).serving(gsmCell, quantity::rssi, -80));
  EXPECT_EQ(textsOf(fed.at(1s).serving), (std::vector<std::string>{"Level -80 dBm fair"}));
  // Both are in the line, as dBm.
  const Line line = fed.at(1s).serving.levels.front().line;
  EXPECT_EQ(line.points[58].maximum, -68);
  EXPECT_EQ(line.points[59].maximum, -80);
}

TEST(Levels, FadeWithTheirOwnAge) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  fed.take(Message(10s).serving(cell404, quantity::pci, 404).serving(cell404, quantity::rsrq, -7));
  const ServingCell serving = fed.at(10s).serving;
  EXPECT_EQ(serving.age.text, "live");
  EXPECT_EQ(serving.levels[0].age.text, "10 s");
  EXPECT_EQ(serving.levels[0].age.fade, Fade::faded);
  EXPECT_EQ(serving.levels[1].age.text, "live");
  EXPECT_EQ(fed.at(30s).serving.levels[0].age.text, "gone 30 s");
}

TEST(Levels, ALineKeepsItsGaps) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  fed.take(served(500ms, cell404, -91));
  fed.take(served(2s, cell404, -93));
  const Line line = fed.at(2500ms).serving.levels.front().line;
  ASSERT_EQ(line.points.size(), 60U);
  EXPECT_EQ(line.from, noon - 57s);
  EXPECT_EQ(line.to, noon + 3s);
  EXPECT_EQ(line.points[57].minimum, -95);
  EXPECT_EQ(line.points[57].maximum, -91);
  EXPECT_EQ(line.points[58].count, 0U);
  EXPECT_EQ(line.points[59].mean, -93);
}

Line lineWith(float earlier, float later) {
  Line line;
  line.points = {survey::Spread::of(earlier), {}, survey::Spread::of(later), {}};
  return line;
}

TEST(Trend, IsTheDifferenceOfTheHalves) {
  EXPECT_EQ(wordOf(trendOf(lineWith(-90, -87))), "rising");
  EXPECT_EQ(wordOf(trendOf(lineWith(-90, -88))), "steady");
  EXPECT_EQ(wordOf(trendOf(lineWith(-90, -93))), "falling");
  EXPECT_EQ(wordOf(trendOf(Line())), "");
  Line half = lineWith(-90, -90);
  half.points[2] = {};
  EXPECT_EQ(trendOf(half), Trend::unknown);
}

}  // namespace
}  // namespace kelvasi::cockpit
