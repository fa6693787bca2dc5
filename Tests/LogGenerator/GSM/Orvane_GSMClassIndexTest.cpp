// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>

#include "LogGenerator/GSM/Orvane_GSMLogGenerator.h"
#include "Tests/Support/CellList.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;

struct Expected {
  std::string_view section;
  std::string trace;
  std::vector<LogCode> logCodes;
  bool isSilent = false;  // says nothing about a code that it did not ask for
};

// In the order of creation.
const std::array<Expected, 26> decoders{{
    {"Active Set", "ActiveSet", {0x417A}},
    {"Coding Scheme", "CellChangeCounters", {}, true},
    {"GPRS Information", "GPRSInformation", {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137}},
    {"GSM Serving Cell", "GSMServingCell", {0x5134, 0x5137, 0x5076, 0xFF0001}},
    {"Mobile Allocation", "MobileAllocation", {0x51F8}},
    {"Neighboring Cells", "NeighboringCells", {0x5137, 0x51FF, 0xFF0001}},
    {"PDP Context Info", "PDPContextList", {0xFF0002}},
    {"Process PS", "ProcessPS", {0x7130, 0x7132}},
    {"UMTS RR Measurement", "UMTSRRMeasurement", {}, true},
    {"Cell Change Counters", "CellChangeCounters", {}, true},
    {"Detected Set", "DetectedSet", {0x417A}},
    {"GSM Set", "GSMSet", {0x4005}},
    {"Non-Ranked GSM Set", "NonRankedGSMSet", {}, true},
    {"Process CO", "ProcessCS", {0x7131, 0x7132}},
    {"Serving PLMN", "Serving PLMN", {0x7135, 0x7132, 0xFF0001}},
    {"UMTS Set", "UMTSSet", {0x4005, 0xFF0001}},
    {"Equivalent PLMN List", "Equivalent PLMN List", {0x7150}},
    {"GSM RR Info", "GSMRRInfo", {0x512C, 0x5137, 0x5072, 0x51F6}},
    {"Monitored Set", "MonitoredSet", {0x417A}},
    {"Non-Ranked UMTS Set", "NonRankedUMTSSet", {}, true},
    {"Process CS", "ProcessCS", {0x7131, 0x7132}},
    {"UMTS RR Info", "UMTSRRInfo", {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001}},
    {"BLER", "BLER", {0x4116}},
    {"Virtual Active Set", "VirtualActiveSet", {0x417A}},
    {"SIM Info", "SimInfo", {0xFF0000}, true},
    {"HSDPA Info", "HSDPA Info", {0x4221}, true},
}};

// Every code that a decoder asks for, in the order in which it is first asked for.
const std::vector<int> startCodes{0x417A, 0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137, 0x5134,
                                  0x5076, 0x51F8, 0x51FF, 0x7130, 0x7132, 0x4005, 0x7131, 0x7150, 0x512C,
                                  0x5072, 0x4125, 0x4031, 0x4127, 0x4157, 0x4116, 0x4221};
const std::vector<int> extraStartCodes{1, 2, 0};

std::vector<std::string_view> subscribers(const ClassIndex& index, LogCode logCode) {
  std::vector<std::string_view> names;
  for (const Base* decoder : index.getSubscribers(logCode)) names.push_back(decoder->getSectionName());
  return names;
}

TEST(Orvane_GSMClassIndex, CreatesItsDecodersInThisOrder) {
  test::TestPlatform surroundings;
  const Orvane_GSMClassIndex index(surroundings.platform());
  std::vector<std::string> counts;
  for (const Expected& expected : decoders)
    counts.push_back("Array Count: " + std::to_string(expected.logCodes.size()));
  EXPECT_THAT(surroundings.log.warnings(), ElementsAreArray(counts));
}

TEST(Orvane_GSMClassIndex, EveryDecoderAsksForItsCodesInOrder) {
  test::TestPlatform surroundings;
  const Orvane_GSMClassIndex index(surroundings.platform());
  for (const Expected& expected : decoders) {
    ASSERT_NE(index.getClass(expected.section), nullptr) << expected.section;
    EXPECT_THAT(index.getClass(expected.section)->getLogCodeArray(), ElementsAreArray(expected.logCodes))
        << expected.section;
  }
}

TEST(Orvane_GSMClassIndex, TheSubscribersOfACodeReceiveARecordInTheOrderOfCreation) {
  test::TestPlatform surroundings;
  const Orvane_GSMClassIndex index(surroundings.platform());
  for (const auto& key : index.getAllLogCodes()) {
    const auto logCode = static_cast<LogCode>(std::stoul(key));
    std::vector<std::string_view> names;
    for (const Expected& expected : decoders) {
      if (std::ranges::count(expected.logCodes, logCode) != 0) names.push_back(expected.section);
    }
    EXPECT_EQ(subscribers(index, logCode), names) << key;
  }
  EXPECT_THAT(subscribers(index, 0x5137),
              ElementsAre("GPRS Information", "GSM Serving Cell", "Neighboring Cells", "GSM RR Info"));
}

std::vector<int> numbers(const PlistValue& list) {
  std::vector<int> found;
  for (const PlistValue& element : *list.array()) found.push_back(static_cast<int>(*element.integer()));
  return found;
}

TEST(Orvane_GSMClassIndex, TheStartCommandNamesEveryCodeOnce) {
  test::TestPlatform surroundings;
  const Orvane_GSMLogGenerator generator(surroundings.platform());
  const PlistValue command = generator.getStartCommand();
  EXPECT_EQ(command.dictionary()->size(), 3u);
  EXPECT_EQ(command.dictionary()->get("SetState"), PlistValue("Streaming"));
  EXPECT_EQ(numbers(command.dictionary()->get("SetOrvaneLogCodes")), startCodes);
  EXPECT_EQ(numbers(command.dictionary()->get("SetTelvonExtraCodes")), extraStartCodes);
}

TEST(Orvane_GSMClassIndex, EveryDecoderWritesItsTraceAndNamesACodeThatItDidNotAskFor) {
  for (const Expected& expected : decoders) {
    test::TestPlatform surroundings;
    const Orvane_GSMClassIndex index(surroundings.platform());
    surroundings.log.clear();
    const Bytes bytes = test::record(0x1234, "01", 100);
    index.getClass(expected.section)->updateWithData(RecordView(bytes), 0x1234);
    EXPECT_THAT(surroundings.log.warnings(), ElementsAre(expected.trace)) << expected.section;
    std::vector<std::string> errors;
    if (!expected.isSilent) errors.push_back("Received an unknown log message: 4660");
    EXPECT_EQ(surroundings.log.errors(), errors) << expected.section;
  }
}

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
