// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cells/CellLine.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

constexpr CellIdentity otherCarrier{RadioFamily::lte, 1575, 239};
constexpr CellIdentity gsmCell{RadioFamily::gsm, 62, 17};

using Listed = std::initializer_list<std::pair<CellIdentity, int>>;

Message listed(Arrival after, Listed cells) {
  Message message = served(after, cell404, -95);
  for (const auto& [cell, level] : cells)
    message.neighbour(cell, cell.family == RadioFamily::gsm ? quantity::rssi : quantity::rsrp, level);
  return message;
}

std::vector<std::string> shown(const Snapshot& snapshot) {
  std::vector<std::string> texts;
  for (const CellLine& cell : snapshot.cells)
    texts.push_back(cell.name + " " + cell.level.text + " " + cell.differenceText + " " + cell.age.text);
  return texts;
}

using Texts = std::vector<std::string>;

TEST(CellLines, TheServingCellIsNotAmongThem) {
  Fed fed;
  fed.take(listed(0s, {{cell404, -95}, {cell362, -90}}));
  EXPECT_EQ(shown(fed.at(0s)), Texts{"PCI 362 -90 +5 live"});
}

TEST(CellLines, OtherTechnologiesStandBelowAndAreNotCompared) {
  Fed fed;
  fed.take(listed(0s, {{gsmCell, -60}, {cell362, -110}}));
  EXPECT_EQ(shown(fed.at(0s)), (Texts{"PCI 362 -110 -15 live", "BSIC 17 -60  live"}));
}

TEST(CellLines, ACellThatNewerListsLackIsGone) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}, {cell257, -100}}));
  fed.take(listed(5s, {{cell257, -101}}));
  EXPECT_EQ(shown(fed.at(5s)), (Texts{"PCI 362 -90 +5 5 s", "PCI 257 -101 -6 live"}));
  fed.take(listed(14s, {{cell257, -100}}));
  EXPECT_EQ(shown(fed.at(14s)), (Texts{"PCI 257 -100 -5 live", "PCI 362 -90  gone 14 s"}));
}

TEST(CellLines, ListsOfOtherCarriersSayNothing) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}}));
  fed.take(listed(14s, {{otherCarrier, -100}}));
  EXPECT_EQ(shown(fed.at(14s)), (Texts{"PCI 362 -90 +5 14 s", "PCI 239 -100 -5 live"}));
}

TEST(CellLines, WithoutListsGoneAfterThirtySecondsAndForgottenAfterSixty) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}}));
  fed.take(served(29s, cell404, -95));
  EXPECT_EQ(shown(fed.at(29s)), Texts{"PCI 362 -90 +5 29 s"});
  EXPECT_EQ(shown(fed.at(30s)), Texts{"PCI 362 -90  gone 30 s"});
  EXPECT_EQ(shown(fed.at(59s)), Texts{"PCI 362 -90  gone 59 s"});
  EXPECT_EQ(shown(fed.at(60s)), Texts{});
}

TEST(CellLines, ADifferenceNeedsALevelOfNow) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}}));
  Message message(30s);
  message.neighbour(cell362, quantity::rsrp, -80);
  fed.take(message);
  EXPECT_EQ(shown(fed.at(30s)), Texts{"PCI 362 -80  live"});
}

// As the record of cells that are too weak to be measured does.
TEST(CellLines, ACellThatIsSpokenOfWithoutItsLevelHasNoLevelOfNow) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -110}}));
  for (const auto after : {12s, 40s}) {
    Message message = served(after, cell404, -95);
    message.neighbour(cell362, quantity::pci, 362);
    fed.take(message);
    EXPECT_EQ(shown(fed.at(after)),
              Texts{after == 12s ? "PCI 362 -110 -15 12 s" : "PCI 362 -110  gone 40 s"});
  }
}

TEST(CellLines, ACellWhoseLevelIsGoneStandsBehindThosePresentAndIsForgotten) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -80}}));
  for (const auto after : {40s, 60s}) {
    Message message = served(after, cell404, -95);
    message.neighbour(cell362, quantity::pci, 362).neighbour(cell257, quantity::rsrp, -100);
    fed.take(message);
    Texts lines{"PCI 257 -100 -5 live"};
    if (after == 40s) lines.emplace_back("PCI 362 -80  gone 40 s");
    EXPECT_EQ(shown(fed.at(after)), lines);
  }
}

TEST(CellLines, StayWhereTheyAreWhileHeld) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}, {cell257, -100}}));
  fed.at(0s);
  fed.cockpit.hold(true);
  fed.take(listed(10s, {{cell257, -70}}));
  EXPECT_EQ(shown(fed.at(70s)), (Texts{"PCI 362 -90  gone 1 min", "PCI 257 -70  gone 1 min"}));
  fed.cockpit.hold(false);
  EXPECT_EQ(shown(fed.at(11s)), (Texts{"PCI 257 -70 +25 live", "PCI 362 -90  gone 11 s"}));
}

TEST(CellLines, AreBounded) {
  CockpitSetUp setUp;
  setUp.mostCells = 2;
  Fed fed(std::move(setUp));
  fed.take(listed(0s, {{cell362, -110}, {cell257, -100}, {otherCarrier, -90}}));
  EXPECT_EQ(shown(fed.at(0s)), (Texts{"PCI 239 -90 +5 live", "PCI 257 -100 -5 live"}));
}

TEST(CellLines, HaveLines) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}}));
  fed.take(listed(1s, {{cell362, -88}}));
  const CellLine cell = fed.at(1s).cells.at(0);
  EXPECT_EQ(cell.level.line.points[58].mean, -90);
  EXPECT_EQ(cell.level.line.points[59].mean, -88);
  EXPECT_EQ(cell.channel, "3350");
  EXPECT_EQ(cell.bands, "B7");
  EXPECT_EQ(cell.role, CellRole::neighbour);
  EXPECT_EQ(cell.level.verdictWord, "good");
}

TEST(CarrierLines, TheServingOneFirst) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -90}, {cell257, -100}, {otherCarrier, -85}, {gsmCell, -70}}));
  const auto carriers = fed.at(0s).carriers;
  ASSERT_EQ(carriers.size(), 3U);
  EXPECT_TRUE(carriers[0].isServing);
  EXPECT_EQ(carriers[0].channelText, "3350");
  EXPECT_EQ(carriers[0].frequency, "2680 MHz");
  EXPECT_EQ(carriers[0].cells, 3U);
  EXPECT_EQ(carriers[0].bestName, "PCI 362");
  EXPECT_EQ(carriers[0].best.text, "-90");
  EXPECT_EQ(carriers[1].technology, "GSM");
  EXPECT_EQ(carriers[2].bands, "B3");
  EXPECT_FALSE(carriers[2].isServing);
}

TEST(CarrierLines, WithoutCellsThatAreGone) {
  Fed fed;
  fed.take(listed(0s, {{otherCarrier, -85}}));
  fed.take(served(30s, cell404, -95));
  EXPECT_EQ(fed.at(30s).carriers.size(), 1U);
}

}  // namespace
}  // namespace kelvasi::cockpit
