// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/UTRAN/UTRANTables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/UTRAN/GSMNeighborCells.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = test::SectionFixture<GSMNeighbhorMeasurements>;

constexpr auto threeCells = "000000 03  3412 01 02 3E00 C4FF  3512 01 03 3F00 C5FF  3612 01 04 4000 C6FF";

TEST(GSMNeighbhorMeasurements, ThreeCellsLeaveTheListEmpty) {
  auto section = Section::list();
  section.take(record(0xD00E, threeCells));
  EXPECT_EQ(section.text(), "");
}

TEST(GSMNeighbhorMeasurements, ClearsWhatTheTemplatePutThere) {
  auto section = Section::list();
  section.section.array()->append("from the template");
  section.take(record(0xD00E, "000000", 16));
  EXPECT_EQ(section.text(), "[from the template]");
  section.take(record(0xD00E, threeCells));
  EXPECT_EQ(section.text(), "");
}

TEST(GSMNeighbhorMeasurements, ACellPastTheCountIsOutOfBounds) {
  const Bytes bytes = record(0xD00E, threeCells);
  const auto& cells = utran::gsmNeighborCells::cells;
  const RecordView last = entryOf(RecordView(bytes), cells, 2);
  EXPECT_EQ(valueOf(last, fieldIn(utran::gsmNeighborCells::cellLayout, "RSSI")), -58);
  EXPECT_THROW(entryOf(RecordView(bytes), cells, 3), ArrayOutOfBoundsException);
}

TEST(GSMNeighbhorMeasurements, OnlyTracesACodeItDidNotAskFor) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xD00A, threeCells));
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("GSM Neighbor Cell List"));
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

}  // namespace
}  // namespace kelvasi
