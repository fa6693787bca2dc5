// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LTE/LTETables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::ElementsAre;

using Section = test::SectionFixture<ConnectedModeMeasurementMisc>;

TEST(ConnectedModeMeasurementMisc, ShowsTheServingCellInThisOrder) {
  auto section = Section::rows();
  // RSRP 320 and RSRQ 80.
  section.take(record(0xB179, "00000000 9C18 2D01 0F27 4001 5000 00 00"));
  EXPECT_EQ(section.text(),
            "E-ARFCN=6300\n"
            "Serving Physical Cell ID=301\n"
            "Subframe Number=9999\n"
            "Serving Filtered RSRP=-60.00 dBm\n"
            "Serving Filtered RSRQ=-10.00 dB\n");
}

TEST(ConnectedModeMeasurementMisc, TakesAll16BitsWithoutSign) {
  auto section = Section::rows();
  section.take(record(0xB179, "00000000 FFFF FFFF FFFF FFFF FFFF 00 00"));
  EXPECT_EQ(section.text(),
            "E-ARFCN=65535\n"
            "Serving Physical Cell ID=65535\n"
            "Subframe Number=65535\n"
            "Serving Filtered RSRP=16243.75 dBm\n"
            "Serving Filtered RSRQ=8171.88 dB\n");
}

TEST(ConnectedModeMeasurementMisc, RoundsEighthsToTheEvenHundredth) {
  auto section = Section::rows();
  section.take(record(0xB179, "00000000 0000 0000 0000 0000 0100 00 00"));
  EXPECT_EQ(*section.section.dictionary()->get("Serving Filtered RSRQ").string(), "-19.88 dB");
  section.take(record(0xB179, "00000000 0000 0000 0000 0000 0300 00 00"));
  EXPECT_EQ(*section.section.dictionary()->get("Serving Filtered RSRQ").string(), "-19.62 dB");
}

TEST(ConnectedModeMeasurementMisc, ARecordOf28BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0xB179, "00000000 9C18 2D01 0F27 4001 5000 00"));
  EXPECT_EQ(section.text(), "");
}

TEST(ConnectedModeMeasurementMisc, LogsATraceAndTheCodesItDidNotAskFor) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0xB180, "", 64));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.warnings(),
              ElementsAre("Connected mode LTE Intra-frequency Measurement"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 45440"));
}

}  // namespace
}  // namespace kelvasi
