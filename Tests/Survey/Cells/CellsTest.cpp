// SPDX-License-Identifier: Apache-2.0
#include "Survey/Cells/Cells.h"

#include <gtest/gtest.h>

#include "Tests/Support/AllocationCounter.h"
#include "Tests/Survey/TypedReadings.h"

namespace kelvasi::survey {
namespace {

using namespace test;

constexpr CellIdentity here{RadioFamily::lte, 3350, 404};
constexpr CellIdentity there{RadioFamily::lte, 3350, 362};

CellIdentity gsm(std::int64_t arfcn, std::int64_t bsic = CellIdentity::unknown) {
  return {RadioFamily::gsm, arfcn, bsic};
}

// The only record of this identity.
const SeenCell& onlyCell(const Cells& cells, const CellIdentity& identity) {
  static const SeenCell none;
  const SeenCell* found = nullptr;
  for (const SeenCell& cell : cells.all()) {
    if (cell.identity != identity) continue;
    if (found) ADD_FAILURE() << textOf(identity) << " is there twice";
    found = &cell;
  }
  if (!found) ADD_FAILURE() << "there is no " << textOf(identity);
  return found ? *found : none;
}

Message named(Arrival after, const CellIdentity& cell, std::int64_t cellId, std::int64_t area = 4517) {
  Message message(after);
  message.serving(cell, quantity::earfcn, cell.channel)
      .serving(cell, quantity::pci, cell.code)
      .serving(cell, quantity::cellId, cellId)
      .serving(cell, quantity::tac, area);
  return message;
}

TEST(Cells, ACellHasItsLevels) {
  Cells cells;
  cells.take(Message(0s).serving(here, quantity::rsrp, -95).serving(here, quantity::rsrq, -8));
  cells.take(Message(1s).serving(here, quantity::rsrp, -97));
  const SeenCell& cell = onlyCell(cells, here);
  EXPECT_EQ(cell.first, noon);
  EXPECT_EQ(cell.last, noon + 1s);
  EXPECT_EQ(cell.count, 2U);
  ASSERT_EQ(cell.levels().size(), 2U);
  const CellLevel* rsrp = cell.level(quantity::rsrp);
  ASSERT_TRUE(rsrp);
  EXPECT_EQ(rsrp->minimum, -97);
  EXPECT_EQ(rsrp->maximum, -95);
  EXPECT_EQ(rsrp->mean, -96);
  EXPECT_EQ(rsrp->last, -97);
  EXPECT_EQ(rsrp->count, 2U);
  EXPECT_EQ(rsrp->lastTime, noon + 1s);
}

TEST(Cells, OneCellOverAllItsRecordsAndRoles) {
  Cells cells;
  cells.take(Message(0s).neighbour(here, quantity::rsrp, -100));
  EXPECT_EQ(onlyCell(cells, here).role, CellRole::neighbour);
  cells.take(named(1s, here, 1311));
  cells.take(Message(2s).active(here, quantity::rsrq, -10));
  const SeenCell& cell = onlyCell(cells, here);
  EXPECT_TRUE(cell.roles.has(CellRole::neighbour));
  EXPECT_TRUE(cell.roles.has(CellRole::serving));
  EXPECT_TRUE(cell.roles.has(CellRole::active));
  EXPECT_FALSE(cell.roles.has(CellRole::candidate));
  EXPECT_EQ(cell.role, CellRole::active);
  EXPECT_EQ(cell.level(quantity::rsrp)->last, -100);
  EXPECT_EQ(cell.names.cellId, 1311);
}

TEST(Cells, AMessageCountsOnceForACell) {
  Cells cells;
  cells.take(Message(0s)
                 .serving(here, quantity::rsrp, -90)
                 .serving(here, quantity::rsrq, -8)
                 .neighbour(there, quantity::rsrp, -99)
                 .neighbour(there, quantity::rsrq, -12));
  EXPECT_EQ(onlyCell(cells, here).count, 1U);
  EXPECT_EQ(onlyCell(cells, there).count, 1U);
}

TEST(Cells, TheNameOfANeighbourIsRemembered) {
  Cells cells;
  cells.take(Message(0s).neighbour(there, quantity::rsrp, -99));
  EXPECT_FALSE(onlyCell(cells, there).names.cellId);
  cells.take(named(5s, there, 1322, 4518));
  cells.take(named(60s, here, 1311, 4517));
  cells.take(Message(61s).neighbour(there, quantity::rsrp, -101));
  EXPECT_EQ(onlyCell(cells, there).names.cellId, 1322);
  EXPECT_EQ(onlyCell(cells, there).names.area, 4518);
  EXPECT_EQ(onlyCell(cells, there).level(quantity::rsrp)->count, 2U);
}

// Far down the road another cell has the same channel and code.
TEST(Cells, ACellUnderAnotherNameIsAnotherCell) {
  Cells cells;
  cells.take(named(0s, here, 1311));
  cells.take(Message(1s).serving(here, quantity::rsrp, -80));
  cells.take(named(3600s, here, 9999));
  cells.take(Message(3601s).serving(here, quantity::rsrp, -120));
  ASSERT_EQ(cells.all().size(), 2U);
  EXPECT_EQ(cells.all()[0].names.cellId, 1311);
  EXPECT_EQ(cells.all()[0].level(quantity::rsrp)->minimum, -80);
  EXPECT_EQ(cells.all()[1].names.cellId, 9999);
  EXPECT_EQ(cells.all()[1].level(quantity::rsrp)->maximum, -120);
  EXPECT_EQ(cells.serving(), &cells.all()[1]);
}

TEST(Cells, TheValueOfTheMessageThatBringsTheOtherNameIsTheOtherCells) {
  Cells cells;
  cells.take(named(0s, here, 1311));
  cells.take(named(3600s, here, 9999).serving(here, quantity::rsrp, -120));
  ASSERT_EQ(cells.all().size(), 2U);
  EXPECT_EQ(cells.all()[0].level(quantity::rsrp), nullptr);
  EXPECT_EQ(cells.all()[1].level(quantity::rsrp)->last, -120);
}

TEST(Cells, NetworkAndAreaComeFromTheMessageThatNamesTheCell) {
  Cells cells;
  cells.take(Message(0s).plain(quantity::mcc, 999).plain(quantity::mnc, 1).plain(quantity::lac, 4101));
  cells.take(Message(1s)
                 .serving(gsm(62, 12), quantity::arfcn, 62)
                 .serving(gsm(62, 12), quantity::bsic, 12)
                 .serving(gsm(62, 12), quantity::cellId, 21013));
  EXPECT_FALSE(onlyCell(cells, gsm(62, 12)).names.mcc);  // of whom the first message spoke nobody knows
  cells.take(Message(2s)
                 .serving(gsm(62, 12), quantity::arfcn, 62)
                 .plain(quantity::mcc, 999)
                 .plain(quantity::mnc, 2)
                 .plain(quantity::lac, 517));
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).names.mcc, 999);
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).names.mnc, 2);
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).names.area, 517);
}

TEST(Cells, TheNetworksOfAListAreNotTheCells) {
  Cells cells;
  Message message(0s);
  message.serving(here, quantity::pci, 404).neighbour({}, quantity::mcc, 310).neighbour({}, quantity::mnc, 4);
  cells.take(message);
  EXPECT_FALSE(onlyCell(cells, here).names.mcc);
}

TEST(Cells, AnArfcnWithoutABsicIsTheOneCellThatItCanBe) {
  Cells cells;
  cells.take(Message(0s).neighbour(gsm(62, 12), quantity::rssi, -70));
  cells.take(Message(9s).neighbour(gsm(62), quantity::rssi, -72));
  EXPECT_EQ(cells.all().size(), 1U);
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).level(quantity::rssi)->count, 2U);
}

TEST(Cells, AnArfcnThatMayBeTwoCellsIsNeither) {
  Cells cells;
  cells.take(Message(0s).neighbour(gsm(62, 12), quantity::rssi, -70));
  cells.take(Message(1s).neighbour(gsm(62, 13), quantity::rssi, -90));
  cells.take(Message(2s).neighbour(gsm(62), quantity::rssi, -80));
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).level(quantity::rssi)->count, 1U);
  EXPECT_EQ(onlyCell(cells, gsm(62, 13)).level(quantity::rssi)->count, 1U);
  EXPECT_EQ(onlyCell(cells, gsm(62)).level(quantity::rssi)->last, -80);
}

TEST(Cells, AnArfcnOfLongAgoIsNoCellOfToday) {
  Cells cells;
  cells.take(Message(0s).neighbour(gsm(62, 12), quantity::rssi, -70));
  cells.take(Message(11s).neighbour(gsm(62), quantity::rssi, -80));
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).level(quantity::rssi)->count, 1U);
  EXPECT_EQ(onlyCell(cells, gsm(62)).level(quantity::rssi)->count, 1U);
}

TEST(Cells, AnArfcnGetsItsBsicWhileItIsYoung) {
  Cells cells;
  cells.take(Message(0s).neighbour(gsm(62), quantity::rssi, -80));
  cells.take(Message(2s).neighbour(gsm(62, 12), quantity::rssi, -82));
  EXPECT_EQ(cells.all().size(), 1U);
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).level(quantity::rssi)->count, 2U);
}

// What was heard on the channel for so long may have been several cells.
TEST(Cells, AnOldArfcnKeepsToItself) {
  Cells cells;
  for (int second = 0; second < 20; ++second)
    cells.take(Message(second * 1s).neighbour(gsm(62), quantity::rssi, -80));
  cells.take(Message(20s).neighbour(gsm(62, 12), quantity::rssi, -82));
  EXPECT_EQ(onlyCell(cells, gsm(62)).level(quantity::rssi)->count, 20U);
  EXPECT_EQ(onlyCell(cells, gsm(62, 12)).level(quantity::rssi)->count, 1U);
}

TEST(Cells, TechnologiesDoNotMix) {
  Cells cells;
  const CellIdentity umts{RadioFamily::umts, 62, 12};
  cells.take(Message(0s).neighbour(gsm(62, 12), quantity::rssi, -70).neighbour(umts, quantity::rscp, -90));
  EXPECT_EQ(cells.all().size(), 2U);
  EXPECT_EQ(onlyCell(cells, umts).level(quantity::rssi), nullptr);
}

TEST(Cells, TheServingCellInAListOfNeighboursServes) {
  Cells cells;
  cells.take(named(0s, here, 1311));
  cells.take(Message(1s).neighbour(here, quantity::rsrp, -80));
  EXPECT_EQ(onlyCell(cells, here).role, CellRole::serving);
  EXPECT_FALSE(onlyCell(cells, here).roles.has(CellRole::neighbour));
}

TEST(Cells, EachChangeOfTheServingCellIsToldOnce) {
  std::vector<std::string> changes;
  Cells cells({}, [&](const SeenCell* from, const SeenCell& to, Arrival) {
    changes.push_back((from ? textOf(from->identity) : "nothing") + " to " + textOf(to.identity));
  });
  cells.take(named(0s, here, 1));
  cells.take(named(1s, here, 1));
  cells.take(Message(2s).neighbour(there, quantity::rsrp, -99));
  cells.take(named(3s, there, 2));
  cells.take(named(4s, here, 1));
  EXPECT_EQ(changes, (std::vector<std::string>{"nothing to lte:3350/404", "lte:3350/404 to lte:3350/362",
                                               "lte:3350/362 to lte:3350/404"}));
  EXPECT_EQ(cells.servingTime(), noon + 4s);
}

// Each air interface of a CDMA handset has a cell of its own.
TEST(Cells, TwoAirInterfacesServeSideBySide) {
  int changes = 0;
  Cells cells({}, [&](const SeenCell*, const SeenCell&, Arrival) { ++changes; });
  const CellIdentity voice{RadioFamily::cdma, 384, 12};
  const CellIdentity data{RadioFamily::evdo, 507, 24};
  for (int second = 0; second < 10; second += 2) {
    cells.take(Message(second * 1s).serving(voice, quantity::cdmaChannel, 384));
    cells.take(Message((second + 1) * 1s).serving(data, quantity::pnOffset, 24));
  }
  EXPECT_EQ(changes, 2);  // the first of each
  EXPECT_TRUE(cells.isServing(onlyCell(cells, voice)));
  EXPECT_TRUE(cells.isServing(onlyCell(cells, data)));
  EXPECT_EQ(cells.serving()->identity, data);
  cells.take(Message(20s).serving({RadioFamily::cdma, 384, 36}, quantity::pnOffset, 36));
  EXPECT_EQ(changes, 3);
  EXPECT_FALSE(cells.isServing(onlyCell(cells, voice)));
  EXPECT_TRUE(cells.isServing(onlyCell(cells, data)));
}

// The number of a CDMA channel does not tell it.
TEST(Cells, ACdmaCellHasTheBandClassThatRecordsSayOfItsChannel) {
  Cells cells;
  const CellIdentity voice{RadioFamily::cdma, 384, 12};
  const CellIdentity elsewhere{RadioFamily::cdma, 507, 12};
  cells.take(Message(0s).serving(voice, quantity::cdmaChannel, 384));
  EXPECT_EQ(onlyCell(cells, voice).bandClass, std::nullopt);
  cells.take(Message(1s).plain(quantity::bandClass, 1).plain(quantity::cdmaChannel, 384));
  cells.take(Message(2s).serving(voice, quantity::cdmaChannel, 384));
  cells.take(Message(3s).serving(elsewhere, quantity::cdmaChannel, 507));
  EXPECT_EQ(onlyCell(cells, voice).bandClass, 1);
  EXPECT_EQ(onlyCell(cells, elsewhere).bandClass, std::nullopt);
  Cells merged;
  merged.merge(cells);
  EXPECT_EQ(onlyCell(merged, voice).bandClass, 1);
}

// Not only where they stand in a list.
TEST(Cells, WhatNeighboursAreCalledIsNoNameOfTheServingCell) {
  const ReadingSection others{.name = "Others", .path = "/Others", .role = CellRole::neighbour};
  const Row row{.key = "Cell ID", .quantity = quantity::cellId};
  Message message(0s);
  message.serving(here, quantity::earfcn, here.channel).serving(here, quantity::cellId, 7);
  Readings readings = message;
  readings.add({.section = &others, .row = &row, .raw = 99, .key = row.key, .cell = there});
  Cells cells;
  cells.take(readings);
  EXPECT_EQ(onlyCell(cells, here).names.cellId, 7);
}

// Many kinds of record have a serving section; only one that names the cell says where the handset is.
TEST(Cells, AStateOfTheOldCellIsNoWayBack) {
  Cells cells;
  cells.take(Message(0s).serving(gsm(62, 12), quantity::arfcn, 62));
  const CellIdentity umts{RadioFamily::umts, 10700, 48};
  cells.take(Message(1s).serving(umts, quantity::uarfcn, 10700));
  cells.take(Message(2s).serving(gsm(62, 12), quantity::rrState, 5));
  ASSERT_TRUE(cells.serving());
  EXPECT_EQ(cells.serving()->identity, umts);
}

TEST(Cells, MoreOfAnIdentityIsNoChange) {
  int changes = 0;
  Cells cells({}, [&](const SeenCell*, const SeenCell&, Arrival) { ++changes; });
  cells.take(Message(0s).serving(gsm(62), quantity::arfcn, 62).serving(gsm(62), quantity::cellId, 7));
  cells.take(Message(1s).serving(gsm(62, 12), quantity::arfcn, 62).serving(gsm(62, 12), quantity::cellId, 7));
  cells.take(Message(2s).serving(gsm(62), quantity::arfcn, 62).serving(gsm(62), quantity::cellId, 7));
  EXPECT_EQ(changes, 1);
  EXPECT_EQ(cells.serving()->identity, gsm(62, 12));
}

TEST(Cells, ValuesGoOnWithTheirCell) {
  std::vector<std::string> measured;
  Cells cells([&](const SeenCell* cell, const Reading& reading, double value) {
    measured.push_back((cell ? textOf(cell->identity) : "none") + " " + std::string(quantityOf(reading)->id) +
                       " " + std::to_string(static_cast<int>(value)));
  });
  cells.take(Message(0s)
                 .serving(here, quantity::earfcn, 3350)
                 .serving(here, quantity::rsrp, -90)
                 .neighbour(there, quantity::rsrp, -99)
                 .plain(quantity::txPower, 12));
  EXPECT_EQ(measured,
            (std::vector<std::string>{"lte:3350/404 rsrp -90", "lte:3350/362 rsrp -99", "none tx_power 12"}));
}

TEST(Cells, ThatWhichWasHeardOfLongestAgoMakesWay) {
  Cells cells({}, {}, 3);
  for (std::int64_t code = 0; code < 3; ++code)
    cells.take(Message(code * 1s).neighbour({RadioFamily::lte, 100, code}, quantity::rsrp, -90));
  cells.take(Message(3s).neighbour({RadioFamily::lte, 100, 0}, quantity::rsrp, -90));
  cells.take(Message(4s).neighbour({RadioFamily::lte, 100, 9}, quantity::rsrp, -91));
  EXPECT_EQ(cells.all().size(), 3U);
  EXPECT_EQ(cells.dropped(), 1U);
  EXPECT_EQ(onlyCell(cells, {RadioFamily::lte, 100, 0}).count, 2U);
  EXPECT_EQ(onlyCell(cells, {RadioFamily::lte, 100, 9}).level(quantity::rsrp)->count, 1U);
  cells.take(Message(5s).neighbour({RadioFamily::lte, 100, 1}, quantity::rsrp, -92));
  EXPECT_EQ(onlyCell(cells, {RadioFamily::lte, 100, 1}).level(quantity::rsrp)->count, 1U);
}

TEST(Cells, AServingCellThatMadeWayServesNoMore) {
  Cells cells({}, {}, 1);
  cells.take(named(0s, here, 1));
  cells.take(Message(1s).neighbour(there, quantity::rsrp, -90));
  EXPECT_EQ(cells.serving(), nullptr);
}

TEST(Cells, TakesNoMemoryForACellThatItKnows) {
  Cells cells;
  const Message first = named(0s, here, 1311);
  const Message second(Message(1s).neighbour(there, quantity::rsrp, -90));
  cells.take(first);
  cells.take(second);
  EXPECT_EQ(test::allocationsDuring([&] {
              cells.take(first);
              cells.take(second);
            }),
            0U);
}

TEST(Cells, MergedDrivesShareTheirCells) {
  Cells one;
  Cells other;
  one.take(named(0s, here, 1311).serving(here, quantity::rsrp, -80));
  other.take(named(100s, here, 1311).serving(here, quantity::rsrp, -100));
  other.take(named(101s, there, 1322).serving(there, quantity::rsrp, -70));
  std::vector<std::pair<std::uint32_t, std::uint32_t>> numbers;
  one.merge(other, [&](std::uint32_t from, std::uint32_t to) { numbers.emplace_back(from, to); });
  const SeenCell& cell = onlyCell(one, here);
  EXPECT_EQ(cell.count, 2U);
  EXPECT_EQ(cell.first, noon);
  EXPECT_EQ(cell.last, noon + 100s);
  EXPECT_EQ(cell.level(quantity::rsrp)->mean, -90);
  EXPECT_EQ(cell.level(quantity::rsrp)->last, -100);
  EXPECT_EQ(onlyCell(one, there).names.cellId, 1322);
  EXPECT_EQ(numbers, (std::vector<std::pair<std::uint32_t, std::uint32_t>>{{1, 1}, {2, 2}}));
  EXPECT_EQ(one.serving()->identity, there);
}

TEST(Cells, MergedDrivesKeepCellsOfOtherNamesApart) {
  Cells one;
  Cells other;
  one.take(named(0s, here, 1311));
  other.take(named(100s, here, 2000));
  one.merge(other);
  EXPECT_EQ(one.all().size(), 2U);
}

}  // namespace
}  // namespace kelvasi::survey
