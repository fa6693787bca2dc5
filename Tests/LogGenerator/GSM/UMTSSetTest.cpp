// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

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
using Section = test::SectionFixture<UMTSSet>;

constexpr auto oneCell = "01 00 E803 2A00 9C F6FF F9 0500";
constexpr auto oneCellRows =
    "[Scrambling Code=42\nRSCP=-121 dB\nEnergy Per Chip=-3.500000 dB\n"
    "Downlink Frequency=1000\nRanking Value=5\nRank Cell RSCP=-10 dB\n]";

PlistValue measuredNeighbour() {
  return cell(test::umts, test::neighbour, {{"UARFCN", 10564}, {"SCN", 12}, {"RSCP", -95}, {"ECN0", -7}});
}

TEST(UMTSSet, ShowsTheRowsOfARankedCellInThisOrder) {
  auto section = Section::list();
  section.take(record(0x4005, oneCell));
  EXPECT_EQ(section.text(), oneCellRows);
}

TEST(UMTSSet, TheUmtsListIsReadFromByte15AlsoWhereTheGsmListIs) {
  auto section = Section::list();
  section.take(record(0x4005, "01 02 E803 2A00 9C F6FF F9 0500 11 22 33 44"));
  EXPECT_EQ(section.text(), oneCellRows);
}

TEST(UMTSSet, EverythingButTheScramblingCodeIsSigned) {
  auto section = Section::list();
  section.take(record(0x4005, "01 00 FFFF FFFF 80 0080 80 0080"));
  EXPECT_EQ(section.text(),
            "[Scrambling Code=65535\nRSCP=-149 dB\nEnergy Per Chip=-64.000000 dB\n"
            "Downlink Frequency=-1\nRanking Value=-32768\nRank Cell RSCP=-32768 dB\n]");
}

TEST(UMTSSet, TheNextEntryIsTenBytesOn) {
  auto section = Section::list();
  section.take(record(0x4005, "02 00 00000000000000000000 0100 0200 7F 0300 02 0400"));
  EXPECT_EQ(test::asText(section.section.array()->at(1)),
            "Scrambling Code=2\nRSCP=106 dB\nEnergy Per Chip=1.000000 dB\n"
            "Downlink Frequency=1\nRanking Value=4\nRank Cell RSCP=3 dB\n");
}

TEST(UMTSSet, ACountOfZeroEmptiesTheSet) {
  auto section = Section::list();
  section.take(record(0x4005, oneCell));
  section.take(record(0x4005, "00 01 E803 2A00 9C F6FF"));
  EXPECT_EQ(section.text(), "");
}

TEST(UMTSSet, ARecordOf14BytesLeavesTheSetAsItWas) {
  auto section = Section::list();
  section.take(record(0x4005, oneCell));
  section.take(record(0x4005, "00"));
  EXPECT_EQ(section.text(), oneCellRows);
}

TEST(UMTSSet, CellsPastTheEndReadAsZero) {
  auto section = Section::list();
  section.take(record(0x4005, "FF 00"));
  ASSERT_EQ(section.section.array()->size(), 255u);
  EXPECT_EQ(test::asText(section.section.array()->at(254)),
            "Scrambling Code=0\nRSCP=-21 dB\nEnergy Per Chip=0.000000 dB\n"
            "Downlink Frequency=0\nRanking Value=0\nRank Cell RSCP=0 dB\n");
}

TEST(UMTSSet, TheCellListHasItsOwnUnitAndFrequencyKey) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({measuredNeighbour()}));
  EXPECT_EQ(section.text(), "[UARFCN=10564\nScrambling Code=12\nRSCP=-95 dBm\nEnergy Per Chip=-7 dB\n]");
}

// Half dB, with the six decimals that %f gives.
TEST(UMTSSet, TheEnergyPerChipHasSixDecimals) {
  for (const auto& [halfDecibels, text] : {std::pair{"F9", "-3.500000 dB"},
                                           {"7F", "63.500000 dB"},
                                           {"01", "0.500000 dB"},
                                           {"80", "-64.000000 dB"}}) {
    auto section = Section::list();
    section.take(record(0x4005, std::string("01 00 E803 2A00 9C F6FF ") + halfDecibels + " 0500"));
    const PlistValue entry = section.section.array()->at(0);
    EXPECT_EQ(*entry.dictionary()->get("Energy Per Chip").string(), text);
  }
}

TEST(UMTSSet, MeasurementsOf32767ShowEmptyTexts) {
  auto section = Section::list();
  section.takeList(
      0xFF0001,
      PlistArray::make({cell(test::umts, test::neighbour,
                             {{"UARFCN", 32767}, {"SCN", 32767}, {"RSCP", 32767}, {"ECN0", 32767}})}));
  EXPECT_EQ(section.text(), "[UARFCN=32767\nScrambling Code=32767\nRSCP=\nEnergy Per Chip=\n]");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(UMTSSet, ACellWithoutNumbersIsShownEmptyAndEachIsMissed) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({cell(test::umts, test::neighbour, {{"RSCP", "-95"}})}));
  EXPECT_EQ(section.text(), "[]");
  EXPECT_THAT(
      section.surroundings.log.errors(),
      ElementsAre("UMTSSet: Failed to retrieve UARFCN\n", "UMTSSet: Failed to retrieve Scrambling Code\n",
                  "UMTSSet: Failed to retrieve RSCP\n", "UMTSSet: Failed to retrieve Energy Per Chip\n"));
}

TEST(UMTSSet, RowsAfterAMissingOneAreStillShown) {
  auto section = Section::list();
  section.takeList(0xFF0001,
                   PlistArray::make({cell(test::umts, test::neighbour, {{"SCN", 3}, {"ECN0", -1}})}));
  EXPECT_EQ(section.text(), "[Scrambling Code=3\nEnergy Per Chip=-1 dB\n]");
}

TEST(UMTSSet, OnlyUmtsNeighboursOfTheCellListAreShown) {
  auto section = Section::list();
  section.takeList(0xFF0001, PlistArray::make({cell(test::umts, test::serving, {{"UARFCN", 1}}),
                                               cell(test::gsm, test::neighbour, {{"UARFCN", 2}}),
                                               PlistDictionary::make({{"kTelvonCellMonitorUARFCN", 3}}),
                                               "no cell", measuredNeighbour()}));
  ASSERT_EQ(section.section.array()->size(), 1u);
  EXPECT_THAT(section.text(), testing::StartsWith("[UARFCN=10564\n"));
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(UMTSSet, ACellListWithoutNeighboursEmptiesTheSet) {
  auto section = Section::list();
  section.take(record(0x4005, oneCell));
  section.takeList(0xFF0001, PlistArray::make());
  EXPECT_EQ(section.text(), "");
}

TEST(UMTSSet, AnUnreadableCellListEmptiesTheSet) {
  auto section = Section::list();
  section.take(record(0x4005, oneCell));
  section.take(test::textRecord(0xFF0001, "no property list"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

TEST(UMTSSet, RowsOfOneRecordKindLeaveNothingInThoseOfTheOther) {
  auto section = Section::list();
  section.take(record(0x4005, oneCell));
  section.takeList(0xFF0001, PlistArray::make({measuredNeighbour()}));
  section.take(record(0x4005, oneCell));
  EXPECT_EQ(section.text(), oneCellRows);
}

TEST(UMTSSet, AnUnboundSectionMissesTheSameNumbers) {
  test::TestPlatform surroundings;
  UMTSSet decoder(surroundings.platform());
  const Bytes token =
      surroundings.plists.standFor(PlistArray::make({cell(test::umts, test::neighbour, {{"UARFCN", 1}})}));
  const Bytes bytes = test::textRecord(0xFF0001, std::string(token.begin(), token.end()));
  decoder.updateWithData(RecordView(bytes), 0xFF0001);
  EXPECT_EQ(surroundings.log.errors().size(), 3u);
}

}  // namespace
}  // namespace kelvasi
