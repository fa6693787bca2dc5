// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/UMTSRRInfo.h"

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
using Section = test::SectionFixture<UMTSRRInfo>;

// Uplink 9612, downlink 10562, cell 0x0000ABCD, URA 0x1234.
constexpr auto servingCell = "8C250000 42290000 CDAB0000 3412 0000";
constexpr auto servingCellRows =
    "Cell ID=43981\nDownlink Frequency=10562\nUplink Frequency=9612\nURA ID=4660\n";

PlistValue cellList() {
  return PlistArray::make(
      {cell(test::umts, test::serving, {{"CellId", 43981}, {"UARFCN", 10562}, {"SCN", 97}})});
}

// A sample of 14 bytes.
std::string sample(const std::string& agc) {
  return "FFFFFFFF " + agc + " FFFFFFFFFFFFFFFF ";
}

std::string powerOf(const std::string& payload) {
  auto section = Section::rows();
  section.take(record(0x4031, payload));
  return section.text();
}

TEST(UMTSRRInfo, ShowsTheRrcStateUpToTheEndOfItsTable) {
  const char* states[] = {"Disconnected", "Connecting", "CELL_FACH", "CELL_DCH",
                          "CELL_PCH",     "URA_PCH",    "Unknown"};
  for (int state = 0; state < 7; ++state) {
    auto section = Section::rows();
    section.take(record(0x4125, "0" + std::to_string(state)));
    EXPECT_EQ(section.text(), std::string("RRC State=") + states[state] + "\n");
  }
  auto section = Section::rows();
  section.take(record(0x4125, "FF"));
  EXPECT_EQ(section.text(), "RRC State=Unknown\n");
}

TEST(UMTSRRInfo, AnRrcRecordOf13BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x4125, ""));
  EXPECT_EQ(section.text(), "");
}

TEST(UMTSRRInfo, TheTransmitPowerIsTheMeanOfTheSamplesThatAreNotZero) {
  EXPECT_EQ(powerOf("00 03 00" + sample("6400") + sample("0000") + sample("0800")),  // 100, none, 8
            "Transmit Power=-13.50 dBm\n");
}

TEST(UMTSRRInfo, EachSampleTruncatesTowardZeroBeforeTheMean) {
  EXPECT_EQ(powerOf("00 01 00" + sample("6D00")), "Transmit Power=-8.00 dBm\n");   // 109: 62.1 - 70
  EXPECT_EQ(powerOf("00 01 00" + sample("F5FD")), "Transmit Power=-71.00 dBm\n");  // -523: -1.1 - 70
  EXPECT_EQ(powerOf("00 02 00" + sample("6D00") + sample("6400")), "Transmit Power=-8.50 dBm\n");
}

TEST(UMTSRRInfo, APowerOfOneDigitIsNotPadded) {
  EXPECT_EQ(powerOf("00 01 00" + sample("BC00")), "Transmit Power=0.00 dBm\n");  // 188: 70 - 70
}

TEST(UMTSRRInfo, WithoutASampleTheTransmitPowerIsNotANumber) {
  EXPECT_EQ(powerOf("00 02 00" + sample("0000") + sample("0000")), "Transmit Power= nan dBm\n");
  EXPECT_EQ(powerOf("00 00 00"), "Transmit Power= nan dBm\n");
}

TEST(UMTSRRInfo, SamplesPastTheEndAreNone) {
  EXPECT_EQ(powerOf("00 FF 00" + sample("6400")), "Transmit Power=-9.00 dBm\n");
}

TEST(UMTSRRInfo, APowerRecordOf15BytesChangesNothing) {
  EXPECT_EQ(powerOf("00 01"), "");
}

TEST(UMTSRRInfo, ShowsTheServingCellInThisOrder) {
  auto section = Section::rows();
  section.take(record(0x4127, servingCell));
  EXPECT_EQ(section.text(), servingCellRows);
}

TEST(UMTSRRInfo, NumbersPast31BitsShowNegative) {
  auto section = Section::rows();
  section.take(record(0x4127, "FFFFFFFF 00000080 FEFFFFFF FFFF 0000"));
  EXPECT_EQ(section.text(),
            "Cell ID=-2\nDownlink Frequency=-2147483648\nUplink Frequency=-1\nURA ID=65535\n");
}

TEST(UMTSRRInfo, AServingCellRecordOf28BytesRemovesNothingEither) {
  auto section = Section::rows();
  section.takeList(0xFF0001, cellList());
  const std::string before = section.text();
  section.take(record(0x4127, "8C250000 42290000 CDAB0000 3412 00"));
  EXPECT_EQ(section.text(), before);
}

TEST(UMTSRRInfo, TheServingCellRecordRemovesTheUarfcnAndTheCellListPutsItBack) {
  auto section = Section::rows();
  section.takeList(0xFF0001, cellList());
  EXPECT_EQ(section.text(), "Cell ID=43981\nUARFCN=10562\nScrambling Code=97\n");
  section.take(record(0x4127, servingCell));
  EXPECT_EQ(
      section.text(),
      "Cell ID=43981\nScrambling Code=97\nDownlink Frequency=10562\nUplink Frequency=9612\nURA ID=4660\n");
  section.takeList(0xFF0001, cellList());
  EXPECT_EQ(
      section.text(),
      "Cell ID=43981\nScrambling Code=97\nDownlink Frequency=10562\nUplink Frequency=9612\nURA ID=4660\n"
      "UARFCN=10562\n");
}

TEST(UMTSRRInfo, ShowsWhetherCipheringIsOn) {
  auto section = Section::rows();
  section.take(record(0x4157, "01", 19));
  EXPECT_EQ(section.text(), "Ciphering=Enabled\n");
  section.take(record(0x4157, "00", 19));
  EXPECT_EQ(section.text(), "Ciphering=Disabled\n");
  section.take(record(0x4157, "FF", 19));
  EXPECT_EQ(section.text(), "Ciphering=Enabled\n");
}

TEST(UMTSRRInfo, ACipheringRecordOf18BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x4157, "01", 18));
  EXPECT_EQ(section.text(), "");
}

TEST(UMTSRRInfo, TheFirstServingUmtsCellOfTheListIsShown) {
  auto section = Section::rows();
  const auto numbered = [](std::string_view technology, std::string_view type, int number) {
    return cell(technology, type, {{"CellId", number}, {"UARFCN", number}, {"SCN", number}});
  };
  section.takeList(0xFF0001, PlistArray::make({numbered(test::gsm, test::serving, 1),
                                               numbered(test::umts, test::neighbour, 2), "no cell",
                                               numbered(test::umts, test::serving, 3),
                                               numbered(test::umts, test::serving, 4)}));
  EXPECT_EQ(section.text(), "Cell ID=3\nUARFCN=3\nScrambling Code=3\n");
}

TEST(UMTSRRInfo, MissingNumbersAreMissedOneByOne) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({cell(test::umts, test::serving, {{"CellId", "1"}})}));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(
      section.surroundings.log.errors(),
      ElementsAre("UMTSRRInfo: Failed to retrieve Cell ID\n", "UMTSRRInfo: Failed to retrieve UARFCN\n",
                  "UMTSRRInfo: Failed to retrieve Scrambling Code\n"));
}

TEST(UMTSRRInfo, ACellListWithoutAServingUmtsCellChangesAndSaysNothing) {
  auto section = Section::rows();
  section.takeList(0xFF0001, cellList());
  section.takeList(0xFF0001, PlistArray::make());
  section.takeList(0xFF0001, PlistArray::make({cell(test::gsm, test::serving)}));
  EXPECT_EQ(section.text(), "Cell ID=43981\nUARFCN=10562\nScrambling Code=97\n");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(UMTSRRInfo, AnUnreadableCellListChangesNothing) {
  auto section = Section::rows();
  section.takeList(0xFF0001, cellList());
  section.take(test::textRecord(0xFF0001, "no property list"));
  EXPECT_EQ(section.text(), "Cell ID=43981\nUARFCN=10562\nScrambling Code=97\n");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

TEST(UMTSRRInfo, RowsThatARecordDoesNotCarryStay) {
  auto section = Section::rows();
  section.take(record(0x4125, "03"));
  section.take(record(0x4127, servingCell));
  EXPECT_EQ(section.text(), std::string("RRC State=CELL_DCH\n") + servingCellRows);
}

}  // namespace
}  // namespace kelvasi
