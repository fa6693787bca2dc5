// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTETables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<DetectedCells>;

constexpr auto behindOneMeasured = "00000000 0000 0000 0000 0000 0000 01 02  AAAA BBBB CCCC  2D01 F701";

TEST(DetectedCells, StandBehindTheMeasuredCells) {
  auto section = Section::list();
  section.take(record(0xB179, behindOneMeasured));
  EXPECT_EQ(section.text(), "[Physical Cell ID=301\n][Physical Cell ID=503\n]");
}

TEST(DetectedCells, BeginAtByte29WithoutMeasuredCells) {
  auto section = Section::list();
  section.take(record(0xB179, "00000000 0000 0000 0000 0000 0000 00 01  FFFF"));
  EXPECT_EQ(section.text(), "[Physical Cell ID=65535\n]");
}

TEST(DetectedCells, ARecordWithoutCellsEmptiesTheList) {
  auto section = Section::list();
  section.take(record(0xB179, behindOneMeasured));
  section.take(record(0xB179, "00000000 0000 0000 0000 0000 0000 02 00"));
  EXPECT_EQ(section.text(), "");
}

TEST(DetectedCells, ARecordOf28BytesLeavesTheListAsItIs) {
  auto section = Section::list();
  section.take(record(0xB179, behindOneMeasured));
  section.take(record(0xB179, "", 28));
  EXPECT_EQ(section.text(), "[Physical Cell ID=301\n][Physical Cell ID=503\n]");
}

TEST(DetectedCells, TrustTheCountsPastTheEndOfTheRecord) {
  auto section = Section::list();
  section.take(record(0xB179, "00000000 0000 0000 0000 0000 0000 FF FF"));
  EXPECT_EQ(section.section.array()->size(), 255u);
  EXPECT_EQ(test::asText(section.section.array()->at(254)), "Physical Cell ID=0\n");
}

TEST(DetectedCells, LogATraceAndTheCodesTheyDidNotAskFor) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0xB186, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Detected Cells"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45446"));
}

}  // namespace
}  // namespace kelvasi
