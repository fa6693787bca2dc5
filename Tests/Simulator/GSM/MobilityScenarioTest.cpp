// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/MobilityScenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <set>

#include "Telvon/Technology.h"
#include "Tests/Simulator/PlayedScenario.h"

namespace kelvasi::sim::gsm {
namespace {

using test::DecodingViewer;
using testing::IsEmpty;
using testing::IsSupersetOf;

constexpr int manySteps = 10000;

constexpr std::array sections{
    test::SectionOfTemplate{"Serving PLMN"},
    test::SectionOfTemplate{"Process CO"},
    test::SectionOfTemplate{"Process CS"},
    test::SectionOfTemplate{"Process PS"},
    test::SectionOfTemplate{"Equivalent PLMN List", true},
    test::SectionOfTemplate{"PDP Context Info", true},
};

DecodingViewer viewer() {
  return DecodingViewer(kTelvonLogChannelTechnology_Orvane_GSM, "Orvane_GSM", sections);
}

class Mobility : public testing::Test {
 protected:
  // Plays many steps; `look` is called after each with what was sent.
  template <typename Look>
  void play(Look look) {
    test::play(scenario, manySteps, look);
  }

  LibplistSerialiser plists;
  MobilityScenario scenario{7, plists};
};

TEST_F(Mobility, TheSameSeedGivesTheSameMessages) {
  test::expectTheSeedToDecide<MobilityScenario>();
}

TEST_F(Mobility, SendsEveryRecordOfTheMobilityManagement) {
  std::map<LogCode, int> counts;
  play([&](const Messages& messages) {
    for (const Message& message : messages) ++counts[message.logCode.value()];
  });
  std::set<LogCode> codes;
  for (const auto& [code, count] : counts) codes.insert(code);
  EXPECT_EQ(codes, (std::set<LogCode>{0x7130, 0x7131, 0x7132, 0x7135, 0x7150, 0xFF0001, 0xFF0002}));
}

TEST_F(Mobility, GreetsWithOneRecordOfEachCode) {
  Messages greeting;
  scenario.greet(greeting);
  std::set<LogCode> codes;
  for (const Message& message : greeting) EXPECT_TRUE(codes.insert(message.logCode.value()).second);
  EXPECT_EQ(codes.size(), 7u);
}

TEST_F(Mobility, RegisteredPlmnAndCellListAgreeAtEveryMoment) {
  DecodingViewer byRecord = viewer();
  DecodingViewer byCellList = viewer();
  int compared = 0;
  play([&](const Messages& messages) {
    byRecord.take(messages, 0x7135);
    byCellList.take(messages, 0xFF0001);
    const bool isInService = byRecord.text("Serving PLMN", "Service Type") != "NO_SERVICE";
    ASSERT_EQ(isInService, scenario.world().cells.serving.has_value());
    if (!isInService) return;
    for (const auto row : {"Mobile Country Code", "Mobile Network Code", "Location Area Code"}) {
      ASSERT_TRUE(byRecord.number("Serving PLMN", row));
      ASSERT_EQ(byRecord.number("Serving PLMN", row), byCellList.number("Serving PLMN", row)) << row;
    }
    ++compared;
  });
  EXPECT_GT(compared, manySteps / 2);
}

TEST_F(Mobility, ServiceFollowsTheStatesOfBothDomains) {
  DecodingViewer display = viewer();
  play([&](const Messages& messages) {
    display.take(messages);
    const std::string service = display.text("Serving PLMN", "Service Type");
    const std::string circuit = display.text("Process CS", "MM Sub State");
    const std::string packet = display.text("Process PS", "MM Sub State");
    if (circuit == "MM_NORMAL_SERVICE") {
      ASSERT_THAT(service, testing::AnyOf("CS_PS_SERVICE", "CS_ONLY"));
    }
    if (packet == "GMM_NORMAL_SERVICE") {
      ASSERT_THAT(service, testing::AnyOf("CS_PS_SERVICE", "PS_ONLY"));
    }
    if (circuit == "MM_PLMN_SEARCH" || circuit == "MM_NO_CELL_AVAILABLE") {
      ASSERT_EQ(service, "NO_SERVICE");
    }
    if (circuit == "MM_LIMITED_SERVICE" && packet == "GMM_LIMITED_SERVICE") {
      ASSERT_EQ(service, "LIMITED_SERVICE");
    }
    if (display.text("Process PS", "MM State") == "GMM_DEREGISTERED") {
      ASSERT_EQ(display.entries("PDP Context Info"), 0u);
    }
  });
  EXPECT_THAT(display.errors(), IsEmpty());
}

TEST_F(Mobility, AllThreeProcessSectionsShowTheSameServiceState) {
  DecodingViewer display = viewer();
  play([&](const Messages& messages) {
    display.take(messages);
    const std::string state = display.text("Process CO", "MM Service State");
    ASSERT_EQ(display.text("Process CS", "MM Service State"), state);
    ASSERT_EQ(display.text("Process PS", "MM Service State"), state);
    const std::string circuit = display.text("Process CS", "MM State");
    ASSERT_EQ(display.text("Process CO", "MM State"), circuit);
    if (circuit == "MM_LOCATION_UPDATE_INITIATED") {
      ASSERT_EQ(state, "REG_STATE_REGISTERING");
    }
    if (circuit == "MM_NULL") {
      ASSERT_NE(state, "REG_STATE_IDLE");
    }
  });
}

TEST_F(Mobility, GoesThroughTheWholeLifeOfAHandset) {
  DecodingViewer display = viewer();
  std::set<std::string> seen;
  play([&](const Messages& messages) {
    display.take(messages);
    for (const auto row : {"MM Service State", "MM State", "MM Sub State", "LU Reject Cause"})
      seen.insert(display.text("Process CS", row));
    for (const auto row : {"MM State", "MM Sub State", "Attach Reject Cause"})
      seen.insert(display.text("Process PS", row));
    seen.insert(display.text("Serving PLMN", "Service Type"));
    if (display.entries("PDP Context Info") > 0) seen.insert("a data session");
    if (display.entries("Equivalent PLMN List") > 0) seen.insert("an equivalent network");
  });
  EXPECT_THAT(seen, IsSupersetOf({"REG_STATE_INACTIVE",
                                  "REG_STATE_AUTOMATIC_SEARCH",
                                  "REG_STATE_REGISTERING",
                                  "REG_STATE_IDLE",
                                  "REG_STATE_DEREGISTERING",
                                  "MM_NULL",
                                  "MM_LOCATION_UPDATE_INITIATED",
                                  "MM_CONNECTION_ACTIVE",
                                  "MM_IMSI_DETACH_INITIATED",
                                  "MM_PLMN_SEARCH",
                                  "MM_NO_CELL_AVAILABLE",
                                  "MM_LIMITED_SERVICE",
                                  "MM_NORMAL_SERVICE",
                                  "UPDATED",
                                  "LOCATION_AREA_NOT_ALLOWED",
                                  "GMM_REGISTERED_INITIATED",
                                  "GMM_REGISTERED",
                                  "GMM_ROUTING_AREA_UPDATE_INITIATED",
                                  "GMM_SERVICE_REQUEST_INITIATED",
                                  "GMM_SUSPENDED",
                                  "GMM_GU1_UPDATED",
                                  "GMM_GU3_ROUTING_AREA_NOT_ALLOWED",
                                  "NO_SERVICE",
                                  "LIMITED_SERVICE",
                                  "CS_PS_SERVICE",
                                  "a data session",
                                  "an equivalent network"}));
  EXPECT_FALSE(seen.contains("Unknown"));
}

}  // namespace
}  // namespace kelvasi::sim::gsm
