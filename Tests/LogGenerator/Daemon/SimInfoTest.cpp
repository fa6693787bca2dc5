// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Daemon/SimInfo.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using Section = test::SectionFixture<SimInfo>;

TEST(SimInfo, ShowsEveryFileInItsOrderWhateverTheRecords) {
  auto section = Section::rows();
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_OPLMNAcT", "14"},
                                                    {"kSimFile_OPL", "13"},
                                                    {"kSimFile_PNN", "12"},
                                                    {"kSimFile_RATMODE", "11"},
                                                    {"kSimFile_AHPLMN", "10"},
                                                    {"kSimFile_FPLMN", "9"},
                                                    {"kSimFile_AD", "8"},
                                                    {"kSimFile_ACC", "7"},
                                                    {"kSimFile_PSLOCI", "6"},
                                                    {"kSimFile_LOCI", "5"},
                                                    {"kSimFile_HPPLMN", "4"},
                                                    {"kSimFile_MBDN", "3"},
                                                    {"kSimFile_MSISDN", "2"},
                                                    {"kSimFile_ICCID", "1"},
                                                    {"kSimFile_other", "0"}}));
  EXPECT_EQ(section.text(),
            "EF-ICCID=1\n"
            "EF-MSISDN=2\n"
            "EF-3GPP MAIL BOX DIALING NUMBER=3\n"
            "EF-HPPLMN SEARCH PERIOD=4\n"
            "EF-LOCI=5\n"
            "EF-GPRS/PS-LOCI=6\n"
            "EF-ACCESS CONTROL CLASS=7\n"
            "EF-ADMINISTRATIVE DATA=8\n"
            "EF-FPLMN=9\n"
            "EF-ACTING HPLMN=10\n"
            "EF-RAT MODE=11\n"
            "EF-PLMN NETWORK NAME=12\n"
            "EF-OPERATOR PLMN LIST=13\n"
            "EF-OPLMNAcT=14\n");
}

TEST(SimInfo, AnAbsentFileLeavesItsRowAsItWas) {
  auto section = Section::rows();
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_ICCID", "8949"}, {"kSimFile_LOCI", "1"}}));
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_LOCI", "2"}}));
  EXPECT_EQ(section.text(), "EF-ICCID=8949\nEF-LOCI=2\n");
}

TEST(SimInfo, ASimWithOneFileSetsOneRow) {
  auto section = Section::rows();
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_ICCID", "8949"}}));
  EXPECT_EQ(section.text(), "EF-ICCID=8949\n");
}

TEST(SimInfo, ValuesAreShownAsTheyStand) {
  auto section = Section::rows();
  const auto names = PlistArray::make({"a", "b"});
  section.takeList(0xFF0000,
                   PlistDictionary::make(
                       {{"kSimFile_ICCID", Bytes{0x98, 0x49}}, {"kSimFile_AD", 7}, {"kSimFile_PNN", names}}));
  const PlistDictionary& rows = *section.section.dictionary();
  EXPECT_EQ(rows.get("EF-ICCID"), PlistValue(Bytes{0x98, 0x49}));
  EXPECT_EQ(rows.get("EF-ADMINISTRATIVE DATA"), PlistValue(7));
  EXPECT_EQ(rows.get("EF-PLMN NETWORK NAME"), PlistValue(names));
}

TEST(SimInfo, ATextTakesThePlaceOfAnotherKindOfValue) {
  auto section = Section::rows();
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_ICCID", 7}}));
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_ICCID", "7"}}));
  EXPECT_EQ(section.text(), "EF-ICCID=7\n");
}

TEST(SimInfo, APayloadThatIsNoPropertyListIsLoggedAndThrows) {
  auto section = Section::rows();
  section.takeList(0xFF0000, PlistDictionary::make({{"kSimFile_ICCID", "8949"}}));
  for (const char* payload : {"", "no property list"}) {
    section.surroundings.log.clear();
    EXPECT_THROW(section.take(test::textRecord(0xFF0000, payload)), LogCode_0xFF000020::UnknownDataException);
    EXPECT_EQ(section.text(), "EF-ICCID=8949\n");
    EXPECT_THAT(section.surroundings.log.errors(),
                ElementsAre("SIM File dictionary data could not be constructed"));
  }
}

TEST(SimInfo, APropertyListOfAnotherKindSetsNothing) {
  auto section = Section::rows();
  section.takeList(0xFF0000, PlistArray::make({"kSimFile_ICCID"}));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(SimInfo, ACodeThatItDidNotAskForGoesWithoutALine) {
  auto section = Section::rows();
  section.take(test::textRecord(0xFF0003, "no property list"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

}  // namespace
}  // namespace kelvasi
