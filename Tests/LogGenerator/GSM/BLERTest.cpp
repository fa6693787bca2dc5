// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<BLER>;

TEST(BLER, ShowsTheWindowAndEachChannelInThisOrder) {
  auto section = Section::rows();
  section.take(record(0x4116, "02 6400  01 0A000000 02000000  FF 0B000000 03000000"));
  EXPECT_EQ(section.text(),
            "Window Size=100\nTransport Channels="
            "[Transport Channel ID=1\nCRC Received=10\nCRC Received in Error=2\n]"
            "[Transport Channel ID=255\nCRC Received=11\nCRC Received in Error=3\n]\n");
}

TEST(BLER, CountsPast31BitsShowNegative) {
  auto section = Section::rows();
  section.take(record(0x4116, "01 FFFF  01 FFFFFFFF 00000080"));
  EXPECT_EQ(section.text(),
            "Window Size=65535\nTransport Channels="
            "[Transport Channel ID=1\nCRC Received=-1\nCRC Received in Error=-2147483648\n]\n");
}

TEST(BLER, ACountOfZeroShowsAnEmptyList) {
  auto section = Section::rows();
  section.take(record(0x4116, "00 6400"));
  ASSERT_TRUE(section.section.dictionary()->get("Transport Channels").array());
  EXPECT_EQ(section.text(), "Window Size=100\nTransport Channels=\n");
  section.take(record(0x4116, "01 6400  01 0A000000 02000000"));
  section.take(record(0x4116, "00 6400"));
  EXPECT_EQ(section.text(), "Window Size=100\nTransport Channels=\n");
}

TEST(BLER, ChannelsPastTheEndReadAsZero) {
  auto section = Section::rows();
  section.take(record(0x4116, "FF 6400"));
  const PlistValue channels = section.section.dictionary()->get("Transport Channels");
  ASSERT_EQ(channels.array()->size(), 255u);
  EXPECT_EQ(test::asText(channels.array()->at(254)),
            "Transport Channel ID=0\nCRC Received=0\nCRC Received in Error=0\n");
}

TEST(BLER, ARecordOf15BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x4116, "01 64"));
  EXPECT_EQ(section.text(), "");
}

}  // namespace
}  // namespace kelvasi
