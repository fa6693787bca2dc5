// SPDX-License-Identifier: Apache-2.0
// What a radio engineer looks at first in an LTE drive, over half an hour of several towns.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

#include "Simulator/LTE/CellLayout.h"
#include "Simulator/LTE/DriveScenario.h"
#include "Simulator/Radio/Town.h"
#include "Telvon/Technology.h"
#include "Tests/Simulator/DisplayTexts.h"
#include "Tests/Simulator/LongDrive.h"

namespace kelvasi::sim::lte {
namespace {

using test::DecodingViewer;
using test::has;

constexpr std::array sections{
    test::SectionOfTemplate{"Serving Cell Info"},
    test::SectionOfTemplate{"Serving Cell Measurements"},
    test::SectionOfTemplate{"Neighbor Measurements"},
    test::SectionOfTemplate{"Neighbor Cells List", true},
    test::SectionOfTemplate{"Connected mode LTE Intra-frequency Measurement"},
    test::SectionOfTemplate{"Measured Neighbor Cells", true},
    test::SectionOfTemplate{"SIM Info"},
};

struct LtePlausibility : test::LongDrive<DriveScenario, World> {
  LtePlausibility() : LongDrive(kTelvonLogChannelTechnology_Orvane_LTE, "LTE", sections) {}
};

INSTANTIATE_TEST_SUITE_P(Seeds, LtePlausibility, testing::ValuesIn(test::plausibleSeeds));

bool isSuitableNow(const World& world, std::size_t place) {
  return isSuitable(world.cell(place), world.average(place));
}

// dB by which the strongest suitable other cell of the serving carrier is stronger than the serving one.
double bestAdvantage(const World& world) {
  const std::size_t serving = *world.serving();
  double advantage = -100;
  for (std::size_t place = 0; place < world.cells().size(); ++place) {
    const bool isRival = place != serving && world.cell(place).technology == Technology::lte &&
                         world.cell(place).frequency == world.cell(serving).frequency &&
                         isSuitableNow(world, place);
    if (isRival) advantage = std::max(advantage, world.average(place).level - world.average(serving).level);
  }
  return advantage;
}

TEST_P(LtePlausibility, AnUnsuitableCellIsLeftAtOnceForAStrongerOneOfItsCarrier) {
  std::optional<std::size_t> unbearable;
  pass([&](const World& world) {
    if (unbearable) {
      ASSERT_NE(world.serving(), unbearable);
    }
    const bool isUnbearable =
        world.isOnLte() && !isSuitableNow(world, *world.serving()) && bestAdvantage(world) >= 8;
    unbearable = isUnbearable ? world.serving() : std::nullopt;
  });
}

// Whichever cells they are, and whatever their order.
TEST_P(LtePlausibility, BetterCellsOfTheCarrierWaitForTheReselectionTimeAndNoLonger) {
  constexpr int longest = 12;  // steps: two seconds, the step of the change and that of the search
  int waiting = 0;
  std::optional<std::size_t> serving;
  pass([&](const World& world) {
    const bool isWaiting = world.isOnLte() && world.serving() == serving && bestAdvantage(world) > 4;
    waiting = isWaiting ? waiting + 1 : 0;
    serving = world.serving();
    ASSERT_LE(waiting, longest);
  });
}

// Column and row of the grid that the sites stand on.
std::pair<int, int> gridPlace(const Cell& cell, std::uint32_t firstSite) {
  const int site = static_cast<int>((cell.id >> 8) - firstSite);
  return {site / siteRows, site % siteRows};
}

TEST_P(LtePlausibility, CodesOfOneCarrierDifferModuloThreeFromSiteToSite) {
  std::uint32_t firstSite = ~0U;
  std::map<std::uint16_t, std::vector<Cell>> carriers;
  for (const Cell& cell : layOutCells(Random(GetParam()))) {
    if (cell.technology != Technology::lte) continue;
    firstSite = std::min(firstSite, cell.id >> 8);
    carriers[cell.frequency].push_back(cell);
  }
  std::set<int> ofAll;
  for (const auto& [frequency, cells] : carriers) {
    std::set<int> seen;
    for (const Cell& cell : cells) {
      seen.insert(cell.code % 3);
      for (const Cell& other : cells) {
        const auto [column, row] = gridPlace(cell, firstSite);
        const auto [otherColumn, otherRow] = gridPlace(other, firstSite);
        if (std::abs(column - otherColumn) + std::abs(row - otherRow) == 1) {
          EXPECT_NE(cell.code % 3, other.code % 3) << frequency << ": " << cell.code << ", " << other.code;
        }
      }
    }
    EXPECT_GT(seen.size(), 1u) << frequency;
    ofAll.merge(seen);
  }
  EXPECT_EQ(ofAll.size(), 3u);
}

TEST_P(LtePlausibility, TwoNetworksShareNoChannel) {
  std::map<std::pair<Technology, std::uint16_t>, Plmn> owners;
  std::set<std::uint16_t> networks;
  for (const Cell& cell : layOutCells(Random(GetParam()))) {
    const auto [owner, isNew] = owners.try_emplace({cell.technology, cell.frequency}, cell.locationArea.plmn);
    EXPECT_EQ(owner->second, cell.locationArea.plmn) << cell.frequency;
    networks.insert(cell.locationArea.plmn.mnc);
  }
  EXPECT_EQ(networks.size(), 2u);
}

TEST_P(LtePlausibility, LevelsAreWhatCanBeReceived) {
  play([&](const Messages&) {
    for (const auto& [path, text] : test::textsOf(viewer.display())) {
      if (!path.ends_with("Measured RSSI")) continue;
      ASSERT_LT(DecodingViewer::leadingNumber(text).value(), -25) << path;
    }
    if (world().isOnLte()) {
      ASSERT_LT(world().rssi(*world().serving()), -25);
    }
  });
}

// Hz, of the shift that a record of a neighbour holds in 16 bits.
TEST_P(LtePlausibility, CellsAheadAreShiftedUpAndCellsBehindDown) {
  int up = 0;
  int down = 0;
  play([&](const Messages& messages) {
    if (!has(messages, 0xB180)) return;
    for (const std::string& text : viewer.column("Neighbor Cells List", "Frequency Offset")) {
      const auto shift = static_cast<std::int16_t>(static_cast<std::uint16_t>(std::stoi(text)));
      ASSERT_LE(std::abs(shift), 160);  // 18 m/s at 2.6 GHz
      up += shift > 5;
      down += shift < -5;
    }
  });
  EXPECT_GT(up, 100);
  EXPECT_GT(down, 100);
}

// Bit 7 of an entry's first byte of technologies is E-UTRAN's (3GPP TS 31.102, 4.2.53).
TEST_P(LtePlausibility, TheOperatorsListOfNetworksNamesEutran) {
  Messages greeting;
  scenario.greet(greeting);
  viewer.take(greeting);
  const std::string list = viewer.text("SIM Info", "EF-OPLMNAcT");
  ASSERT_GE(list.size(), 10u) << list;
  EXPECT_TRUE(std::stoi(list.substr(6, 2), nullptr, 16) & 0x40) << list;
}

}  // namespace
}  // namespace kelvasi::sim::lte
