// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/DriveScenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>

#include "Telvon/Technology.h"
#include "Tests/LogGenerator/GSM/Required.h"
#include "Tests/Simulator/PlayedScenario.h"

namespace kelvasi::sim::gsm {
namespace {

using test::DecodingViewer;
using test::has;
using testing::AnyOf;
using testing::Contains;
using testing::IsEmpty;
using testing::Not;
using testing::UnorderedElementsAreArray;

constexpr int manySteps = 10000;

constexpr std::array sections{
    test::SectionOfTemplate{"Serving PLMN"},
    test::SectionOfTemplate{"Process CO"},
    test::SectionOfTemplate{"Process CS"},
    test::SectionOfTemplate{"Process PS"},
    test::SectionOfTemplate{"GSM Serving Cell"},
    test::SectionOfTemplate{"GSM RR Info"},
    test::SectionOfTemplate{"GPRS Information"},
    test::SectionOfTemplate{"Mobile Allocation"},
    test::SectionOfTemplate{"UMTS RR Info"},
    test::SectionOfTemplate{"HSDPA Info"},
    test::SectionOfTemplate{"BLER"},
    test::SectionOfTemplate{"SIM Info"},
    test::SectionOfTemplate{"Equivalent PLMN List", true},
    test::SectionOfTemplate{"PDP Context Info", true},
    test::SectionOfTemplate{"Neighboring Cells", true},
    test::SectionOfTemplate{"Active Set", true},
    test::SectionOfTemplate{"UMTS Set", true},
    test::SectionOfTemplate{"GSM Set", true},
};

DecodingViewer viewer() {
  return DecodingViewer(kTelvonLogChannelTechnology_Orvane_GSM, "Orvane_GSM", sections);
}

class Drive : public testing::Test {
 protected:
  template <typename Look>
  void play(int steps, Look look) {
    test::play(scenario, steps, look);
  }
  void decode(const Messages& messages) { displays.take(messages); }
  const World& world() const { return scenario.world(); }
  std::string rrcState() const { return baseband.text("UMTS RR Info", "RRC State"); }
  std::string rrState() const { return baseband.text("GSM RR Info", "RR State"); }
  std::string mmState() const { return baseband.text("Process CS", "MM State"); }

  // Of these cells of the world, in their order.
  std::vector<std::string> texts(const std::vector<std::size_t>& places, std::uint16_t Cell::*number) const {
    std::vector<std::string> result;
    for (const std::size_t place : places) result.push_back(std::to_string(world().cell(place).*number));
    return result;
  }
  void checkUmtsCell();
  void checkGsmCell();
  void checkNoService();
  void checkConnection();
  void checkRecords(const Messages& messages);

  LibplistSerialiser plists;
  DriveScenario scenario{11, plists};
  test::ViewerOfEachWay displays{viewer};
  DecodingViewer& baseband = displays.baseband;
  DecodingViewer& daemon = displays.daemon;
};

void Drive::checkUmtsCell() {
  const Cell& cell = world().cell(*world().serving());
  for (const DecodingViewer* display : {&baseband, &daemon})
    ASSERT_EQ(display->number("UMTS RR Info", "Cell ID"), cell.id);
  ASSERT_EQ(baseband.number("UMTS RR Info", "Downlink Frequency"), cell.frequency);
  ASSERT_EQ(daemon.number("UMTS RR Info", "UARFCN"), cell.frequency);
  const std::string code = daemon.text("UMTS RR Info", "Scrambling Code");
  ASSERT_EQ(code, std::to_string(cell.code));
  const auto active = baseband.column("Active Set", "Scrambling Code");
  ASSERT_EQ(active, texts(world().activeSet().cells(), &Cell::code));
  ASSERT_EQ(active.at(0), code);
  if (active.size() > 1) {
    ASSERT_EQ(rrcState(), "CELL_DCH");
  }
  auto ranked = baseband.column("UMTS Set", "Scrambling Code");
  ASSERT_THAT(ranked, testing::IsSupersetOf(active));
  ASSERT_EQ(ranked.at(0), code);
  ranked.erase(ranked.begin());
  ASSERT_THAT(ranked, Not(Contains(code)));
  ASSERT_THAT(ranked, UnorderedElementsAreArray(texts(world().umtsNeighbours(), &Cell::code)));
  ASSERT_THAT(daemon.column("UMTS Set", "Scrambling Code"), UnorderedElementsAreArray(ranked));
  ASSERT_THAT(daemon.column("Neighboring Cells", "ARFCN"),
              UnorderedElementsAreArray(texts(world().gsmNeighbours(), &Cell::frequency)));
  ASSERT_EQ(baseband.entries("GSM Set"), 0u);
  ASSERT_THAT(rrState(), testing::MatchesRegex("RR_INACTIVE|RR_G2W.*"));
}

void Drive::checkGsmCell() {
  const Cell& cell = world().cell(*world().serving());
  for (const DecodingViewer* display : {&baseband, &daemon}) {
    ASSERT_EQ(display->number("GSM Serving Cell", "Cell ID"), cell.id);
    ASSERT_EQ(display->number("GSM Serving Cell", "ARFCN"), cell.frequency);
  }
  ASSERT_EQ(baseband.number("GSM Serving Cell", "BSIC"), cell.code);
  const std::string arfcn = std::to_string(cell.frequency);
  auto ranked = baseband.column("GSM Set", "ARFCN");
  ASSERT_EQ(ranked.at(0), arfcn);
  ranked.erase(ranked.begin());
  ASSERT_THAT(ranked, Not(Contains(arfcn)));
  ASSERT_THAT(ranked, UnorderedElementsAreArray(texts(world().gsmNeighbours(), &Cell::frequency)));
  for (const DecodingViewer* display : {&baseband, &daemon})
    ASSERT_THAT(display->column("Neighboring Cells", "ARFCN"), UnorderedElementsAreArray(ranked));
  ASSERT_THAT(baseband.column("Neighboring Cells", "BSIC"),
              UnorderedElementsAreArray(texts(world().gsmNeighbours(), &Cell::code)));
  ASSERT_THAT(daemon.column("UMTS Set", "Scrambling Code"),
              UnorderedElementsAreArray(texts(world().umtsNeighbours(), &Cell::code)));
  ASSERT_EQ(baseband.entries("Active Set"), 0u);
  ASSERT_EQ(baseband.entries("UMTS Set"), 0u);
  ASSERT_EQ(rrcState(), "Disconnected");
}

void Drive::checkNoService() {
  ASSERT_EQ(baseband.text("Serving PLMN", "Service Type"), "NO_SERVICE");
  for (const auto section : {"Active Set", "UMTS Set", "GSM Set"}) ASSERT_EQ(baseband.entries(section), 0u);
  for (const auto section : {"Neighboring Cells", "UMTS Set"}) ASSERT_EQ(daemon.entries(section), 0u);
  ASSERT_EQ(rrcState(), "Disconnected");
  ASSERT_THAT(mmState(), AnyOf("MM_NULL", "MM_IDLE"));
}

// Mobility management, RRC and RR tell of the same connection.
void Drive::checkConnection() {
  const bool isUmts = world().isOn(Technology::umts);
  if (mmState() == "MM_CONNECTION_ACTIVE" && isUmts) {
    ASSERT_EQ(rrcState(), "CELL_DCH");
  }
  if (mmState() == "MM_CONNECTION_ACTIVE" && !isUmts) {
    ASSERT_THAT(rrState(), AnyOf("RR_DATA_TRANSFER", "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"));
  }
  if (mmState() == "MM_LOCATION_UPDATE_INITIATED") {
    ASSERT_NE(isUmts ? rrcState() : rrState(), isUmts ? "Disconnected" : "RR_IDLE");
  }
  if (isUmts && baseband.text("UMTS RR Info", "Ciphering") == "Enabled") {
    ASSERT_THAT(rrcState(), AnyOf("CELL_DCH", "CELL_FACH", "URA_PCH"));
  }
  if (baseband.text("Process PS", "MM State") == "GMM_DEREGISTERED") {
    ASSERT_EQ(daemon.entries("PDP Context Info"), 0u);
  }
}

// Some records belong to some states only.
void Drive::checkRecords(const Messages& messages) {
  const bool isOnChannel = rrcState() == "CELL_DCH" || rrcState() == "CELL_FACH";
  if (has(messages, 0x4221)) {
    ASSERT_EQ(rrcState(), "CELL_DCH");
  }
  if (has(messages, 0x4116) || has(messages, 0x4031)) {
    ASSERT_TRUE(isOnChannel);
  }
  for (const LogCode code : {0x5134U, 0x5137U, 0x51FFU, 0x5072U, 0x51F4U, 0x51F5U, 0x51F6U, 0x51FBU, 0x51FDU})
    ASSERT_FALSE(has(messages, code) && !world().isOn(Technology::gsm));
  if (has(messages, 0x51F8)) {
    ASSERT_TRUE(world().isOn(Technology::gsm) && world().connection().isDedicated());
  }
}

TEST_F(Drive, EveryMomentIsCoherent) {
  std::map<std::string, int> moments;
  play(manySteps, [&](const Messages& messages) {
    decode(messages);
    if (!world().serving()) {
      ++moments["none"];
      ASSERT_NO_FATAL_FAILURE(checkNoService());
    } else if (world().isOn(Technology::umts)) {
      ++moments["UMTS"];
      ASSERT_NO_FATAL_FAILURE(checkUmtsCell());
    } else {
      ++moments["GSM"];
      ASSERT_NO_FATAL_FAILURE(checkGsmCell());
    }
    if (world().serving()) {
      for (const auto row : {"Mobile Country Code", "Mobile Network Code", "Location Area Code"})
        ASSERT_EQ(baseband.number("Serving PLMN", row), daemon.number("Serving PLMN", row)) << row;
    }
    ASSERT_NO_FATAL_FAILURE(checkConnection());
    ASSERT_NO_FATAL_FAILURE(checkRecords(messages));
  });
  EXPECT_GT(moments["none"], manySteps / 100);
  EXPECT_GT(moments["UMTS"], manySteps / 10);
  EXPECT_GT(moments["GSM"], manySteps / 20);
  EXPECT_THAT(baseband.errors(), IsEmpty());
  EXPECT_THAT(daemon.errors(), IsEmpty());
}

// At the moment of its record, each display shows what the radio model says.
TEST_F(Drive, MeasurementsAreThoseOfTheRadioModel) {
  int umts = 0;
  int gsm = 0;
  play(3000, [&](const Messages& messages) {
    decode(messages);
    if (!world().serving()) return;
    const Reception& serving = world().reception(*world().serving());
    if (world().isOn(Technology::umts) && has(messages, 0x417A)) {
      const auto rscp = DecodingViewer::leadingNumber(baseband.column("Active Set", "RSCP").at(0));
      const auto ecNo = DecodingViewer::leadingNumber(baseband.column("Active Set", "Energy Per Chip").at(0));
      ASSERT_NEAR(rscp.value(), serving.level, 2.6);
      ASSERT_NEAR(ecNo.value(), serving.ecNo, 1.5);  // the steps of the Ec/No ladder are uneven
      ++umts;
    }
    if (world().isOn(Technology::umts) && has(messages, 0x4005)) {
      const auto rscp = DecodingViewer::leadingNumber(baseband.column("UMTS Set", "RSCP").at(0));
      const auto ecNo = DecodingViewer::leadingNumber(baseband.column("UMTS Set", "Energy Per Chip").at(0));
      ASSERT_NEAR(rscp.value(), serving.level, 0.51);
      ASSERT_NEAR(ecNo.value(), serving.ecNo, 0.26);
    }
    if (world().isOn(Technology::gsm) && has(messages, 0x5137)) {
      const double level = std::clamp(serving.level + 110, 0.0, 63.0);
      ASSERT_NEAR(baseband.number("GSM RR Info", "Serving Rx Level").value(), level, 1);
      ++gsm;
    }
    if (has(messages, 0x4031)) {
      ASSERT_NEAR(baseband.number("UMTS RR Info", "Transmit Power").value(), world().transmitPower(),
                  1);  // cut to whole dB
    }
  });
  EXPECT_GT(umts, 100);
  EXPECT_GT(gsm, 20);
}

TEST_F(Drive, SendsEveryRequiredCodeAndNoneThatTheViewerDoesNotSubscribeTo) {
  test::expectEveryCode(scenario, manySteps, baseband.generator(),
                        kelvasi::test::requiredCodes<Orvane_GSMClassIndex>());
}

TEST_F(Drive, SendsTheSimFilesOnceAndTellsThemToEveryNewStream) {
  int count = 0;
  play(1000, [&](const Messages& messages) { count += has(messages, 0xFF0000) ? 1 : 0; });
  EXPECT_EQ(count, 1);
  Messages greeting;
  scenario.greet(greeting);
  EXPECT_TRUE(has(greeting, 0xFF0000));
}

// Both lists of the record begin at the same byte.
TEST_F(Drive, RankedCellsAreOfOneTechnologyAtATime) {
  play(3000, [&](const Messages& messages) {
    for (const Message& message : messages) {
      if (message.logCode != LogCode{0x4005}) continue;
      const int umts = message.bytes.at(13);
      const int gsm = message.bytes.at(14);
      ASSERT_TRUE(umts == 0 || gsm == 0);
      ASSERT_EQ(message.bytes.size(), static_cast<std::size_t>(15 + 10 * umts + 7 * gsm));
    }
  });
}

TEST_F(Drive, SecondaryProcessesStandWhereTheirDecoderLooks) {
  bool hasTwoCarriers = false;
  play(manySteps, [&](const Messages& messages) {
    if (hasTwoCarriers || !has(messages, 0x4221)) return;
    baseband.take(messages, 0x4221);
    if (baseband.text("HSDPA Info", "Carrier Info") != "Dual Carrier") return;
    hasTwoCarriers = true;
    const PlistValue rows = baseband.sectionOf("HSDPA Info");
    for (const auto list : {"Primary HARQ Process", "Secondary HARQ Process"}) {
      const PlistValue processes = rows.dictionary()->get(list);
      ASSERT_TRUE(processes.array());
      ASSERT_EQ(processes.array()->size(), 6u);
      for (std::size_t place = 0; place < 6; ++place) {
        const PlistDictionary& process = *processes.array()->at(place).dictionary();
        ASSERT_EQ(*process.get("Process ID").string(), std::to_string(place));
        ASSERT_GT(DecodingViewer::leadingNumber(*process.get("New Tx").string()).value(), 0);
      }
    }
  });
  EXPECT_TRUE(hasTwoCarriers);
}

TEST_F(Drive, TheSameSeedGivesTheSameMessages) {
  test::expectTheSeedToDecide<DriveScenario>();
}

TEST_F(Drive, GoesThroughEveryStateOfAConnection) {
  std::set<std::string> seen;
  play(manySteps, [&](const Messages& messages) {
    decode(messages);
    seen.insert(rrcState());
    seen.insert(rrState());
    if (baseband.entries("Active Set") > 1) seen.insert("soft handover");
    if (baseband.text("GSM RR Info", "DTX Used") == "ON") seen.insert("a call in GSM");
    if (baseband.text("UMTS RR Info", "Ciphering") == "Enabled") seen.insert("ciphering");
  });
  EXPECT_THAT(seen,
              testing::IsSupersetOf(
                  {"Disconnected", "Connecting", "CELL_FACH", "CELL_DCH", "URA_PCH", "RR_INACTIVE", "RR_IDLE",
                   "RR_PLMN_LIST_CONSTRUCTION", "RR_NO_CHANNELS", "RR_CONNECTION_PENDING", "RR_DATA_TRANSFER",
                   "RR_CONNECTION_RELEASE", "RR_CELL_RESELECTION", "RR_W2G_INTERRAT_RESELECTION_PROGRESS",
                   "RR_G2W_INTERRAT_RESELECTION_PROGRESS", "soft handover", "a call in GSM", "ciphering"}));
  EXPECT_FALSE(seen.contains("Unknown"));
}

}  // namespace
}  // namespace kelvasi::sim::gsm
