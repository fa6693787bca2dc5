// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using testing::HasSubstr;
using testing::Not;
using Section = test::SectionFixture<HSDPAInformation>;

constexpr auto headRows = "Version=1\nSub Frames=100\nCarrier Info=Single Carrier\n";
// One primary process.
constexpr auto onePrimary = "01 6400 01 00  07 FFFFFFFF FFFF 0100";
constexpr auto onePrimaryRows =
    "Primary HARQ Process=[Process ID=7\nNo Rx Bits=4294967295\nNew Tx=65535\nBlock Errors=1\n]\n";

TEST(HSDPAInformation, ShowsVersionSubFramesAndCarriersInThisOrder) {
  auto section = Section::rows();
  section.take(record(0x4221, "FF FF0F 00 00"));
  EXPECT_EQ(section.text(), "Version=255\nSub Frames=1023\nCarrier Info=Reserved\n");
}

TEST(HSDPAInformation, CarriersAreBits2And3OfByte15) {
  const std::pair<const char*, const char*> carriers[] = {
      {"F0", "Single Carrier"}, {"F4", "MIMO"}, {"F8", "Dual Carrier"}, {"FC", "Reserved"}};
  for (const auto& [byte15, text] : carriers) {
    auto section = Section::rows();
    section.take(record(0x4221, std::string("00 00 ") + byte15 + " 00 00"));
    EXPECT_EQ(section.text(), std::string("Version=0\nSub Frames=0\nCarrier Info=") + text + "\n");
  }
}

TEST(HSDPAInformation, ProcessNumbersAreUnsigned) {
  auto section = Section::rows();
  section.take(record(0x4221, onePrimary));
  EXPECT_EQ(section.text(), std::string(headRows) + onePrimaryRows);
}

TEST(HSDPAInformation, PrimaryProcessesStandNineBytesApart) {
  auto section = Section::rows();
  section.take(record(0x4221, "01 6400 02 00  00 00000000 0000 0000  08 01000000 0200 0300"));
  EXPECT_THAT(section.text(), HasSubstr("[Process ID=8\nNo Rx Bits=1\nNew Tx=2\nBlock Errors=3\n]"));
}

TEST(HSDPAInformation, SecondaryProcessesStand162BytesOnForEachPrimaryOne) {
  auto section = Section::rows();
  Bytes bytes = record(0x4221, "01 6400 01 01  07 FFFFFFFF FFFF 0100  EE EEEEEEEE EEEE EEEE", 180);
  const Bytes secondary = test::hex("09 0A000000 0B00 0C00");
  bytes.insert(bytes.end(), secondary.begin(), secondary.end());
  section.take(bytes);
  EXPECT_EQ(section.text(),
            std::string(headRows) + onePrimaryRows +
                "Secondary HARQ Process=[Process ID=9\nNo Rx Bits=10\nNew Tx=11\nBlock Errors=12\n]\n");
}

TEST(HSDPAInformation, WithoutPrimaryProcessesTheSecondaryOnesStandAt18) {
  auto section = Section::rows();
  section.take(record(0x4221, "01 6400 00 01  09 0A000000 0B00 0C00"));
  EXPECT_EQ(section.text(),
            std::string(headRows) +
                "Secondary HARQ Process=[Process ID=9\nNo Rx Bits=10\nNew Tx=11\nBlock Errors=12\n]\n");
}

TEST(HSDPAInformation, ACountOfZeroKeepsTheListOfBefore) {
  auto section = Section::rows();
  section.take(record(0x4221, onePrimary));
  section.take(record(0x4221, "02 6400 00 01  09 0A000000 0B00 0C00"));
  EXPECT_EQ(section.text(),
            std::string("Version=2\nSub Frames=100\nCarrier Info=Single Carrier\n") + onePrimaryRows +
                "Secondary HARQ Process=[Process ID=9\nNo Rx Bits=10\nNew Tx=11\nBlock Errors=12\n]\n");
  section.take(record(0x4221, "01 6400 00 00"));
  EXPECT_THAT(section.text(), HasSubstr("Primary HARQ Process=[Process ID=7"));
  EXPECT_THAT(section.text(), HasSubstr("Secondary HARQ Process=[Process ID=9"));
}

TEST(HSDPAInformation, ANewListReplacesTheOneBefore) {
  auto section = Section::rows();
  section.take(record(0x4221, "01 6400 02 00  07 00000000 0000 0000  08 00000000 0000 0000"));
  section.take(record(0x4221, onePrimary));
  EXPECT_EQ(section.text(), std::string(headRows) + onePrimaryRows);
}

TEST(HSDPAInformation, AListThatSomebodyElseHoldsStaysAsItIs) {
  auto section = Section::rows();
  section.take(record(0x4221, onePrimary));
  const PlistValue kept = section.section.dictionary()->get("Primary HARQ Process");
  section.take(record(0x4221, "01 6400 01 00  00 00000000 0000 0000"));
  EXPECT_THAT(test::asText(kept), HasSubstr("Process ID=7"));
  EXPECT_THAT(section.text(), Not(HasSubstr("Process ID=7")));
}

TEST(HSDPAInformation, TheFirstListOfANewSectionIsItsOwn) {
  auto section = Section::rows();
  section.take(record(0x4221, onePrimary));
  const PlistValue other = PlistDictionary::make();
  section.decoder.updateSectionRef(other);
  section.take(record(0x4221, "01 6400 01 00  00 00000000 0000 0000"));
  EXPECT_THAT(section.text(), HasSubstr("Process ID=7"));
  EXPECT_THAT(test::asText(other), HasSubstr("Process ID=0"));
}

TEST(HSDPAInformation, ProcessesPastTheEndReadAsZero) {
  auto section = Section::rows();
  section.take(record(0x4221, "01 6400 FF FF"));
  for (const char* key : {"Primary HARQ Process", "Secondary HARQ Process"}) {
    const PlistValue list = section.section.dictionary()->get(key);
    ASSERT_EQ(list.array()->size(), 255u);
    EXPECT_EQ(test::asText(list.array()->at(254)), "Process ID=0\nNo Rx Bits=0\nNew Tx=0\nBlock Errors=0\n");
  }
}

TEST(HSDPAInformation, ARecordOf17BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x4221, "01 6400 01"));
  EXPECT_EQ(section.text(), "");
}

TEST(HSDPAInformation, ACodeThatItDidNotAskForGoesWithoutALine) {
  auto section = Section::rows();
  section.take(record(0x4222, onePrimary));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), testing::IsEmpty());
}

}  // namespace
}  // namespace kelvasi
