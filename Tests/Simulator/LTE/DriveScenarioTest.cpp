// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/DriveScenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <map>
#include <set>
#include <tuple>

#include "Radio/Channels.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/LTE/Required.h"
#include "Tests/Simulator/PlayedScenario.h"
#include "Tests/Simulator/RivalWatch.h"

namespace kelvasi::sim::lte {
namespace {

using test::DecodingViewer;
using test::has;
using test::RivalWatch;
using testing::Contains;
using testing::Each;
using testing::IsSupersetOf;
using testing::Not;

// MHz by resource blocks (3GPP TS 36.101, table 5.6-1).
const std::map<std::uint8_t, double> bandwidths{{6, 1.4}, {15, 3}, {25, 5}, {50, 10}, {75, 15}, {100, 20}};
double bandwidthOf(std::uint8_t resourceBlocks) {
  return bandwidths.at(resourceBlocks);
}

// The least bandwidth that a band has, MHz (table 5.6.1-1); all of them have 20 MHz.
const std::map<std::uint16_t, double> leastBandwidths{{3, 1.4}, {7, 5}, {20, 5}};

constexpr int manySteps = 9000;  // half an hour
constexpr std::array seeds{1, 11, 2024};

constexpr auto info = "Serving Cell Info";
constexpr auto measurements = "Serving Cell Measurements";
constexpr auto neighbourCells = "Neighbor Cells List";
constexpr auto candidateCells = "Reselection Candidates List";
constexpr auto connectedServing = "Connected mode LTE Intra-frequency Measurement";
constexpr auto connectedCells = "Measured Neighbor Cells";

constexpr std::array sections{
    test::SectionOfTemplate{info},
    test::SectionOfTemplate{measurements},
    test::SectionOfTemplate{"Neighbor Measurements"},
    test::SectionOfTemplate{neighbourCells, true},
    test::SectionOfTemplate{"Reselection Candidates"},
    test::SectionOfTemplate{candidateCells, true},
    test::SectionOfTemplate{connectedServing},
    test::SectionOfTemplate{connectedCells, true},
    test::SectionOfTemplate{"Detected Cells", true},
    test::SectionOfTemplate{"SIM Info"},
    test::SectionOfTemplate{"PDP Context Info", true},
};

DecodingViewer viewer() {
  return DecodingViewer(kTelvonLogChannelTechnology_Orvane_LTE, "LTE", sections);
}

class LteDrive : public testing::TestWithParam<int> {
 protected:
  template <typename Look>
  void play(int steps, Look look) {
    test::play(scenario, steps, look);
  }
  void decode(const Messages& messages) { displays.take(messages); }

  const World& world() const { return scenario.world(); }
  const Cell& servingCell() const { return world().cell(*world().serving()); }
  std::string codeOf(std::size_t place) const { return std::to_string(world().cell(place).code); }
  std::vector<std::string> codesOf(const std::vector<std::size_t>& places) const {
    std::vector<std::string> codes;
    for (const std::size_t place : places) codes.push_back(codeOf(place));
    return codes;
  }

  // The rows of one measurement in the order of `places`, at most half a step from the world's.
  void expectLevels(std::string_view section, std::string_view row, const std::vector<std::size_t>& places,
                    double step, double (*value)(const World&, std::size_t)) {
    const auto texts = baseband.column(section, row);
    ASSERT_EQ(texts.size(), places.size());
    for (std::size_t place = 0; place < places.size(); ++place) {
      ASSERT_NEAR(DecodingViewer::leadingNumber(texts[place]).value(), value(world(), places[place]),
                  step / 2 + 0.006)
          << row;
    }
  }

  void checkServingCell();
  void checkIdle(const Messages& messages);
  void checkCandidate();
  void checkConnected(const Messages& messages);
  void checkRecords(const Messages& messages);

  LibplistSerialiser plists;
  DriveScenario scenario{static_cast<std::uint64_t>(GetParam()), plists};
  test::ViewerOfEachWay displays{viewer};
  DecodingViewer& baseband = displays.baseband;
  DecodingViewer& daemon = displays.daemon;
};

INSTANTIATE_TEST_SUITE_P(Seeds, LteDrive, testing::ValuesIn(seeds));

// As far as a handset reports them (3GPP TS 36.133, 9.1.4 and 9.1.7).
double level(const World& world, std::size_t place) {
  return std::clamp(world.reception(place).level, -140.0, -44.0);
}
double averageLevel(const World& world, std::size_t place) {
  return std::clamp(world.average(place).level, -140.0, -44.0);
}
double rsrq(const World& world, std::size_t place) {
  return std::clamp(world.reception(place).ecNo, -19.5, -3.0);
}
double averageRsrq(const World& world, std::size_t place) {
  return std::clamp(world.average(place).ecNo, -19.5, -3.0);
}

void LteDrive::checkServingCell() {
  const Cell& cell = servingCell();
  for (const DecodingViewer* display : {&baseband, &daemon}) {
    ASSERT_EQ(display->number(info, "Physical Cell ID"), cell.code);
    ASSERT_EQ(display->number(info, "Tracking Area Code"), cell.locationArea.code);
    ASSERT_EQ(display->number(info, "Cell Identity"), cell.id);
    ASSERT_EQ(display->number(info, "Freq Band Indicator"), eutraCarriers(cell.frequency)[0].band.number);
  }
  ASSERT_EQ(daemon.number(info, "UARFCN"), cell.frequency);
  ASSERT_EQ(baseband.number(info, "Download Frequency"), cell.frequency);
  ASSERT_EQ(baseband.number(info, "Upload Frequency"), cell.frequency + 18000);  // of all FDD bands
  const double megahertz = bandwidthOf(layerOf(cell).resourceBlocks);
  ASSERT_EQ(baseband.number(info, "Download Bandwidth"), megahertz);
  ASSERT_EQ(baseband.number(info, "Upload Bandwidth"), megahertz);
  ASSERT_EQ(baseband.number(info, "Num Tx Antennas"), layerOf(cell).antennas);
}

void LteDrive::checkIdle(const Messages& messages) {
  const std::size_t place = *world().serving();
  const Cell& cell = servingCell();
  ASSERT_EQ(baseband.number(measurements, "E-ARFCN"), cell.frequency);
  ASSERT_EQ(baseband.number(measurements, "Physical Cell ID"), cell.code);
  ASSERT_EQ(baseband.number(measurements, "Serving Layer Priority"), layerOf(cell).priority);
  ASSERT_EQ(baseband.number(measurements, "Qrxlevmin"), layerOf(cell).leastLevel);
  ASSERT_EQ(baseband.number("Neighbor Measurements", "E-ARFCN"), cell.frequency);
  ASSERT_THAT(baseband.column(neighbourCells, "Physical Cell ID"), Not(Contains(codeOf(place))));
  ASSERT_EQ(baseband.number("Reselection Candidates", "Serving EARFCN"), cell.frequency);
  ASSERT_EQ(baseband.number("Reselection Candidates", "Serving Cell ID"), cell.code);
  ASSERT_NO_FATAL_FAILURE(checkCandidate());
  if (has(messages, 0xB17F)) {
    ASSERT_NEAR(*baseband.number(measurements, "Measured RSRP"), level(world(), place), 0.126);
    ASSERT_NEAR(*baseband.number(measurements, "Average RSRP"), averageLevel(world(), place), 0.126);
    ASSERT_NEAR(*baseband.number(measurements, "Measured RSRQ"), rsrq(world(), place), 0.126);
    ASSERT_NEAR(*baseband.number(measurements, "Average RSRQ"), averageRsrq(world(), place), 0.126);
    ASSERT_NEAR(*baseband.number(measurements, "Measured RSSI"), world().rssi(place), 0.251);
    const double srxlev = world().average(place).level - layerOf(cell).leastLevel;
    ASSERT_NEAR(*baseband.number(measurements, "Srxlev"), std::max(srxlev, -30.0), 0.501);
    ASSERT_EQ(baseband.number(measurements, "Measurement Rules"), world().measurementRules());
    // What is defined between them (3GPP TS 36.214, 5.1.3).
    ASSERT_NEAR(
        world().reception(place).ecNo,
        10 * std::log10(layerOf(cell).resourceBlocks) + world().reception(place).level - world().rssi(place),
        1e-6);
  }
  if (has(messages, 0xB180)) {
    const auto& places = world().neighbours();
    ASSERT_EQ(baseband.column(neighbourCells, "Physical Cell ID"), codesOf(places));
    ASSERT_NO_FATAL_FAILURE(expectLevels(neighbourCells, "Measured RSRP", places, 0.5, level));
    ASSERT_NO_FATAL_FAILURE(expectLevels(neighbourCells, "Average RSRP", places, 0.5, averageLevel));
    ASSERT_NO_FATAL_FAILURE(expectLevels(neighbourCells, "Average RSRQ", places, 0.25, averageRsrq));
  }
}

void LteDrive::checkCandidate() {
  const auto candidate = world().candidate();
  ASSERT_EQ(baseband.entries(candidateCells), candidate ? 1u : 0u);
  if (!candidate) return;
  const Cell& cell = world().cell(*candidate);
  const bool isLte = cell.technology == Technology::lte;
  const bool isGsm = cell.technology == Technology::gsm;
  const auto row = [&](std::string_view name) { return baseband.column(candidateCells, name).at(0); };
  ASSERT_NE(*candidate, *world().serving());
  ASSERT_EQ(row("Candidate Priority"), std::to_string(layerOf(cell).priority));
  ASSERT_EQ(row("Candidate RAT Type"), isLte ? "LTE" : isGsm ? "GERAN" : "UTRAN");
  ASSERT_EQ(row(isLte ? "E ARFCN" : isGsm ? "ARFCN" : "U ARFCN"), std::to_string(cell.frequency));
  ASSERT_EQ(row(isLte ? "Cell ID" : isGsm ? "BSIC ID" : "PSC"), std::to_string(cell.code));
}

void LteDrive::checkConnected(const Messages& messages) {
  const std::size_t place = *world().serving();
  ASSERT_EQ(baseband.number(connectedServing, "E-ARFCN"), servingCell().frequency);
  ASSERT_EQ(baseband.number(connectedServing, "Serving Physical Cell ID"), servingCell().code);
  for (const auto section : {connectedCells, "Detected Cells"})
    ASSERT_THAT(baseband.column(section, "Physical Cell ID"), Not(Contains(codeOf(place))));
  ASSERT_THAT(daemon.entries("PDP Context Info"), testing::Le(2u));
  if (!has(messages, 0xB179)) return;
  ASSERT_NEAR(*baseband.number(connectedServing, "Serving Filtered RSRP"), averageLevel(world(), place),
              0.131);
  ASSERT_NEAR(*baseband.number(connectedServing, "Serving Filtered RSRQ"), averageRsrq(world(), place),
              0.068);
  ASSERT_EQ(baseband.column(connectedCells, "Physical Cell ID"), codesOf(world().neighbours()));
  ASSERT_EQ(baseband.column("Detected Cells", "Physical Cell ID"), codesOf(world().detected()));
  ASSERT_NO_FATAL_FAILURE(
      expectLevels(connectedCells, "Filtered RSRP", world().neighbours(), 0.25, averageLevel));
  ASSERT_NO_FATAL_FAILURE(
      expectLevels(connectedCells, "Filtered RSRQ", world().neighbours(), 0.125, averageRsrq));
}

// Some records belong to some states only.
void LteDrive::checkRecords(const Messages& messages) {
  for (const LogCode code : {0xB0C1U, 0xB0C2U}) ASSERT_FALSE(has(messages, code) && !world().isOnLte());
  for (const LogCode code : {0xB17FU, 0xB180U, 0xB186U})
    ASSERT_FALSE(has(messages, code) && (!world().isOnLte() || world().isConnected()));
  ASSERT_FALSE(has(messages, 0xB179) && !world().isConnected());
}

TEST_P(LteDrive, EveryMomentIsCoherent) {
  play(manySteps, [&](const Messages& messages) {
    decode(messages);
    ASSERT_NO_FATAL_FAILURE(checkRecords(messages));
    if (!world().isOnLte()) return;
    ASSERT_NO_FATAL_FAILURE(checkServingCell());
    if (world().isConnected()) {
      ASSERT_NO_FATAL_FAILURE(checkConnected(messages));
    } else {
      ASSERT_NO_FATAL_FAILURE(checkIdle(messages));
    }
  });
  // The record of the antennas is called unknown although it is shown.
  EXPECT_THAT(baseband.errors(), Each("Received an unknown log message: 45249"));
  EXPECT_THAT(daemon.errors(), testing::IsEmpty());
}

// Of the serving carrier, better by more than the hysteresis; nobody while a layer of higher priority comes
// first.
std::size_t rivalOf(const World& world) {
  std::size_t rival = RivalWatch::nobody;
  if (!world.isOnLte() || world.isConnected()) return rival;
  const std::size_t serving = *world.serving();
  if (!isSuitable(world.cell(serving), world.average(serving))) return rival;
  for (std::size_t place = 0; place < world.cells().size(); ++place) {
    const Layer& layer = layerOf(world.cell(place));
    const Layer& here = layerOf(world.cell(serving));
    if (layer.priority > here.priority && world.srxlev(place) > layer.thresholdHigh)
      return RivalWatch::nobody;
    if (&layer != &here || averageRsrq(world, place) <= layer.leastEcNo) continue;
    const double least =
        rival == RivalWatch::nobody ? averageLevel(world, serving) + 4 : averageLevel(world, rival);
    if (averageLevel(world, place) > least) rival = place;
  }
  return rival;
}

TEST_P(LteDrive, IdleModeStaysOnTheBestCellOfItsLayerWithinTheHysteresis) {
  constexpr int longest = 12;  // steps: two seconds, the step of the change and that of the search
  RivalWatch watch;
  play(manySteps, [&](const Messages&) {
    watch.see(world().serving().value_or(RivalWatch::nobody), rivalOf(world()));
    ASSERT_LE(watch.steps(), longest);
  });
  EXPECT_GT(watch.takeovers(), 1);
}

TEST_P(LteDrive, MeasurementsArePlausible) {
  const auto isRsrp = testing::AllOf(testing::Ge(-140), testing::Le(-44));
  const auto isRsrq = testing::AllOf(testing::Ge(-20), testing::Le(-3));
  play(manySteps, [&](const Messages& messages) {
    decode(messages);
    if (has(messages, 0xB17F)) {
      for (const auto row : {"Measured RSRP", "Average RSRP"})
        ASSERT_THAT(*baseband.number(measurements, row), isRsrp);
      for (const auto row : {"Measured RSRQ", "Average RSRQ"})
        ASSERT_THAT(*baseband.number(measurements, row), isRsrq);
      ASSERT_THAT(*baseband.number(measurements, "Measured RSSI"),
                  testing::AllOf(testing::Ge(-110), testing::Le(-20)));
    }
    for (const auto& [section, rsrpRow, rsrqRow] :
         {std::tuple(neighbourCells, "Measured RSRP", "Measured RSRQ"),
          std::tuple(connectedCells, "Filtered RSRP", "Filtered RSRQ")}) {
      for (const std::string& text : baseband.column(section, rsrpRow))
        ASSERT_THAT(*DecodingViewer::leadingNumber(text), isRsrp);
      for (const std::string& text : baseband.column(section, rsrqRow))
        ASSERT_THAT(*DecodingViewer::leadingNumber(text), isRsrq);
    }
  });
}

TEST_P(LteDrive, GoesThroughEveryLayerStateAndSearch) {
  std::set<std::string> seen;
  play(3 * manySteps, [&](const Messages& messages) {
    decode(messages);
    seen.insert("EMM " + std::to_string(static_cast<int>(world().attachment().emm())));
    if (!world().serving()) return void(seen.insert("no service"));
    const Cell& cell = servingCell();
    seen.insert(cell.technology == Technology::gsm ? "GSM" : std::to_string(cell.frequency));
    if (!world().isOnLte()) return;
    seen.insert(world().isConnected() ? "connected" : "idle");
    seen.insert(baseband.text(info, "Download Bandwidth"));
    if (baseband.entries(candidateCells) > 0)
      seen.insert(baseband.column(candidateCells, "Candidate RAT Type").at(0));
    if (baseband.entries("Detected Cells") > 0) seen.insert("detected");
    if (baseband.text(measurements, "Measurement Rules Updated") == "True") seen.insert("new rules");
    seen.insert("neighbours " + std::to_string(baseband.entries(neighbourCells)));
  });
  EXPECT_THAT(seen, IsSupersetOf({"EMM 0",  "EMM 1",    "EMM 2",      "EMM 3",        "EMM 4",
                                  "EMM 5",  "EMM 6",    "no service", "3350",         "1575",
                                  "6300",   "10588",    "GSM",        "connected",    "idle",
                                  "10 MHz", "15 MHz",   "20 MHz",     "LTE",          "UTRAN",
                                  "GERAN",  "detected", "new rules",  "neighbours 1", "neighbours 3"}));
  EXPECT_FALSE(seen.contains("Unknown"));
}

TEST_P(LteDrive, SendsWithinAMinuteEveryRequiredCodeAndNoneThatTheViewerDoesNotSubscribeTo) {
  test::expectEveryCode(scenario, 300, baseband.generator(), kelvasi::test::requiredCodes<LTEClassIndex>());
}

TEST_P(LteDrive, GreetsWithWhatIsTrueNow) {
  play(500, [](const Messages&) {});
  Messages greeting;
  scenario.greet(greeting);
  EXPECT_TRUE(has(greeting, 0xFF0000));
  decode(greeting);
  if (world().isOnLte()) checkServingCell();
}

TEST(LteDriveSeed, TheSameSeedGivesTheSameMessages) {
  test::expectTheSeedToDecide<DriveScenario>();
}

// The carrier lies in its band from edge to edge, and the band has its bandwidth.
TEST(LteLayers, FitTheirBands) {
  for (const Layer& layer : layers) {
    if (layer.technology != Technology::lte) continue;
    const Carriers carriers = eutraCarriers(layer.frequency);
    ASSERT_FALSE(carriers.empty()) << layer.frequency;
    const Band band = carriers[0].band;
    const double bandwidth = bandwidthOf(layer.resourceBlocks);
    EXPECT_GE(bandwidth, leastBandwidths.at(band.number));
    const auto half = static_cast<std::uint32_t>(bandwidth / 0.1 / 2 + 0.5);  // in numbers
    for (const std::uint32_t edge : {layer.frequency - half, layer.frequency + half - 1})
      EXPECT_EQ(eutraCarriers(edge)[0].band, band) << layer.frequency;
  }
}

}  // namespace
}  // namespace kelvasi::sim::lte
