// SPDX-License-Identifier: Apache-2.0
#include "Simulator/UTRAN/DriveScenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <set>

#include "Simulator/UTRAN/UtranRecords.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/UTRAN/Required.h"
#include "Tests/Simulator/PlayedScenario.h"
#include "Tests/Simulator/RivalWatch.h"

namespace kelvasi::sim::utran {
namespace {

using test::DecodingViewer;
using test::has;
using test::RivalWatch;
using testing::Contains;
using testing::IsEmpty;
using testing::Not;

constexpr int manySteps = 9000;  // half an hour
constexpr std::array seeds{1, 11, 2024};

constexpr auto info = "Serving Cell Info";
constexpr auto neighbourCells = "Neighbor Cell List";

constexpr std::array sections{
    test::SectionOfTemplate{"RRC Info"},           test::SectionOfTemplate{info},
    test::SectionOfTemplate{neighbourCells, true}, test::SectionOfTemplate{"GSM Neighbor Cell List", true},
    test::SectionOfTemplate{"TRCH BLER", true},    test::SectionOfTemplate{"CCTRCH SIR", true},
    test::SectionOfTemplate{"SIM Info"},           test::SectionOfTemplate{"PDP Context Info", true},
};

DecodingViewer viewer() {
  return DecodingViewer(kTelvonLogChannelTechnology_Orvane_UTRAN2, "UTRAN", sections);
}

class UtranDrive : public testing::TestWithParam<int> {
 protected:
  template <typename Look>
  void play(int steps, Look look) {
    test::play(scenario, steps, look);
  }
  void decode(const Messages& messages) { displays.take(messages); }

  const World& world() const { return scenario.world(); }
  std::string rrcState() const { return baseband.text("RRC Info", "State"); }

  void checkServingCell();
  void checkNeighbours();
  void checkChannels(const Messages& messages);

  LibplistSerialiser plists;
  DriveScenario scenario{static_cast<std::uint64_t>(GetParam()), plists};
  test::ViewerOfEachWay displays{viewer};
  DecodingViewer& baseband = displays.baseband;
  DecodingViewer& daemon = displays.daemon;
};

INSTANTIATE_TEST_SUITE_P(Seeds, UtranDrive, testing::ValuesIn(seeds));

void UtranDrive::checkServingCell() {
  const Cell& cell = world().cell(*world().serving());
  for (const DecodingViewer* display : {&baseband, &daemon}) {
    ASSERT_EQ(display->number(info, "Cell ID"), cell.id);
    ASSERT_EQ(display->number(info, "Uplink UARFCN"), cell.frequency);
    ASSERT_EQ(display->number(info, "Downlink UARFCN"), cell.frequency);
  }
  ASSERT_EQ(baseband.number(info, "URA ID"), cell.routingArea);
  ASSERT_EQ(baseband.text(info, "Allowed Access"), cell.isForbidden ? "Emergency Calls Only" : "All Calls");
  ASSERT_EQ(daemon.number(info, "Local Area Code"), cell.locationArea.code);
  ASSERT_EQ(daemon.number(info, "Cell Scrambling Code"), cell.code);
}

void UtranDrive::checkNeighbours() {
  const auto& places = world().umtsNeighbours();
  ASSERT_EQ(baseband.entries(neighbourCells), places.size());
  for (std::size_t place = 0; place < places.size(); ++place) {
    const Cell& cell = world().cell(places[place]);
    const auto row = [&](std::string_view name) { return baseband.column(neighbourCells, name).at(place); };
    ASSERT_NE(places[place], world().serving());
    ASSERT_EQ(row("UARFCN"), std::to_string(cell.frequency));
    ASSERT_EQ(row("Cell ID"), std::to_string(cell.code));
    const double level = DecodingViewer::leadingNumber(row("Filter RSCP")).value() * 256 - 116;
    ASSERT_NEAR(level, std::max(world().reception(places[place]).level, -116.0), 0.51);
    ASSERT_THAT(row("Status"), testing::AnyOf("MSET", "DSET"));
    ASSERT_EQ(row("inJDCS"), isDetectedJointly(world(), places[place]) ? "TRUE" : "FALSE");
  }
  // Its decoder never shows a cell.
  ASSERT_EQ(baseband.entries("GSM Neighbor Cell List"), 0u);
}

void UtranDrive::checkChannels(const Messages& messages) {
  const bool isOnChannel = rrcState() == "Cell DCH" || rrcState() == "Cell Fach";
  const auto ids = baseband.column("TRCH BLER", "TRCH ID");
  if (!isOnChannel || !world().serving()) {
    ASSERT_THAT(ids, IsEmpty());
  }
  ASSERT_EQ(baseband.entries("CCTRCH SIR"), ids.empty() ? 0u : 1u);
  if (!has(messages, 0xD00C) || ids.empty()) return;
  const auto& channels = world().traffic().channels();
  ASSERT_EQ(ids.size(), channels.size());
  for (std::size_t place = 0; place < ids.size(); ++place)
    ASSERT_EQ(ids[place], std::to_string(channels[place].id));
  const PlistValue channel = baseband.sectionOf("CCTRCH SIR").array()->at(0);
  const PlistValue ratios = channel.dictionary()->get("SIR");
  ASSERT_EQ(ratios.array()->size(), 6u);
  for (std::size_t slot = 0; slot < 6; ++slot) {
    const double shown = DecodingViewer::leadingNumber(*ratios.array()->at(slot).string()).value() / 2 - 11;
    ASSERT_NEAR(shown, std::clamp(interferenceRatio(world(), slot), -11.0, 20.5), 0.251);
  }
}

TEST_P(UtranDrive, EveryMomentIsCoherent) {
  constexpr std::array<const char*, 6> modes{"Disconnected", "Connecting", "Cell Fach",
                                             "Cell DCH",     "Cell PCH",   "Cell URA PCH"};
  play(manySteps, [&](const Messages& messages) {
    decode(messages);
    ASSERT_EQ(rrcState(), modes[static_cast<std::size_t>(world().connection().rrc())]);
    if (world().isOn(Technology::umts)) {
      ASSERT_NO_FATAL_FAILURE(checkServingCell());
    } else {
      ASSERT_FALSE(has(messages, 0xD0E2));
      ASSERT_EQ(rrcState(), "Disconnected");
    }
    if (has(messages, 0xD00A)) {
      ASSERT_NO_FATAL_FAILURE(checkNeighbours());
    }
    ASSERT_NO_FATAL_FAILURE(checkChannels(messages));
    for (const Message& message : messages) {
      if (message.logCode == LogCode{0xD0E0}) {
        ASSERT_EQ(message.bytes.size(), 15u);  // a shorter one is reported
      }
    }
  });
  EXPECT_THAT(baseband.errors(), IsEmpty());
  EXPECT_THAT(daemon.errors(), IsEmpty());
}

// A suitable cell of better Ec/No by more than the margin; nobody while the serving cell is being given up.
std::size_t rivalOf(const World& world) {
  std::size_t rival = RivalWatch::nobody;
  if (!world.isOn(Technology::umts)) return rival;
  const std::size_t serving = *world.serving();
  if (!gsm::isSuitable(world.cell(serving), world.reception(serving))) return rival;
  for (const std::size_t place : world.umtsNeighbours()) {
    const Reception& heard = world.reception(place);
    const double least =
        rival == RivalWatch::nobody ? world.reception(serving).ecNo + 3 : world.reception(rival).ecNo;
    if (heard.level > -108 && heard.ecNo > -17 && heard.ecNo > least) rival = place;
  }
  return rival;
}

TEST_P(UtranDrive, StaysOnTheBestCellWithinTheMargin) {
  constexpr int longest = 7;  // steps: a second, the step of the change and that of the search
  RivalWatch watch;
  play(manySteps, [&](const Messages&) {
    watch.see(world().serving().value_or(RivalWatch::nobody), rivalOf(world()));
    ASSERT_LE(watch.steps(), longest);
  });
  EXPECT_GT(watch.takeovers(), 3);
}

TEST_P(UtranDrive, GoesThroughTheStatesOfAConnectionAndBothTechnologies) {
  std::set<std::string> seen;
  play(3 * manySteps, [&](const Messages& messages) {
    decode(messages);
    seen.insert(rrcState());
    if (!world().serving()) return void(seen.insert("no service"));
    const Cell& cell = world().cell(*world().serving());
    seen.insert(cell.technology == Technology::gsm ? "GSM" : std::to_string(cell.frequency));
    for (const auto row : {"Status", "inJDCS"}) {
      for (const std::string& text : baseband.column(neighbourCells, row)) seen.insert(text);
    }
    seen.insert("neighbours " + std::to_string(baseband.entries(neighbourCells)));
    if (!world().gsmNeighbours().empty()) seen.insert("GSM neighbours");
    seen.insert(baseband.text(info, "Allowed Access"));
  });
  EXPECT_THAT(
      seen, testing::IsSupersetOf({"Disconnected", "Connecting", "Cell Fach", "Cell DCH", "Cell URA PCH",
                                   "no service", "GSM", "10055", "10063", "10071", "MSET", "DSET", "TRUE",
                                   "FALSE", "neighbours 2", "neighbours 5", "GSM neighbours", "All Calls"}));
  EXPECT_FALSE(seen.contains("Unknown RRC Mode"));
}

TEST_P(UtranDrive, SendsWithinAMinuteEveryRequiredCodeAndNoneThatTheViewerDoesNotSubscribeTo) {
  test::expectEveryCode(scenario, 300, baseband.generator(), kelvasi::test::requiredCodes<UTRANClassIndex>());
}

TEST(UtranDriveSeed, TheSameSeedGivesTheSameMessages) {
  test::expectTheSeedToDecide<DriveScenario>();
}

// 3GPP TS 25.123, 9.1.1.4: level 0 is a rate of 0, 1 begins at 10^-4.03, each level has 0.065 of the
// logarithm.
TEST(BlockErrorLevel, FollowsTheTable) {
  EXPECT_EQ(blockErrorLevel(0), 0);
  EXPECT_EQ(blockErrorLevel(std::pow(10, -4.0)), 1);
  EXPECT_EQ(blockErrorLevel(std::pow(10, -3.95)), 2);
  EXPECT_EQ(blockErrorLevel(0.01), 32);
  EXPECT_EQ(blockErrorLevel(0.9), 62);
  EXPECT_EQ(blockErrorLevel(1), 63);
}

}  // namespace
}  // namespace kelvasi::sim::utran
