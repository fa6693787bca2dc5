// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<GPRSInformation>;

std::string shown(LogCode logCode, std::string_view payload, std::size_t length) {
  auto section = Section::rows();
  section.take(record(logCode, payload, length));
  return section.text();
}

// The text of one row of a 0x51F5 record with these three bytes.
std::string accessRow(std::string_view payload, const std::string& key) {
  const std::string text = shown(0x51F5, payload, 18);
  const auto begin = text.find(key + "=") + key.size() + 1;
  return text.substr(begin, text.find('\n', begin) - begin);
}

TEST(GPRSInformation, ShowsWhereSi13Is) {
  EXPECT_EQ(shown(0x51F4, "00 00", 15), "SI13 Position=Located on BCCH\n");
  EXPECT_EQ(shown(0x51F4, "00 01", 15), "SI13 Position=Located on Extended BCCH\n");
  EXPECT_EQ(shown(0x51F4, "00 02", 15), "SI13 Position=Unknown\n");
  EXPECT_EQ(shown(0x51F4, "00 FE", 15), "SI13 Position=Unknown\n");
  EXPECT_EQ(shown(0x51F4, "00 FF", 15), "SI13 Position=Not Available\n");
  EXPECT_EQ(shown(0x51F4, "00", 14), "");
}

TEST(GPRSInformation, ShowsAccessInThisOrder) {
  EXPECT_EQ(shown(0x51F5, "01 03 02", 18),
            "Network Control Order=NC2\nPFC Supported=Supported\nPriority Access Threshold=1 Only\n");
  EXPECT_EQ(shown(0x51F5, "01 03 02", 17), "");
}

TEST(GPRSInformation, NetworkControlOrdersEndAtNC2) {
  EXPECT_EQ(accessRow("00 00 00", "Network Control Order"), "NC0");
  EXPECT_EQ(accessRow("00 00 01", "Network Control Order"), "NC1");
  EXPECT_EQ(accessRow("00 00 03", "Network Control Order"), "Unknown");
  EXPECT_EQ(accessRow("00 00 FF", "Network Control Order"), "Not Available");
}

TEST(GPRSInformation, APacketFlowContextOf255IsAvailable) {
  EXPECT_EQ(accessRow("FF 00 00", "PFC Supported"), "Available");
  EXPECT_EQ(accessRow("00 00 00", "PFC Supported"), "Not Supported");
  EXPECT_EQ(accessRow("02 00 00", "PFC Supported"), "Unknown");
}

TEST(GPRSInformation, PriorityAccessThresholdsEndAt7) {
  const char* texts[] = {"Barred (PKT access not allowed in the Cell)",
                         "Barred",
                         "Barred",
                         "1 Only",
                         "1 to 2",
                         "1 to 3",
                         "1 to 4",
                         "Allowed",
                         "Unknown"};
  for (int threshold = 0; threshold <= 8; ++threshold) {
    EXPECT_EQ(accessRow("00 0" + std::to_string(threshold), "Priority Access Threshold"), texts[threshold]);
  }
  EXPECT_EQ(accessRow("00 FE", "Priority Access Threshold"), "Unknown");
  EXPECT_EQ(accessRow("00 FF", "Priority Access Threshold"), "Not Available");
}

TEST(GPRSInformation, ShowsTheNetworkOperatingModeFromTheRegisteredPlmn) {
  EXPECT_EQ(shown(0x7135, "00", 32), "Network Operating Mode=Class 1\n");
  EXPECT_EQ(shown(0x7135, "01", 32), "Network Operating Mode=Class 2\n");
  EXPECT_EQ(shown(0x7135, "02", 32), "Network Operating Mode=Class 3\n");
  EXPECT_EQ(shown(0x7135, "03", 32), "Network Operating Mode=Unknown\n");
  EXPECT_EQ(shown(0x7135, "FF", 32), "Network Operating Mode=Unknown\n");
  EXPECT_EQ(shown(0x7135, "00", 31), "");
}

TEST(GPRSInformation, ShowsCellOptionsInThisOrder) {
  EXPECT_EQ(shown(0x51F6, "0000 04 FF 01", 24),
            "T3192=80 ms\nAccess Burst Type=11-bit format\nDRX Timer Max=255\n");
  EXPECT_EQ(shown(0x51F6, "0000 04 02 00", 24),
            "T3192=80 ms\nAccess Burst Type=8-bit format\nDRX Timer Max=2\n");
  EXPECT_EQ(shown(0x51F6, "0000 04 02 00", 23), "");
}

TEST(GPRSInformation, AT3192PastItsTableShowsQuestionMarks) {
  const char* waits[] = {"500 ms", "1000 ms", "1500 ms", "0 ms",  "80 ms",
                         "120 ms", "160 ms",  "200 ms",  "?? ms", "?? ms"};
  for (int code = 0; code < 10; ++code) {
    EXPECT_THAT(shown(0x51F6, "0000 0" + std::to_string(code), 24),
                testing::StartsWith(std::string("T3192=") + waits[code] + "\n"));
  }
  EXPECT_THAT(shown(0x51F6, "0000 FF", 24), testing::StartsWith("T3192=?? ms\n"));
}

TEST(GPRSInformation, ShowsThePbcchAsANumber) {
  EXPECT_EQ(shown(0x51FB, "FF", 34), "PBCCH Present=255\n");
  EXPECT_EQ(shown(0x51FB, "01", 33), "");
}

TEST(GPRSInformation, ShowsPacketStatusInThisOrder) {
  constexpr auto payload = "05 06 07 08 00000000000000000000000000000000 01";
  EXPECT_EQ(
      shown(0x51FD, payload, 35),
      "Ext Measurement Order=8\nPacket PSI Status=5\nPacket SI Status=Supported\nCount LR=6\nCount HR=7\n");
  EXPECT_EQ(shown(0x51FD, "", 35),
            "Ext Measurement Order=0\nPacket PSI Status=0\nPacket SI Status=Not Supported\n"
            "Count LR=0\nCount HR=0\n");
  EXPECT_EQ(shown(0x51FD, payload, 34), "");
}

TEST(GPRSInformation, ShowsWhetherTheReselectHysteresisIsApplied) {
  constexpr auto upToHysteresis = "0000 00 00000000 00000000 0000 ";
  EXPECT_EQ(shown(0x5137, std::string(upToHysteresis) + "80", 29), "Cell Reselect Hysteresis=Applied\n");
  EXPECT_EQ(shown(0x5137, std::string(upToHysteresis) + "00 FF FF", 29),
            "Cell Reselect Hysteresis=Not Applied\n");
  EXPECT_EQ(shown(0x5137, std::string(upToHysteresis) + "80", 28), "");
}

TEST(GPRSInformation, CodesOfItsRangeThatItDidNotAskForAreUnknown) {
  auto section = Section::rows();
  for (const LogCode logCode : {0x51F7u, 0x51F8u, 0x51F9u, 0x51FAu, 0x51FCu}) {
    section.take(record(logCode, "01", 40));
  }
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(
      section.surroundings.log.errors(),
      testing::ElementsAre("Received an unknown log message: 20983", "Received an unknown log message: 20984",
                           "Received an unknown log message: 20985", "Received an unknown log message: 20986",
                           "Received an unknown log message: 20988"));
}

}  // namespace
}  // namespace kelvasi
