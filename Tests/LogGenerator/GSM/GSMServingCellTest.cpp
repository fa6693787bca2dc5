// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/CellList.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::cell;
using test::record;
using testing::ElementsAre;
using testing::IsEmpty;
using Section = test::SectionFixture<GSMServingCell>;

TEST(GSMServingCell, ShowsTheIdentityInThisOrder) {
  auto section = Section::rows();
  section.take(record(0x5134, "0002 3F00 3412", 26));
  EXPECT_EQ(section.text(), "Cell ID=4660\nARFCN=512\nBSIC=63\n");
  section.take(record(0x5134, "FFFF FFFF FFFF", 26));
  EXPECT_EQ(section.text(), "Cell ID=65535\nARFCN=65535\nBSIC=65535\n");
}

TEST(GSMServingCell, AnIdentityRecordOf25BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x5134, "0002 3F00 3412", 25));
  EXPECT_EQ(section.text(), "");
}

TEST(GSMServingCell, TheReceiveLevelIsUnsigned) {
  auto section = Section::rows();
  section.take(record(0x5137, "0000 C8 05000000 07000000 0000 00 00 00"));
  EXPECT_EQ(section.text(), "RSSI=200 dBm\nC1 Value=5\nC2 Value=7\n");
}

TEST(GSMServingCell, C1AndC2AreTheLow16BitsOfTheirWords) {
  auto section = Section::rows();
  section.take(record(0x5137, "0000 00 45230100 FFFFFFFF 0000 00 00 00"));
  EXPECT_EQ(section.text(), "RSSI=0 dBm\nC1 Value=9029\nC2 Value=65535\n");
}

TEST(GSMServingCell, AMeasurementRecordOf28BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x5137, "0000 C8 05000000 07000000 0000 00 00"));
  EXPECT_EQ(section.text(), "");
}

TEST(GSMServingCell, OnlyTheLow8BitsOfTheDedicatedArfcnAreShown) {
  auto section = Section::rows();
  section.take(record(0x5076, "0002", 17));
  EXPECT_EQ(section.text(), "MA Dedicated ARFCN=0\n");
  section.take(record(0x5076, "FF01", 17));
  EXPECT_EQ(section.text(), "MA Dedicated ARFCN=255\n");
}

TEST(GSMServingCell, ADedicatedChannelRecordOf16BytesChangesNothing) {
  auto section = Section::rows();
  section.take(record(0x5076, "0102", 16));
  EXPECT_EQ(section.text(), "");
}

TEST(GSMServingCell, TheFirstServingGsmCellOfTheListIsShown) {
  auto section = Section::rows();
  section.takeList(0xFF0001,
                   PlistArray::make({cell(test::umts, test::serving, {{"CellId", 1}, {"ARFCN", 1}}),
                                     cell(test::gsm, test::neighbour, {{"CellId", 2}, {"ARFCN", 2}}), 4,
                                     cell(test::gsm, test::serving, {{"CellId", 3}, {"ARFCN", -3}}),
                                     cell(test::gsm, test::serving, {{"CellId", 4}, {"ARFCN", 4}})}));
  EXPECT_EQ(section.text(), "Cell ID=3\nARFCN=-3\n");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(GSMServingCell, MissingNumbersAreMissedOneByOne) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({cell(test::gsm, test::serving, {{"ARFCN", "9"}})}));
  EXPECT_EQ(section.text(), "");
  section.takeList(0xFF0001, PlistArray::make({cell(test::gsm, test::serving, {{"ARFCN", 9}})}));
  EXPECT_EQ(section.text(), "ARFCN=9\n");
  EXPECT_THAT(section.surroundings.log.errors(), ElementsAre("GSMServingCell: Failed to retrieve Cell ID\n",
                                                             "GSMServingCell: Failed to retrieve ARFCN\n",
                                                             "GSMServingCell: Failed to retrieve Cell ID\n"));
}

TEST(GSMServingCell, ACellListWithoutAServingGsmCellChangesAndSaysNothing) {
  auto section = Section::rows();
  section.takeList(0xFF0001, PlistArray::make({cell(test::lte, test::serving, {{"CellId", 1}})}));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(), IsEmpty());
}

TEST(GSMServingCell, AnUnreadableCellListIsLogged) {
  auto section = Section::rows();
  section.take(test::textRecord(0xFF0001, "no property list"));
  EXPECT_EQ(section.text(), "");
  EXPECT_THAT(section.surroundings.log.errors(),
              ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
}

}  // namespace
}  // namespace kelvasi
