// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/ServingPLMN.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Telvon/CellMonitor.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using test::SectionFixture;
using testing::ElementsAre;
using testing::IsEmpty;

using Section = SectionFixture<ServingPLMN>;

PlistValue cell(std::string_view technology, std::string_view type, PlistValue mcc, PlistValue mnc,
                PlistValue lac) {
  return PlistDictionary::make({{std::string(kTelvonCellMonitorCellRadioAccessTechnology), technology},
                                {std::string(kTelvonCellMonitorCellType), type},
                                {std::string(kTelvonCellMonitorMCC), mcc},
                                {std::string(kTelvonCellMonitorMNC), mnc},
                                {std::string(kTelvonCellMonitorLAC), lac}});
}
PlistValue servingGsmCell() {
  return cell(kTelvonCellMonitorRadioAccessTechnologyGSM, kTelvonCellMonitorCellTypeServing, 310, 1, 4660);
}

TEST(ServingPLMN, WritesItsTraceAtEveryUpdate) {
  auto section = Section::rows();
  section.surroundings.log.clear();
  section.take(record(0x7135, "", 32));
  section.take(record(0x7132, "", 16));
  section.takeList(0xFF0001, PlistArray::make({servingGsmCell()}));
  section.take(record(0x7135, "", 31));
  EXPECT_EQ(section.surroundings.log.warnings(), std::vector<std::string>(4, "Serving PLMN"));
}

TEST(ServingPLMN, ShowsTheSelectionModeFromByte14) {
  const char* texts[] = {"Automatic",          "Manual", "Limited", "LIMITED_ROUTINE_ACQ",
                         "LIMITED_MANUAL_ACQ", "Unknown"};
  for (int mode = 0; mode < 6; ++mode) {
    auto section = Section::rows();
    section.take(record(0x7132, "06 0" + std::to_string(mode) + " 00"));
    EXPECT_EQ(section.text(), std::string("PLMN Sel Mod=") + texts[mode] + "\n");
  }
}

TEST(ServingPLMN, ATwoDigitNetworkCodeEndsWithABlank) {
  auto section = Section::rows();
  section.take(record(0x7135, "00 03 13 F0 10 12 34 56", 32));
  EXPECT_EQ(section.text(),
            "Mobile Country Code=310\n"
            "Mobile Network Code=01 \n"
            "Location Area Code=4660\n"
            "Routing Area Code=86\n"
            "Service Type=CS_PS_SERVICE\n");
}

TEST(ServingPLMN, EveryNibblePastNineIsABlank) {
  auto section = Section::rows();
  section.take(record(0x7135, "00 04 BA 1C FD", 32));
  EXPECT_EQ(section.text(),
            "Mobile Country Code=   \n"
            "Mobile Network Code=  1\n"
            "Location Area Code=0\n"
            "Routing Area Code=0\n"
            "Service Type=LIMITED_SERVICE\n");
}

TEST(ServingPLMN, ShowsUnknownPastTheServiceTypes) {
  auto section = Section::rows();
  section.take(record(0x7135, "00 05", 32));
  EXPECT_THAT(section.text(), testing::EndsWith("Service Type=Unknown\n"));
}

TEST(ServingPLMN, IgnoresARegisteredPlmnOf31Bytes) {
  auto section = Section::rows();
  section.take(record(0x7135, "00 03 13 F0 10", 31));
  EXPECT_EQ(section.text(), "");
}

TEST(ServingPLMN, SkipsAServingLteCellBeforeTheServingGsmCell) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({cell(kTelvonCellMonitorRadioAccessTechnologyLTE,
                                                    kTelvonCellMonitorCellTypeServing, 1, 2, 3),
                                               servingGsmCell()}));
  EXPECT_EQ(section.text(), "Mobile Country Code=310\nMobile Network Code=1\nLocation Area Code=4660\n");
}

TEST(ServingPLMN, SkipsCellsThatAreNotServingOrLackAnEntryOrAreNoDictionaries) {
  auto section = Section::rows();
  section.takeList(0xFF0001,
                   PlistArray::make({"text", PlistDictionary::make(),
                                     PlistDictionary::make({{std::string(kTelvonCellMonitorCellType),
                                                             kTelvonCellMonitorCellTypeServing}}),
                                     cell(kTelvonCellMonitorRadioAccessTechnologyGSM,
                                          kTelvonCellMonitorCellTypeNeighbor, 1, 2, 3)}));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(ServingPLMN, LooksAtTheFirstServingCellOnly) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({cell(kTelvonCellMonitorRadioAccessTechnologyUMTS,
                                                    kTelvonCellMonitorCellTypeServing, 262, 2, 7),
                                               servingGsmCell()}));
  EXPECT_EQ(section.text(), "Mobile Country Code=262\nMobile Network Code=2\nLocation Area Code=7\n");
}

TEST(ServingPLMN, LogsEachValueThatIsMissingOrNoNumberAndGoesOn) {
  auto section = Section::rows();
  section.takeList(0xFF0001,
                   PlistArray::make({cell(kTelvonCellMonitorRadioAccessTechnologyGSM,
                                          kTelvonCellMonitorCellTypeServing, "310", {}, 4294967296)}));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("ServingPLMN: Failed to retrieve MCC\n", "ServingPLMN: Failed to retrieve MNC\n",
                          "ServingPLMN: Failed to retrieve LAC\n"));
}

TEST(ServingPLMN, LogsACellListThatCannotBeParsed) {
  auto section = Section::rows();
  section.take(test::textRecord(0xFF0001, "nothing that parses"));
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

TEST(ServingPLMN, AnEmptyCellListChangesNothing) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make());
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(ServingPLMN, TheLaterOfItsTwoWritersWins) {
  auto section = Section::rows();
  section.take(record(0x7135, "00 03 13 F0 10 12 34 56", 32));
  section.takeList(0xFF0001, PlistArray::make({servingGsmCell()}));
  EXPECT_EQ(section.text(),
            "Mobile Country Code=310\n"
            "Mobile Network Code=1\n"
            "Location Area Code=4660\n"
            "Routing Area Code=86\n"
            "Service Type=CS_PS_SERVICE\n");
}

TEST(ServingPLMN, WithoutASectionItStillLogsAndWritesNowhere) {
  test::TestPlatform surroundings;
  ServingPLMN decoder(surroundings.platform());
  decoder.updateWithData(RecordView(record(0x7135, "00 03 13 F0 10", 32)), 0x7135);
  decoder.updateWithData(RecordView(record(0xFF0001, "")), 0xFF0001);
  EXPECT_THAT(surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

TEST(ServingPLMN, LogsACodeThatItDidNotAskFor) {
  auto section = Section::rows();
  section.take(record(0x7131, "00 00 00"));
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("Received an unknown log message: 28977"));
}

}  // namespace
}  // namespace kelvasi
