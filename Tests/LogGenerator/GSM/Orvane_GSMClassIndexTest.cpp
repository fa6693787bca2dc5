// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;

TEST(Orvane_GSMClassIndex, MeasurementsWithoutNeighboursEmptyThatListAndFillTheOtherThree) {
  test::TestPlatform surroundings;
  const Orvane_GSMClassIndex index(surroundings.platform());
  const PlistValue neighbours = PlistArray::make({"as before"});
  index.getClass("Neighboring Cells")->updateSectionRef(neighbours);
  std::vector<PlistValue> others;
  for (const char* section : {"GPRS Information", "GSM Serving Cell", "GSM RR Info"}) {
    others.push_back(PlistDictionary::make());
    index.getClass(section)->updateSectionRef(others.back());
  }
  const Bytes bytes = test::record(0x5137, "0000 2A 45230100 46230100 0000 01 00 00");
  for (Base* decoder : index.getSubscribers(0x5137)) decoder->updateWithData(RecordView(bytes), 0x5137);
  EXPECT_EQ(test::asText(neighbours), "");
  EXPECT_EQ(test::asText(others[0]), "Cell Reselect Hysteresis=Applied\n");
  EXPECT_EQ(test::asText(others[1]), "RSSI=42 dBm\nC1 Value=9029\nC2 Value=9030\n");
  EXPECT_EQ(test::asText(others[2]), "Serving Rx Level=42\nRx Quality Full=74565\nRx Quality Sub=74566\n");
}

TEST(Orvane_GSMClassIndex, EveryReaderOfAnUnreadableCellListLogsItForItself) {
  test::TestPlatform surroundings;
  const Orvane_GSMClassIndex index(surroundings.platform());
  const Bytes bytes = test::textRecord(0xFF0001, "no property list");
  for (Base* decoder : index.getSubscribers(0xFF0001)) decoder->updateWithData(RecordView(bytes), 0xFF0001);
  std::vector<std::string> lines;
  for (int reader = 0; reader < 5; ++reader) {
    lines.push_back("Cell Info Array data could not be constructed");
    lines.push_back("Failed to get Cell Array\n");
  }
  EXPECT_THAT(surroundings.log.errors(), ElementsAreArray(lines));
}

TEST(Orvane_GSMClassIndex, ReleasesItsDecodersWithALine) {
  test::TestPlatform surroundings;
  { const Orvane_GSMClassIndex index(surroundings.platform()); }
  EXPECT_THAT(surroundings.trace.lines,
              ElementsAre("Deallocing Orvane_GSMClassIndex", "Deallocing ClassIndex"));
}

}  // namespace
}  // namespace kelvasi
