// SPDX-License-Identifier: Apache-2.0
// What a radio engineer looks at first in a drive of UTRA TDD and GSM, over half an hour of several towns.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <map>
#include <optional>
#include <set>

#include "Simulator/Handset/CellSelection.h"
#include "Simulator/UTRAN/CellLayout.h"
#include "Simulator/UTRAN/DriveScenario.h"
#include "Telvon/Technology.h"
#include "Tests/Simulator/DisplayTexts.h"
#include "Tests/Simulator/HandsetWatch.h"
#include "Tests/Simulator/LongDrive.h"

namespace kelvasi::sim::utran {
namespace {

using gsm::World;
using test::DecodingViewer;

constexpr int manySteps = test::stepsOfHalfAnHour;

constexpr std::array sections{
    test::SectionOfTemplate{"RRC Info"},
    test::SectionOfTemplate{"Serving Cell Info"},
    test::SectionOfTemplate{"Neighbor Cell List", true},
    test::SectionOfTemplate{"GSM Neighbor Cell List", true},
    test::SectionOfTemplate{"TRCH BLER", true},
    test::SectionOfTemplate{"CCTRCH SIR", true},
};

struct UtranPlausibility : test::LongDrive<DriveScenario, World> {
  UtranPlausibility()
      : LongDrive(kTelvonLogChannelTechnology_Orvane_UTRAN2, "UTRAN", sections, layOutCells) {}
};

INSTANTIATE_TEST_SUITE_P(Seeds, UtranPlausibility, testing::ValuesIn(test::plausibleSeeds));

TEST_P(UtranPlausibility, ConnectionsAreSetUpAndReleased) {
  gsm::TransitionWatch watch;
  pass([&](const World& world) { watch.see(world); });
}

// UTRA TDD hands over hard (3GPP TS 25.331, 8.3.5): straight to a suitable cell of the same network. Without
// one the channel is released before there is another.
TEST_P(UtranPlausibility, ADedicatedChannelChangesOnlyToASuitableCellOfItsNetwork) {
  std::optional<std::size_t> before;
  int handovers = 0;
  pass([&](const World& world) {
    const bool isDedicated = world.connection().rrc() == gsm::Rrc::dch;
    const auto now = isDedicated ? world.serving() : std::nullopt;
    if (before && now && now != before) {
      const Cell& cell = world.cell(*now);
      ASSERT_EQ(cell.technology, Technology::umts);
      ASSERT_EQ(cell.locationArea.plmn, world.cell(*before).locationArea.plmn);
      ASSERT_TRUE(gsm::isSuitable(cell, world.reception(*now)));
      ++handovers;
    }
    before = now;
  });
  EXPECT_GT(handovers, 0);
}

// No record of this baseband tells it.
TEST_P(UtranPlausibility, CipheringStaysOnInEveryStateOfALiveSession) {
  gsm::CipheringWatch watch;
  pass([&](const World& world) {
    watch.see(world, world.isOn(Technology::umts) && world.connection().isCiphered());
  });
  EXPECT_EQ(watch.states().size(), 3u);
}

TEST_P(UtranPlausibility, BothTechnologiesServe) {
  int onGsm = 0;
  int onUmts = 0;
  pass([&](const World& world) {
    onGsm += world.isOn(Technology::gsm);
    onUmts += world.isOn(Technology::umts);
  });
  EXPECT_GE(onGsm, manySteps / 10);
  EXPECT_GE(onUmts, manySteps / 4);
}

struct Scale {
  std::string_view begin;
  std::string_view end;
  double least;
  double most;
};
// What 3GPP TS 25.123, 9.1.1, allows to be reported, by the rows that show it: a level of the received power
// of the common channel is divided by 256, the other levels stand as they are.
constexpr std::array scales{
    Scale{"/Neighbor Cell List", "/Filter RSCP", 0, 91.0 / 256},
    Scale{"/TRCH BLER", "/TRCH BLER Measurement", 0, 63},
    Scale{"/CCTRCH SIR", "", 0, 63},
};

TEST_P(UtranPlausibility, LevelsAreWithinWhatMayBeReported) {
  std::set<std::string_view> seen;
  play([&](const Messages&) {
    for (const auto& [path, text] : test::textsOf(viewer.display())) {
      for (const Scale& scale : scales) {
        if (!path.starts_with(scale.begin) || !path.ends_with(scale.end) || text.empty()) continue;
        const auto level = DecodingViewer::leadingNumber(text);
        ASSERT_TRUE(level && *level >= scale.least && *level <= scale.most) << path << " " << text;
        seen.insert(scale.begin);
      }
    }
  });
  EXPECT_EQ(seen.size(), scales.size());
}

// Before a report cuts them to its scale.
TEST_P(UtranPlausibility, NoCellIsReceivedStrongerThanItsCarrierMayBe) {
  pass([&](const World& world) {
    if (!world.isOn(Technology::umts)) return;
    ASSERT_LE(world.reception(*world.serving()).level, world.carrierPower());
    ASSERT_LE(world.reception(*world.serving()).ecNo, 0);
    ASSERT_LT(world.carrierPower(), -25);
  });
}

TEST_P(UtranPlausibility, TwoNetworksShareNeitherControllerNorChannel) {
  std::map<std::uint32_t, Plmn> controllers;
  std::map<std::uint16_t, Plmn> channels;
  for (const Cell& cell : layOutCells(Random(GetParam()))) {
    if (cell.technology != Technology::umts) continue;
    const Plmn& plmn = cell.locationArea.plmn;
    EXPECT_EQ(channels.try_emplace(cell.frequency, plmn).first->second, plmn);
    EXPECT_EQ(controllers.try_emplace(cell.id >> 16, plmn).first->second, plmn);
  }
  EXPECT_EQ(controllers.size(), 2u);
}

}  // namespace
}  // namespace kelvasi::sim::utran
