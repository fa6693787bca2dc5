// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<MobileAllocation>;

TEST(MobileAllocation, ShowsTheHoppingSequenceAndItsFrequencies) {
  auto section = Section::rows();
  section.take(record(0x51F8, "3F 03 0002 0100 FFFF"));
  EXPECT_EQ(section.text(), "HSN=63\nARFCNs=[512][1][65535]\n");
}

TEST(MobileAllocation, ACountOfZeroShowsAnEmptyList) {
  auto section = Section::rows();
  section.take(record(0x51F8, "FF 00 0002"));
  ASSERT_TRUE(section.section.dictionary()->get("ARFCNs").array());
  EXPECT_EQ(section.text(), "HSN=255\nARFCNs=\n");
  section.take(record(0x51F8, "01 01 0002"));
  section.take(record(0x51F8, "FF 00"));
  EXPECT_EQ(section.text(), "HSN=255\nARFCNs=\n");
}

TEST(MobileAllocation, FrequenciesPastTheEndReadAsZero) {
  auto section = Section::rows();
  section.take(record(0x51F8, "01 03 0002 01"));
  EXPECT_EQ(section.text(), "HSN=1\nARFCNs=[512][1][0]\n");
  section.take(record(0x51F8, "01 FF"));
  EXPECT_EQ(section.section.dictionary()->get("ARFCNs").array()->size(), 255u);
}

TEST(MobileAllocation, ARecordOf14BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x51F8, "3F"));
  EXPECT_EQ(section.text(), "");
}

}  // namespace
}  // namespace kelvasi
