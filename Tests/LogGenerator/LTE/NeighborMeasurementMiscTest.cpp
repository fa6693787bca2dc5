// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTETables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<NeighborMeasurementMisc>;

TEST(NeighborMeasurementMisc, ShowsWhatTheCellsHaveInCommonInThisOrder) {
  auto section = Section::rows();
  section.take(record(0xB180, "04 000000 9C18 4A00"));
  EXPECT_EQ(section.text(), "Version=4\nE-ARFCN=6300\nQrxlevmin=-120 dBm\n");
}

TEST(NeighborMeasurementMisc, TakesSixBitsOfQrxlevmin) {
  auto section = Section::rows();
  section.take(record(0xB180, "FF FFFFFF FFFF FFFF"));
  EXPECT_EQ(section.text(), "Version=255\nE-ARFCN=65535\nQrxlevmin=-14 dBm\n");
}

TEST(NeighborMeasurementMisc, ARecordOf20BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0xB180, "04 000000 9C18 4A"));
  EXPECT_EQ(section.text(), "");
}

TEST(NeighborMeasurementMisc, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xB179, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(), ElementsAre("Neighbor Measurements"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45433"));
}

}  // namespace
}  // namespace kelvasi
