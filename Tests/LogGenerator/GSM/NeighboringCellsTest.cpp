// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/NeighboringCells.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/CellList.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::cell;
using test::record;
using testing::ElementsAre;
using testing::IsEmpty;
using Section = test::SectionFixture<NeighboringCells>;

// Two neighbours: ARFCN 10 with RSSI 255 and C1 -2, ARFCN 11 with RSSI 16 and C1 74565.
constexpr auto twoNeighbours =
    "0000 00 00000000 00000000 0000 00 00 02"
    "0A00 FF FEFFFFFF 00000000000000"
    "0B00 10 45230100 00000000000000";
constexpr auto noNeighbours = "0000 00 00000000 00000000 0000 00 00 00";

PlistValue neighbourCell(PlistValue arfcn, PlistValue rssi) {
  return cell(test::gsm, test::neighbour, {{"ARFCN", arfcn}, {"RSSI", rssi}});
}

TEST(NeighboringCells, ShowsEachNeighbourWithoutAUnitAndWithC1Of32Bits) {
  auto section = Section::list();
  section.take(record(0x5137, twoNeighbours));
  EXPECT_EQ(section.text(), "[ARFCN=10\nRSSI=255\nC1 Value=-2\n][ARFCN=11\nRSSI=16\nC1 Value=74565\n]");
}

TEST(NeighboringCells, TheBsicReachesTheDisplayWithTheNextMeasurements) {
  auto section = Section::list();
  section.take(record(0x5137, twoNeighbours));
  const std::string before = section.text();
  section.take(record(0x51FF, "00 01 0B00 3F 00"));
  EXPECT_EQ(section.text(), before);
  section.take(record(0x5137, twoNeighbours));
  EXPECT_EQ(section.text(),
            "[ARFCN=10\nRSSI=255\nC1 Value=-2\n][ARFCN=11\nRSSI=16\nC1 Value=74565\nBSIC=63\n]");
}

TEST(NeighboringCells, ANeighbourThatTheBsicListLacksHasNoSuchRowAtAll) {
  auto section = Section::list();
  section.take(record(0x51FF, "00 02 0A00 01 00 0B00 02 00"));
  section.take(record(0x5137, twoNeighbours));
  EXPECT_EQ(section.text(),
            "[ARFCN=10\nRSSI=255\nC1 Value=-2\nBSIC=1\n][ARFCN=11\nRSSI=16\nC1 Value=74565\nBSIC=2\n]");
  section.take(record(0x51FF, "00 01 0A00 01 00"));
  section.take(record(0x5137, twoNeighbours));
  EXPECT_EQ(section.text(),
            "[ARFCN=10\nRSSI=255\nC1 Value=-2\nBSIC=1\n][ARFCN=11\nRSSI=16\nC1 Value=74565\n]");
}

TEST(NeighboringCells, AnEmptyBsicListForgetsTheOneBefore) {
  auto section = Section::list();
  section.take(record(0x51FF, "00 01 0A00 01 00"));
  section.take(record(0x51FF, "00 00"));
  section.take(record(0x5137, twoNeighbours));
  EXPECT_EQ(section.text(), "[ARFCN=10\nRSSI=255\nC1 Value=-2\n][ARFCN=11\nRSSI=16\nC1 Value=74565\n]");
}

TEST(NeighboringCells, ABsicListOf14BytesForgetsNothing) {
  auto section = Section::list();
  section.take(record(0x51FF, "00 01 0A00 01 00"));
  section.take(record(0x51FF, "00"));
  section.take(record(0x5137, twoNeighbours));
  EXPECT_THAT(section.text(), testing::HasSubstr("BSIC=1"));
}

TEST(NeighboringCells, OfTwoBsicsForOneArfcnTheLaterCounts) {
  auto section = Section::list();
  section.take(record(0x51FF, "00 03 0A00 01 00 0B00 02 00 0A00 FF 00"));
  section.take(record(0x5137, twoNeighbours));
  EXPECT_THAT(section.text(), testing::StartsWith("[ARFCN=10\nRSSI=255\nC1 Value=-2\nBSIC=255\n]"));
}

TEST(NeighboringCells, BsicEntriesPastTheEndStandForArfcnZero) {
  auto section = Section::list();
  section.take(record(0x51FF, "00 FF 0A00 01 00"));
  section.take(record(0x5137, "0000 00 00000000 00000000 0000 00 00 01"));
  EXPECT_EQ(section.text(), "[ARFCN=0\nRSSI=0\nC1 Value=0\nBSIC=0\n]");
}

TEST(NeighboringCells, ACountOfZeroEmptiesTheList) {
  auto section = Section::list();
  section.take(record(0x5137, twoNeighbours));
  section.take(record(0x5137, noNeighbours));
  EXPECT_EQ(section.text(), "");
}

TEST(NeighboringCells, ARecordOf28BytesLeavesTheListAsItWas) {
  auto section = Section::list();
  section.take(record(0x5137, twoNeighbours));
  const std::string before = section.text();
  section.take(record(0x5137, "0000 00 00000000 00000000 0000 00 00"));
  EXPECT_EQ(section.text(), before);
}

TEST(NeighboringCells, NeighboursPastTheEndReadAsZero) {
  auto section = Section::list();
  section.take(record(0x5137, "0000 00 00000000 00000000 0000 00 00 FF"));
  ASSERT_EQ(section.section.array()->size(), 255u);
  EXPECT_EQ(test::asText(section.section.array()->at(254)), "ARFCN=0\nRSSI=0\nC1 Value=0\n");
}

TEST(NeighboringCells, TheRssiOfTheCellListIsDoubled) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({neighbourCell(10, -50), neighbourCell(11, 2)}));
  EXPECT_EQ(section.text(), "[ARFCN=10\nRSSI=-100 dBm\n][ARFCN=11\nRSSI=4 dBm\n]");
}

TEST(NeighboringCells, AnRssiOf32767InTheCellListShowsAnEmptyText) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({neighbourCell(32767, 32767)}));
  EXPECT_EQ(section.text(), "[ARFCN=32767\nRSSI=\n]");
}

TEST(NeighboringCells, OnlyGsmNeighboursOfTheCellListAreShown) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({cell(test::gsm, test::serving, {{"ARFCN", 1}, {"RSSI", 1}}),
                                               cell(test::umts, test::neighbour, {{"ARFCN", 2}, {"RSSI", 2}}),
                                               neighbourCell(3, 3)}));
  EXPECT_EQ(section.text(), "[ARFCN=3\nRSSI=6 dBm\n]");
}

TEST(NeighboringCells, ACellWithoutNumbersIsShownEmptyAndEachIsMissed) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({neighbourCell("10", "-50"), neighbourCell(10, -50)}));
  EXPECT_EQ(section.text(), "[][ARFCN=10\nRSSI=-100 dBm\n]");
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("NeighboringCells: Failed to retrieve ARFCN\n",
                                                             "NeighboringCells: Failed to retrieve RSSI\n"));
}

TEST(NeighboringCells, TheCellListShowsNoBsic) {
  auto section = Section::list();
  section.take(record(0x51FF, "00 01 0A00 01 00"));
  section.takeList(0xFF0001, PlistArray::make({neighbourCell(10, 1)}));
  EXPECT_EQ(section.text(), "[ARFCN=10\nRSSI=2 dBm\n]");
}

TEST(NeighboringCells, AnUnreadableCellListEmptiesTheList) {
  auto section = Section::list();
  section.take(record(0x5137, twoNeighbours));
  section.take(test::textRecord(0xFF0001, "no property list"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

}  // namespace
}  // namespace kelvasi
