// SPDX-License-Identifier: Apache-2.0
// Record 0x7132 through the class index: one record, four sections.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;

struct FourSections {
  FourSections() {
    for (Base* decoder : index.getSubscribers(0x7132)) {
      sections.push_back(PlistDictionary::make());
      decoder->updateSectionRef(sections.back());
    }
  }
  void take(const Bytes& bytes) {
    for (Base* decoder : index.getSubscribers(0x7132)) decoder->updateWithData(RecordView(bytes), 0x7132);
  }
  std::vector<std::string> texts() const {
    std::vector<std::string> result;
    for (const PlistValue& section : sections) result.push_back(test::asText(section));
    return result;
  }

  test::TestPlatform surroundings;
  Orvane_GSMClassIndex index{surroundings.platform()};
  std::vector<PlistValue> sections;
};

TEST(RegistrationRecord, ReachesFourDecodersInTheOrderOfTheirCreation) {
  FourSections four;
  EXPECT_THAT(four.index.getSubscribers(0x7132),
              ElementsAre(&four.index.objProcessPS, &four.index.objProcessCO, &four.index.objServingPLMN,
                          &four.index.objProcessCS));
}

TEST(RegistrationRecord, GivesTheProcessesTheSameStateAndTheServingPlmnItsMode) {
  FourSections four;
  four.take(test::record(0x7132, "02 01 00"));
  const std::string state = "MM Service State=REG_STATE_REGISTERING\n";
  EXPECT_THAT(four.texts(), ElementsAre(state, state, "PLMN Sel Mod=Manual\n", state));
}

TEST(RegistrationRecord, ShowsEveryStateAndUnknownPastThem) {
  const char* texts[] = {"REG_STATE_INACTIVE",      "REG_STATE_IDLE",
                         "REG_STATE_REGISTERING",   "REG_STATE_DEREGISTERING",
                         "REG_STATE_MANUAL_SEARCH", "REG_STATE_AUTOMATIC_SEARCH",
                         "REG_STATE_OFFLINE",       "Unknown"};
  for (int state = 0; state < 8; ++state) {
    FourSections four;
    four.take(test::record(0x7132, "0" + std::to_string(state) + " 00 00"));
    EXPECT_EQ(four.texts()[0], std::string("MM Service State=") + texts[state] + "\n");
  }
}

TEST(RegistrationRecord, IsIgnoredAt15Bytes) {
  FourSections four;
  four.take(test::record(0x7132, "02 01"));
  EXPECT_THAT(four.texts(), ElementsAre("", "", "", ""));
}

}  // namespace
}  // namespace kelvasi
