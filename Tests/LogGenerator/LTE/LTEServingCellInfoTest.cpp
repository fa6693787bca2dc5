// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTEServingCellInfo.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>

#include "Telvon/CellMonitor.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = test::SectionFixture<LTEServingCellInfo>;

// Identity 301, frequencies 6300 and 24300, bandwidths 50 and 7, cell 0x0A0B0C0D, area 0x1234, band 20.
constexpr auto servingCell = "00 2D01 9C18 EC5E 32 07 0D0C0B0A 3412 14000000 00000000 0000";
constexpr auto servingCellRows =
    "Physical Cell ID=301\n"
    "Download Frequency=6300\n"
    "Upload Frequency=24300\n"
    "Download Bandwidth=10 MHz\n"
    "Upload Bandwidth=Unknown\n"
    "Cell Identity=168496141\n"
    "Tracking Area Code=4660\n"
    "Freq Band Indicator=20\n";

PlistValue::Dictionary cell(std::string_view technology, std::string_view type) {
  return PlistDictionary::make(
      {{"kTelvonCellMonitorCellRadioAccessTechnology", technology}, {"kTelvonCellMonitorCellType", type}});
}
PlistValue::Dictionary servingLteCell(int firstNumber) {
  const auto serving = cell(kTelvonCellMonitorRadioAccessTechnologyLTE, kTelvonCellMonitorCellTypeServing);
  for (const char* key : {"TAC", "CellId", "PID", "BandInfo", "UARFCN"})
    serving->set(std::string("kTelvonCellMonitor") + key, firstNumber++);
  return serving;
}

TEST(LTEServingCellInfo, ShowsTheAntennasAndCallsTheirRecordUnknownAllTheSame) {
  auto section = Section::rows();
  section.take(record(0xB0C1, "00000000000000 04", 22));
  EXPECT_EQ(section.text(), "Num Tx Antennas=4\n");
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45249"));
  section.take(record(0xB0C1, "00000000000000 FF", 22));
  EXPECT_EQ(section.text(), "Num Tx Antennas=255\n");
  EXPECT_EQ(section.surroundings.log.errors().size(), 2u);
}

TEST(LTEServingCellInfo, AnAntennaRecordOf21BytesChangesAndSaysNothing) {
  auto section = Section::rows();
  section.take(record(0xB0C1, "00000000000000 04"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(LTEServingCellInfo, ShowsTheServingCellInThisOrder) {
  auto section = Section::rows();
  section.take(record(0xB0C2, servingCell));
  EXPECT_EQ(section.text(), servingCellRows);
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(LTEServingCellInfo, AServingCellRecordOf37BytesChangesNothing) {
  auto section = Section::rows();
  section.section.dictionary()->set("UARFCN", "stays");
  Bytes bytes = record(0xB0C2, servingCell);
  ASSERT_EQ(bytes.size(), 38u);
  bytes.pop_back();
  section.take(bytes);
  EXPECT_EQ(section.text(), "UARFCN=stays\n");
}

TEST(LTEServingCellInfo, ShowsTheLargestValues) {
  auto section = Section::rows();
  section.take(record(0xB0C2, "FF FFFF FFFF FFFF FF 06 FFFFFFFF FFFF FFFFFFFF FFFFFFFF FFFF"));
  EXPECT_EQ(section.text(),
            "Physical Cell ID=65535\n"
            "Download Frequency=65535\n"
            "Upload Frequency=65535\n"
            "Download Bandwidth=Unknown\n"
            "Upload Bandwidth=1.4 MHz\n"
            "Cell Identity=-1\n"
            "Tracking Area Code=65535\n"
            "Freq Band Indicator=-1\n");
}

TEST(LTEServingCellInfo, KnowsSixBandwidths) {
  const std::map<unsigned, std::string> known{{6, "1.4 MHz"}, {15, "3 MHz"},  {25, "5 MHz"},
                                              {50, "10 MHz"}, {75, "15 MHz"}, {100, "20 MHz"}};
  for (unsigned blocks = 0; blocks < 256; ++blocks) {
    auto section = Section::rows();
    Bytes bytes = record(0xB0C2, servingCell);
    bytes[20] = bytes[21] = static_cast<std::uint8_t>(blocks);
    section.take(bytes);
    const auto text = known.contains(blocks) ? known.at(blocks) : "Unknown";
    EXPECT_EQ(*section.section.dictionary()->get("Download Bandwidth").string(), text);
    EXPECT_EQ(*section.section.dictionary()->get("Upload Bandwidth").string(), text);
  }
}

TEST(LTEServingCellInfo, ShowsTheFirstServingLteCellOfTheCellList) {
  auto section = Section::rows();
  section.takeList(
      0xFF0001,
      PlistArray::make({"no cell",
                        cell(kTelvonCellMonitorRadioAccessTechnologyLTE, kTelvonCellMonitorCellTypeNeighbor),
                        cell(kTelvonCellMonitorRadioAccessTechnologyGSM, kTelvonCellMonitorCellTypeServing),
                        servingLteCell(1), servingLteCell(100)}));
  EXPECT_EQ(section.text(),
            "Tracking Area Code=1\n"
            "Cell Identity=2\n"
            "Physical Cell ID=3\n"
            "Freq Band Indicator=4\n"
            "UARFCN=5\n");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(LTEServingCellInfo, SaysWhichNumbersACellLacks) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({cell(kTelvonCellMonitorRadioAccessTechnologyLTE,
                                                    kTelvonCellMonitorCellTypeServing)}));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Serving Cell Info: Failed to retrieve TAC\n",
                          "Serving Cell Info: Failed to retrieve Cell ID\n",
                          "Serving Cell Info: Failed to retrieve Physical Cell ID\n",
                          "Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
                          "Serving Cell Info: Failed to retrieve UARFCN\n"));
}

TEST(LTEServingCellInfo, LeavesTheRowOfANumberThatIsNone) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({servingLteCell(1)}));
  const auto odd = servingLteCell(11);
  odd->set("kTelvonCellMonitorPID", "a text");
  section.takeList(0xFF0001, PlistArray::make({odd}));
  EXPECT_EQ(section.text(),
            "Tracking Area Code=11\n"
            "Cell Identity=12\n"
            "Physical Cell ID=3\n"
            "Freq Band Indicator=14\n"
            "UARFCN=15\n");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Serving Cell Info: Failed to retrieve Physical Cell ID\n"));
}

TEST(LTEServingCellInfo, TheFrequenciesOfRecordAndCellListAlternate) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({servingLteCell(1)}));
  section.take(record(0xB0C2, servingCell));
  EXPECT_EQ(section.text(),
            "Tracking Area Code=4660\n"
            "Cell Identity=168496141\n"
            "Physical Cell ID=301\n"
            "Freq Band Indicator=20\n"
            "Download Frequency=6300\n"
            "Upload Frequency=24300\n"
            "Download Bandwidth=10 MHz\n"
            "Upload Bandwidth=Unknown\n");
  section.takeList(0xFF0001, PlistArray::make({servingLteCell(1)}));
  EXPECT_EQ(*section.section.dictionary()->get("UARFCN").string(), "5");
  EXPECT_EQ(*section.section.dictionary()->get("Download Frequency").string(), "6300");
}

TEST(LTEServingCellInfo, ACellListThatIsNoPropertyListIsReported) {
  auto section = Section::rows();
  section.take(test::textRecord(0xFF0001, "no property list"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

TEST(LTEServingCellInfo, ACellListOfAnotherKindIsNot) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistDictionary::make());
  section.takeList(0xFF0001, PlistArray::make());
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(LTEServingCellInfo, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xB17F, "00", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("LTE Serving Cell Info"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45439"));
}

TEST(LTEServingCellInfo, WithoutASectionTheLogLinesAreTheSame) {
  test::TestPlatform surroundings;
  LTEServingCellInfo decoder(surroundings.platform());
  const Bytes antennas = record(0xB0C1, "", 22);
  const Bytes serving = record(0xB0C2, servingCell);
  decoder.updateWithData(RecordView(antennas), 0xB0C1);
  decoder.updateWithData(RecordView(serving), 0xB0C2);
  EXPECT_THAT(surroundings.log.errors(), ElementsAre("Received an unknown log message: 45249"));
}

}  // namespace
}  // namespace kelvasi
