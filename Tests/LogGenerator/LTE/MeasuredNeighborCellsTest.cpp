// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTETables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<MeasuredNeighborCells>;

constexpr auto twoCells = "00000000 0000 0000 0000 0000 0000 02 01  2D01 A000 5000  F701 4101 5100  FFFF";

TEST(MeasuredNeighborCells, ShowsEachCellInThisOrder) {
  auto section = Section::list();
  section.take(record(0xB179, twoCells));
  EXPECT_EQ(section.text(),
            "[Physical Cell ID=301\nFiltered RSRP=-100.00 dBm\nFiltered RSRQ=-10.00 dB\n]"
            "[Physical Cell ID=503\nFiltered RSRP=-59.75 dBm\nFiltered RSRQ=-9.88 dB\n]");
}

TEST(MeasuredNeighborCells, ARecordWithoutCellsEmptiesTheList) {
  auto section = Section::list();
  section.take(record(0xB179, twoCells));
  section.take(record(0xB179, "", 29));
  EXPECT_EQ(section.text(), "");
}

TEST(MeasuredNeighborCells, ARecordOf28BytesLeavesTheListAsItIs) {
  auto section = Section::list();
  section.take(record(0xB179, twoCells));
  const std::string before = section.text();
  section.take(record(0xB179, "", 28));
  EXPECT_EQ(section.text(), before);
}

TEST(MeasuredNeighborCells, TrustsTheCountPastTheEndOfTheRecord) {
  auto section = Section::list();
  section.take(record(0xB179, "00000000 0000 0000 0000 0000 0000 03 00  2D01 A0"));
  EXPECT_EQ(section.text(),
            "[Physical Cell ID=301\nFiltered RSRP=-100.00 dBm\nFiltered RSRQ=-20.00 dB\n]"
            "[Physical Cell ID=0\nFiltered RSRP=-140.00 dBm\nFiltered RSRQ=-20.00 dB\n]"
            "[Physical Cell ID=0\nFiltered RSRP=-140.00 dBm\nFiltered RSRQ=-20.00 dB\n]");
}

TEST(MeasuredNeighborCells, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xB17F, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Measured Neighbor Cells"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45439"));
}

}  // namespace
}  // namespace kelvasi
