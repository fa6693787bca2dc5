// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/NeighborCellsList.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "LogGenerator/LTE/LTETables.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = test::SectionFixture<NeighborCellsList>;

constexpr auto oneCell = "04 000000 9C18 0A00  2D414101 A1A0D116 E8FD0000 DC059F24 00000000";
constexpr auto oneCellText =
    "[Physical Cell ID=301\n"
    "Measured RSSI=-60.00 dBm\n"
    "Measured RSRP=-60.00 dBm\n"
    "Average RSRP=-59.50 dBm\n"
    "Measured RSRQ=-10.00 dB\n"
    "Average RSRQ=-9.75 dB\n"
    "Srxlev=15 dBm\n"
    "Frequency Offset=65000\n"
    "Ant 0 Frame Offset=1500\n"
    "Ant 0 Sample Offset=300000\n"
    "Ant 1 Frame Offset=1500\n"
    "Ant 1 Sample Offset=300000\n]";
constexpr auto emptyCellText =
    "[Physical Cell ID=0\n"
    "Measured RSSI=-140.00 dBm\n"
    "Measured RSRP=-140.00 dBm\n"
    "Average RSRP=-140.00 dBm\n"
    "Measured RSRQ=-30.00 dB\n"
    "Average RSRQ=-30.00 dB\n"
    "Srxlev=-30 dBm\n"
    "Frequency Offset=0\n"
    "Ant 0 Frame Offset=0\n"
    "Ant 0 Sample Offset=0\n"
    "Ant 1 Frame Offset=0\n"
    "Ant 1 Sample Offset=0\n]";

TEST(NeighborCellsList, ShowsEachCellInThisOrderBothAntennasAlike) {
  auto section = Section::list();
  section.take(record(0xB180, oneCell));
  EXPECT_EQ(section.text(), oneCellText);
}

TEST(NeighborCellsList, CountsRsrpInHalvesWhereMeasuredNeighborCellsCountInQuarters) {
  auto section = Section::list();
  section.take(record(0xB180, "04 000000 9C18 0A00  00004001 A0000000", 41));
  const PlistDictionary& cell = *section.section.array()->at(0).dictionary();
  EXPECT_EQ(*cell.get("Measured RSRP").string(), "-60.00 dBm");
  EXPECT_EQ(*cell.get("Average RSRP").string(), "-60.00 dBm");
  auto measured = test::SectionFixture<MeasuredNeighborCells>::list();
  measured.take(record(0xB179, "00000000 0000 0000 0000 0000 0000 01 00  0000 A000 0000"));
  EXPECT_EQ(*measured.section.array()->at(0).dictionary()->get("Filtered RSRP").string(), "-100.00 dBm");
}

TEST(NeighborCellsList, ShowsTheLargestValues) {
  auto section = Section::list();
  section.take(record(0xB180, "00 000000 0000 0000  FFFFFF03 FFFFFF3F FFFF0000 FFFFFF3F 00000000"));
  EXPECT_EQ(section.text(),
            "[Physical Cell ID=511\n"
            "Measured RSSI=-12.50 dBm\n"
            "Measured RSRP=115.50 dBm\n"
            "Average RSRP=115.50 dBm\n"
            "Measured RSRQ=1.75 dB\n"
            "Average RSRQ=1.75 dB\n"
            "Srxlev=97 dBm\n"
            "Frequency Offset=65535\n"
            "Ant 0 Frame Offset=2047\n"
            "Ant 0 Sample Offset=524287\n"
            "Ant 1 Frame Offset=2047\n"
            "Ant 1 Sample Offset=524287\n]");
}

TEST(NeighborCellsList, TheBitsBetweenTheFieldsAreNotShown) {
  auto section = Section::list();
  section.take(record(0xB180, "00 000000 0000 0000  000000FC 000000C0 0000FFFF 000000C0 FFFFFFFF"));
  EXPECT_EQ(section.text(), emptyCellText);
}

TEST(NeighborCellsList, ACountFieldOfZeroStillShowsOneCell) {
  auto section = Section::list();
  section.take(record(0xB180, "", 21));
  EXPECT_EQ(section.text(), emptyCellText);
}

TEST(NeighborCellsList, CellsAre20BytesApart) {
  auto section = Section::list();
  section.take(record(0xB180,
                      "04 000000 9C18 4A00  0000000000000000000000000000000000000000"
                      "2D414101 A1A0D116 E8FD0000 DC059F24 00000000"));
  EXPECT_EQ(section.text(), std::string(emptyCellText) + oneCellText);
}

TEST(NeighborCellsList, AFullCountFieldShows32CellsEvenPastTheEndOfTheRecord) {
  auto section = Section::list();
  section.take(record(0xB180, "00 000000 0000 C007", 22));
  EXPECT_EQ(section.section.array()->size(), 32u);
}

TEST(NeighborCellsList, ARecordOf20BytesLeavesTheListAsItIs) {
  auto section = Section::list();
  section.take(record(0xB180, oneCell));
  section.take(record(0xB180, "", 20));
  EXPECT_EQ(section.text(), oneCellText);
}

TEST(NeighborCellsList, TracesTheCountAndEveryMeasurementByOneName) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xB180, oneCell));
  EXPECT_THAT(section.surroundings.log.warnings(),
              ElementsAre("Neighbor Cells List", "Number of neighboring cells being reported: 1\n",
                          "Physical Cell ID: 301\n", "Measured RSSI: -60.000000\n",
                          "Measured RSSI: -60.000000\n", "Measured RSSI: -59.500000\n",
                          "Measured RSSI: -10.000000\n", "Measured RSSI: -9.750000\n"));
}

TEST(NeighborCellsList, TracesEachCell) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xB180, "00 000000 0000 8000", 21));
  const auto lines = section.surroundings.log.warnings();
  EXPECT_EQ(std::ranges::count(lines, "Number of neighboring cells being reported: 3\n"), 1);
  EXPECT_EQ(std::ranges::count(lines, "Physical Cell ID: 0\n"), 3);
  EXPECT_EQ(lines.size(), 2u + 3 * 6);
}

TEST(NeighborCellsList, ShowsTheSameWithItsTracesMasked) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.surroundings.log.isMasked = true;
  section.take(record(0xB180, oneCell));
  EXPECT_EQ(section.text(), oneCellText);
  EXPECT_THAT(section.surroundings.log.warnings(), IsEmpty());
}

TEST(NeighborCellsList, TracesWithoutASectionToo) {
  test::TestPlatform surroundings;
  NeighborCellsList decoder(surroundings.platform());
  const Bytes bytes = record(0xB180, oneCell);
  decoder.updateWithData(RecordView(bytes), 0xB180);
  EXPECT_EQ(surroundings.log.warnings().size(), 8u);
}

TEST(NeighborCellsList, LogsTheCodesItDidNotAskFor) {
  auto section = Section::list();
  section.take(record(0xB179, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45433"));
}

}  // namespace
}  // namespace kelvasi
