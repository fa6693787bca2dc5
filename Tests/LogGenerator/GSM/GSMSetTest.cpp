// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<GSMSet>;

TEST(GSMSet, ShowsTheRowsOfEachCellInThisOrder) {
  auto section = Section::list();
  section.take(record(0x4005, "00 02 E803 2A00 9C F6FF FFFF FFFF 7F FF7F"));
  EXPECT_EQ(section.text(),
            "[ARFCN=1000\nBSIC=42\nRSSI=-100 dBm\nRanking Value=-10\n]"
            "[ARFCN=65535\nBSIC=65535\nRSSI=127 dBm\nRanking Value=32767\n]");
}

TEST(GSMSet, TheGsmListIsReadFromByte15WhateverTheUmtsListCounts) {
  auto section = Section::list();
  section.take(record(0x4005, "01 02 E803 2A00 9C F6FF F9 0500 11 22 33 44"));
  EXPECT_EQ(section.text(),
            "[ARFCN=1000\nBSIC=42\nRSSI=-100 dBm\nRanking Value=-10\n]"
            "[ARFCN=1529\nBSIC=4352\nRSSI=34 dBm\nRanking Value=17459\n]");
}

TEST(GSMSet, ACountOfZeroEmptiesTheSetWhateverTheUmtsListCounts) {
  auto section = Section::list();
  section.take(record(0x4005, "00 01 E803 2A00 9C F6FF"));
  section.take(record(0x4005, "01 00 E803 2A00 9C F6FF F9 0500"));
  EXPECT_EQ(section.text(), "");
}

TEST(GSMSet, ARecordOf14BytesLeavesTheSetAsItWas) {
  auto section = Section::list();
  section.take(record(0x4005, "00 01 E803"));
  section.take(record(0x4005, "00"));
  EXPECT_EQ(section.text(), "[ARFCN=1000\nBSIC=0\nRSSI=0 dBm\nRanking Value=0\n]");
}

TEST(GSMSet, CellsPastTheEndReadAsZero) {
  auto section = Section::list();
  section.take(record(0x4005, "00 FF"));
  ASSERT_EQ(section.section.array()->size(), 255u);
  EXPECT_EQ(test::asText(section.section.array()->at(254)), "ARFCN=0\nBSIC=0\nRSSI=0 dBm\nRanking Value=0\n");
}

}  // namespace
}  // namespace kelvasi
