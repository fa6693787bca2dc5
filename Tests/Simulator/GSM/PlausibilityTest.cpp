// SPDX-License-Identifier: Apache-2.0
// What a radio engineer looks at first in a GSM/UMTS drive, over half an hour of several towns.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

#include "Simulator/GSM/DriveScenario.h"
#include "Simulator/Handset/CellLayout.h"
#include "Telvon/Technology.h"
#include "Tests/Simulator/DisplayTexts.h"
#include "Tests/Simulator/HandsetWatch.h"
#include "Tests/Simulator/LongDrive.h"

namespace kelvasi::sim::gsm {
namespace {

using test::DecodingViewer;
using testing::AllOf;
using testing::Ge;
using testing::Le;
using testing::UnorderedElementsAreArray;

constexpr int manySteps = test::stepsOfHalfAnHour;
constexpr int stepsOfTwoMinutes = 600;

constexpr std::array sections{
    test::SectionOfTemplate{"GSM Serving Cell"},
    test::SectionOfTemplate{"GSM RR Info"},
    test::SectionOfTemplate{"UMTS RR Info"},
    test::SectionOfTemplate{"SIM Info"},
    test::SectionOfTemplate{"Neighboring Cells", true},
    test::SectionOfTemplate{"Active Set", true},
    test::SectionOfTemplate{"UMTS Set", true},
    test::SectionOfTemplate{"GSM Set", true},
};

struct GsmPlausibility : test::LongDrive<DriveScenario, World> {
  GsmPlausibility() : LongDrive(kTelvonLogChannelTechnology_Orvane_GSM, "Orvane_GSM", sections) {}
};

INSTANTIATE_TEST_SUITE_P(Seeds, GsmPlausibility, testing::ValuesIn(test::plausibleSeeds));

TEST_P(GsmPlausibility, BothTechnologiesServeSoonAndLong) {
  int step = 0;
  int onGsm = 0;
  int onUmts = 0;
  pass([&](const World& world) {
    ++step;
    onGsm += world.isOn(Technology::gsm);
    onUmts += world.isOn(Technology::umts);
    if (step != stepsOfTwoMinutes) return;
    EXPECT_GT(onGsm, 50);
    EXPECT_GT(onUmts, 50);
  });
  EXPECT_GE(onGsm, manySteps / 3);
  EXPECT_GE(onUmts, manySteps / 4);
}

TEST_P(GsmPlausibility, OnGsmTheUmtsNeighboursAreShown) {
  int moments = 0;
  int withNeighbours = 0;
  play([&](const Messages&) {
    if (!world().isOn(Technology::gsm)) return;
    ++moments;
    std::vector<std::string> codes;
    for (const std::size_t place : world().umtsNeighbours())
      codes.push_back(std::to_string(world().cell(place).code));
    ASSERT_THAT(viewer.column("UMTS Set", "Scrambling Code"), UnorderedElementsAreArray(codes));
    withNeighbours += !codes.empty();
    ASSERT_GE(viewer.entries("GSM Set"), 1u);
  });
  EXPECT_GT(withNeighbours, moments / 2);
}

TEST_P(GsmPlausibility, CipheringStaysOnInEveryStateOfALiveSession) {
  CipheringWatch watch;
  play([&](const Messages&) {
    ASSERT_NO_FATAL_FAILURE(watch.see(world(), viewer.text("UMTS RR Info", "Ciphering") == "Enabled"));
  });
  EXPECT_EQ(watch.states().size(), 3u);
}

TEST_P(GsmPlausibility, ConnectionsAreSetUpAndReleased) {
  TransitionWatch watch;
  pass([&](const World& world) { watch.see(world); });
}

TEST_P(GsmPlausibility, ADedicatedChannelThatLosesItsCellIsReleased) {
  DedicatedChannelWatch watch;
  pass([&](const World& world) { watch.see(world); });
}

TEST_P(GsmPlausibility, AConnectionStaysInItsNetwork) {
  std::optional<Plmn> network;
  pass([&](const World& world) {
    const bool isConnected = world.serving() && world.connection().isConnected();
    if (isConnected && network) {
      ASSERT_EQ(world.cell(*world.serving()).locationArea.plmn, *network);
    }
    network = isConnected ? std::optional(world.cell(*world.serving()).locationArea.plmn) : std::nullopt;
    for (const std::size_t place : world.activeSet().cells())
      ASSERT_EQ(world.cell(place).frequency, world.cell(*world.serving()).frequency);
  });
}

TEST_P(GsmPlausibility, TwoNetworksShareNeitherControllerNorChannel) {
  std::map<std::uint32_t, Plmn> controllers;
  std::map<std::pair<Technology, std::uint16_t>, Plmn> channels;
  std::set<std::uint16_t> networks;
  for (const Cell& cell : layOutCells(Random(GetParam()))) {
    const Plmn& plmn = cell.locationArea.plmn;
    networks.insert(plmn.mnc);
    EXPECT_EQ(channels.try_emplace({cell.technology, cell.frequency}, plmn).first->second, plmn);
    if (cell.technology == Technology::umts) {
      EXPECT_EQ(controllers.try_emplace(cell.id >> 16, plmn).first->second, plmn);
    }
  }
  EXPECT_EQ(networks.size(), 2u);
  EXPECT_EQ(controllers.size(), 2u);
}

struct Scale {
  std::string_view begin;
  std::string_view end;
  double least;
  double most;
};
// What 3GPP allows to be reported, by the rows that show it.
constexpr std::array scales{
    Scale{"/Active Set", "/RSCP", -121, -25},
    Scale{"/UMTS Set", "RSCP", -121, -25},
    Scale{"/Active Set", "/Energy Per Chip", -24, 0},
    Scale{"/UMTS Set", "/Energy Per Chip", -24, 0},
    Scale{"/GSM Set", "/RSSI", -111, -48},
    Scale{"/Neighboring Cells", "/RSSI", -111, 63},
    Scale{"/GSM RR Info", "/Serving Rx Level", 0, 63},
};

TEST_P(GsmPlausibility, LevelsAreWithinWhatMayBeReported) {
  std::set<std::string_view> seen;
  play([&](const Messages&) {
    for (const auto& [path, text] : test::textsOf(viewer.display())) {
      for (const Scale& scale : scales) {
        if (!path.starts_with(scale.begin) || !path.ends_with(scale.end) || text.empty()) continue;
        ASSERT_THAT(DecodingViewer::leadingNumber(text).value(), AllOf(Ge(scale.least), Le(scale.most)))
            << path;
        seen.insert(scale.begin);
      }
    }
    ASSERT_LT(world().carrierPower(), -25);
  });
  EXPECT_EQ(seen.size(), 5u);
}

// The last digit makes the sum by Luhn's rule a multiple of 10 (ISO/IEC 7812-1, annex B).
TEST(SimCard, ItsNumberHasARightCheckDigit) {
  const LibplistSerialiser plists;
  DriveScenario scenario(1, plists);
  DecodingViewer viewer{kTelvonLogChannelTechnology_Orvane_GSM, "Orvane_GSM", sections};
  Messages greeting;
  scenario.greet(greeting);
  viewer.take(greeting);
  const std::string number = viewer.text("SIM Info", "EF-ICCID");
  ASSERT_EQ(number.size(), 19u) << number;
  int sum = 0;
  bool isDoubled = false;
  for (auto digit = number.rbegin(); digit != number.rend(); ++digit, isDoubled = !isDoubled) {
    const int value = (*digit - '0') * (isDoubled ? 2 : 1);
    sum += value / 10 + value % 10;
  }
  EXPECT_EQ(sum % 10, 0) << number;
}

}  // namespace
}  // namespace kelvasi::sim::gsm
