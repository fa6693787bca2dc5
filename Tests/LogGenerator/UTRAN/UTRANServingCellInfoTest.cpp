// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Telvon/CellMonitor.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = test::SectionFixture<UTRANServingCellInfo>;

constexpr auto typical = "FF 05 06 FF 6226 5027 FEFFFFFF 03";
constexpr auto typicalRows =
    "Cell Access Restrictions=5\n"
    "URA ID=6\n"
    "Uplink UARFCN=9826\n"
    "Downlink UARFCN=10064\n"
    "Cell ID=-2\n"
    "Allowed Access=Emergency Calls Only\n";

PlistValue::Dictionary cell(std::string_view technology, std::string_view type) {
  return PlistDictionary::make(
      {{"kTelvonCellMonitorCellRadioAccessTechnology", technology}, {"kTelvonCellMonitorCellType", type}});
}
PlistValue::Dictionary bareServingCell() {
  return cell(kTelvonCellMonitorRadioAccessTechnologyUTRAN2, kTelvonCellMonitorCellTypeServing);
}
PlistValue::Dictionary servingCell(int firstNumber) {
  const auto serving = bareServingCell();
  for (const char* key : {"LAC", "CellId", "BandInfo", "SCN", "UARFCN"})
    serving->set(std::string("kTelvonCellMonitor") + key, firstNumber++);
  return serving;
}

TEST(UTRANServingCellInfo, ShowsTheServingCellInThisOrder) {
  auto section = Section::rows();
  section.take(record(0xD0E2, typical));
  EXPECT_EQ(section.text(), typicalRows);
}

TEST(UTRANServingCellInfo, OnlyBit0DeniesOrdinaryCalls) {
  for (const auto& [byte, text] :
       {std::pair{"00", "All Calls"}, std::pair{"02", "All Calls"}, std::pair{"FE", "All Calls"},
        std::pair{"01", "Emergency Calls Only"}, std::pair{"03", "Emergency Calls Only"}}) {
    auto section = Section::rows();
    section.take(record(0xD0E2, std::string("00 00 00 00 0000 0000 00000000 ") + byte));
    EXPECT_EQ(*section.section.dictionary()->get("Allowed Access").string(), text) << byte;
  }
}

TEST(UTRANServingCellInfo, ShowsTheLargestValues) {
  auto section = Section::rows();
  section.take(record(0xD0E2, "FF FF FF FF FFFF FFFF FFFFFF7F FF"));
  EXPECT_EQ(section.text(),
            "Cell Access Restrictions=255\n"
            "URA ID=255\n"
            "Uplink UARFCN=65535\n"
            "Downlink UARFCN=65535\n"
            "Cell ID=2147483647\n"
            "Allowed Access=Emergency Calls Only\n");
}

TEST(UTRANServingCellInfo, ARecordOf25BytesChangesNothing) {
  auto section = Section::rows();
  Bytes bytes = record(0xD0E2, typical);
  ASSERT_EQ(bytes.size(), 26u);
  bytes.pop_back();
  section.take(bytes);
  EXPECT_EQ(section.text(), "");
}

TEST(UTRANServingCellInfo, ShowsTheNumbersOfACellTheFrequencyTwice) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({servingCell(1)}));
  EXPECT_EQ(section.text(),
            "Local Area Code=1\n"
            "Cell ID=2\n"
            "Freq Band Indicator=3\n"
            "Cell Scrambling Code=4\n"
            "Uplink UARFCN=5\n"
            "Downlink UARFCN=5\n");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(UTRANServingCellInfo, TheLastServingCellWins) {
  auto section = Section::rows();
  section.takeList(
      0xFF0001, PlistArray::make(
                    {servingCell(1), 7, servingCell(-5),
                     cell(kTelvonCellMonitorRadioAccessTechnologyUTRAN2, kTelvonCellMonitorCellTypeNeighbor),
                     cell(kTelvonCellMonitorRadioAccessTechnologyUMTS, kTelvonCellMonitorCellTypeServing)}));
  EXPECT_EQ(section.text(),
            "Local Area Code=-5\n"
            "Cell ID=-4\n"
            "Freq Band Indicator=-3\n"
            "Cell Scrambling Code=-2\n"
            "Uplink UARFCN=-1\n"
            "Downlink UARFCN=-1\n");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(UTRANServingCellInfo, SaysOnceWhichNumbersEachCellLacksAndLeavesTheRows) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({servingCell(1), bareServingCell()}));
  EXPECT_EQ(*section.section.dictionary()->get("Downlink UARFCN").string(), "5");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Serving Cell Info: Failed to retrieve LAC\n",
                          "Serving Cell Info: Failed to retrieve Cell ID\n",
                          "Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
                          "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n",
                          "Serving Cell Info: Failed to retrieve UARFCN\n"));
}

TEST(UTRANServingCellInfo, RecordAndCellListShareRows) {
  auto section = Section::rows();
  section.take(record(0xD0E2, typical));
  section.takeList(0xFF0001, PlistArray::make({servingCell(1)}));
  EXPECT_EQ(section.text(),
            "Cell Access Restrictions=5\n"
            "URA ID=6\n"
            "Uplink UARFCN=5\n"
            "Downlink UARFCN=5\n"
            "Cell ID=2\n"
            "Allowed Access=Emergency Calls Only\n"
            "Local Area Code=1\n"
            "Freq Band Indicator=3\n"
            "Cell Scrambling Code=4\n");
}

TEST(UTRANServingCellInfo, AnEmptyListSaysNothingAndAnUnreadableOneOneLine) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make());
  section.takeList(0xFF0001, PlistDictionary::make());
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
  section.take(test::textRecord(0xFF0001, "no property list"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed"));
}

TEST(UTRANServingCellInfo, OnlyTracesACodeItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xD0E0, typical));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Serving Cell Info"));
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(UTRANServingCellInfo, WithoutASectionTheLogLinesAreTheSame) {
  test::TestPlatform surroundings;
  UTRANServingCellInfo decoder(surroundings.platform());
  const Bytes token = surroundings.plists.standFor(PlistArray::make({bareServingCell()}));
  const Bytes bytes = test::textRecord(0xFF0001, std::string(token.begin(), token.end()));
  decoder.updateWithData(RecordView(bytes), 0xFF0001);
  EXPECT_EQ(surroundings.log.errors().size(), 5u);
}

}  // namespace
}  // namespace kelvasi
