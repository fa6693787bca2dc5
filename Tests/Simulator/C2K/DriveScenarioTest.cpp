// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/DriveScenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <set>
#include <utility>

#include "Simulator/C2K/Frames.h"
#include "Simulator/C2K/Strength.h"
#include "Telvon/Technology.h"
#include "Tests/LogGenerator/C2K/LookupNames.h"
#include "Tests/LogGenerator/C2K/Required.h"
#include "Tests/Simulator/PlayedScenario.h"

namespace kelvasi::sim::c2k {
namespace {

using test::DecodingViewer;
using test::has;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsSupersetOf;

constexpr int manySteps = 10000;
constexpr std::array<std::uint64_t, 4> seeds{1, 3, 11, 12345};

// A leaf for each lookup name, called after it.
PlistValue displayTemplate() {
  const auto leaves = PlistDictionary::make();
  for (const std::string_view name : kelvasi::test::c2kLookupNames()) leaves->set(name, name);
  return leaves;
}

// The number behind an optional mark; printf's form, with its sign.
double number(const std::string& text) {
  const std::size_t begin = text.find_first_of("+-");
  return begin == std::string::npos ? std::nan("") : std::strtod(text.c_str() + begin, nullptr);
}

double linear(double dB) {
  return std::pow(10, dB / 10);
}

class CdmaDrive : public testing::TestWithParam<std::uint64_t> {
 protected:
  template <typename Look>
  void play(int steps, Look look) {
    test::play(scenario, steps, [&](const Messages& messages) {
      viewer.take(messages);
      look(messages);
    });
  }
  const World& world() const { return scenario.world(); }
  std::string text(std::string_view name) const {
    const PlistValue value = viewer.sectionOf(name);
    return value.string() ? *value.string() : "(no text)";
  }
  // Keys of a list of pilots, and their texts.
  std::vector<std::string> keys(std::string_view name) const;
  std::string pilot(std::string_view name, const std::string& key) const;
  std::vector<std::string> wantedKeys(const std::vector<std::size_t>& cells) const;
  std::string numbered(std::string_view name) const;

  void checkOneX();
  void checkSystem();
  void checkEvdo();
  void checkOneXValues();
  void checkFingers();
  void checkEvdoValues();

  LibplistSerialiser plists;
  DriveScenario scenario{GetParam(), plists};
  DecodingViewer viewer{kTelvonLogChannelTechnology_Orvane_CDMA, "C2KTemplate", displayTemplate()};
};

INSTANTIATE_TEST_SUITE_P(Seeds, CdmaDrive, testing::ValuesIn(seeds));

std::vector<std::string> CdmaDrive::keys(std::string_view name) const {
  std::vector<std::string> found;
  const PlistValue list = viewer.sectionOf(name);
  if (!list.dictionary()) return found;
  for (const auto& [key, value] : *list.dictionary()) {
    if (key != "_sorted") found.push_back(key);
  }
  return found;
}

std::string CdmaDrive::pilot(std::string_view name, const std::string& key) const {
  return *viewer.sectionOf(name).dictionary()->get(key).string();
}

std::vector<std::string> CdmaDrive::wantedKeys(const std::vector<std::size_t>& cells) const {
  std::vector<std::string> wanted;
  for (const std::size_t cell : cells)
    wanted.push_back(std::to_string(wanted.size()) + ";" + std::to_string(world().cell(cell).code));
  return wanted;
}

// The number in brackets that ends the text of a state.
std::string CdmaDrive::numbered(std::string_view name) const {
  const std::string state = text(name);
  return state.substr(state.find('[') + 1, state.find(']') - state.find('[') - 1);
}

void CdmaDrive::checkOneX() {
  const OneX& oneX = world().oneX();
  ASSERT_EQ(numbered("k1xDeviceState"), std::to_string(static_cast<int>(oneX.state())));
  const auto wanted = wantedKeys(oneX.pilots().active());
  ASSERT_EQ(keys("k1xActiveSetInfo"), wanted);
  for (const std::string& key : wanted)
    ASSERT_EQ(pilot("k1xActiveSetInfo", key).starts_with("(ref pilot) "), key == wanted.front());
  for (const char* row : {"k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC"})
    ASSERT_EQ(text(row) != "N/A", oneX.isInCall()) << row;
  if (oneX.isInCall()) {
    ASSERT_EQ(text("k1xRx1ChanNum"), std::to_string(oneXChannel));
    ASSERT_EQ(text("k1xRx1BandClass"), "800 MHz cellular band [0]");
  }
  // Soft hand-off is for calls.
  if (oneX.hasSystem() && !oneX.isInCall()) {
    ASSERT_EQ(wanted.size(), 1u);
  }
  ASSERT_EQ(text("k1xRx0ChanNum"), std::to_string(oneXChannel));
  ASSERT_EQ(text("k1xRx0BandClass"), "800 MHz cellular band [0]");
}

void CdmaDrive::checkSystem() {
  if (!world().oneX().hasSystem()) return;
  const Cell& cell = world().cell(world().oneX().pilots().active().front());
  ASSERT_EQ(text("kSystemId"), std::to_string(systemOf(cell).systemId));
  ASSERT_EQ(text("kNetworkId"), std::to_string(systemOf(cell).networkId));
  ASSERT_EQ(text("kBaseId"), std::to_string(cell.id));
  ASSERT_EQ(text("kPacketZoneId"), std::to_string(cell.routingArea));
  ASSERT_EQ(text("k1xRoamingHome"), systemOf(cell).isHome ? "OFF [0]" : "ON [1]");
}

void CdmaDrive::checkEvdo() {
  const Evdo& evdo = world().evdo();
  ASSERT_EQ(numbered("k1xEVDODeviceState"), std::to_string(static_cast<int>(evdo.state())));
  ASSERT_EQ(numbered("kSessionState"), std::to_string(static_cast<int>(evdo.session())));
  ASSERT_EQ(keys("kActiveSetPilots"), wantedKeys(evdo.pilots().active()));
  const std::string serving = text("kServingPNOffset");
  if (evdo.serving()) {
    ASSERT_TRUE(evdo.pilots().isActive(*evdo.serving()));
    ASSERT_EQ(serving, std::to_string(world().cell(*evdo.serving()).code) + " × 64chips");
  } else {
    ASSERT_EQ(serving, "Invalid Value");
    ASSERT_EQ(text("kActiveSetPilots"), "(none)");
  }
  ASSERT_EQ(text("kChannel"), std::to_string(evdoChannel));
  ASSERT_EQ(std::strtoul(text("kUATI24").c_str(), nullptr, 16), evdo.uati24());
  ASSERT_EQ(text("kColorCode"), std::to_string(evdo.colorCode()));
  for (const char* row : {"kRxAGC1", "kTxAGC"})
    ASSERT_EQ(text(row) != "N/A", evdo.state() >= Evdo::State::access) << row;
  if (evdo.session() != Evdo::Session::ampSetup) {
    ASSERT_EQ(evdo.uati24() == 0, evdo.session() == Evdo::Session::closed);
  }
  if (evdo.state() == Evdo::State::idle) {
    ASSERT_EQ(evdo.pilots().active().size(), 1u);
  }
  // There is one radio.
  const OneX::Stage stage = world().oneX().stage();
  if (stage == OneX::Stage::accessing || stage == OneX::Stage::inCall) {
    ASSERT_EQ(evdo.state(), Evdo::State::inactive);
  }
}

TEST_P(CdmaDrive, EveryMomentIsCoherent) {
  play(manySteps, [&](const Messages&) {
    ASSERT_NO_FATAL_FAILURE(checkOneX());
    ASSERT_NO_FATAL_FAILURE(checkSystem());
    ASSERT_NO_FATAL_FAILURE(checkEvdo());
  });
  EXPECT_THAT(viewer.errors(), IsEmpty());
  EXPECT_THAT(viewer.warnings(), ElementsAre("Processing the template"));
}

// As the record holds it: in steps of 0.334 dB, of 8 bits.
double shownPower(double dBm) {
  return std::clamp(dBm, -106.0, -20.83);
}

void CdmaDrive::checkOneXValues() {
  constexpr double halfStep = 0.334 / 2 + 0.006;
  ASSERT_NEAR(number(text("k1xRxAGC0")), shownPower(world().receivedPower(0)), halfStep);
  if (world().oneX().isInCall()) {
    ASSERT_NEAR(number(text("k1xRxAGC1")), shownPower(world().receivedPower(1)), halfStep);
    ASSERT_NEAR(number(text("k1xTxAGC")), world().oneXTransmitPower(), 0.056);
  }
  std::size_t matched = 0;
  for (const std::size_t cell : world().oneX().pilots().active()) {
    for (const std::string& key : keys("k1xActiveSetInfo")) {
      if (!key.ends_with(";" + std::to_string(world().cell(cell).code))) continue;
      ++matched;
      const double shown = linear(number(pilot("k1xActiveSetInfo", key)));
      const double wanted = linear(reportedRatio(world().oneXRatios()[cell]));
      // Half a step of the energy, and half a hundredth of a dB.
      ASSERT_NEAR(shown, wanted, 0.5 / 36864 + 0.0012 * wanted);
    }
  }
  ASSERT_EQ(matched, world().oneX().pilots().active().size());
}

void CdmaDrive::checkFingers() {
  std::size_t assigned = 0;
  std::size_t place = 0;
  for (const Finger& finger : world().fingers()) {
    const std::string position = std::to_string(place++) + ";";
    if (!finger.cell) continue;
    ASSERT_TRUE(world().oneX().pilots().isActive(*finger.cell));
    ++assigned;
    const double shown =
        linear(number(pilot("kFingerC2I", position + std::to_string(world().cell(*finger.cell).code))));
    ASSERT_NEAR(shown, linear(finger.ratio), 0.5 / 512 + 0.0012 * shown);
  }
  ASSERT_EQ(keys("kFingerC2I").size(), assigned);
  ASSERT_EQ(text("kFingerC2I") == "(none)", assigned == 0);
}

void CdmaDrive::checkEvdoValues() {
  ASSERT_EQ(number(text("kRxAGC0")), std::round(world().receivedPower(0)));
  if (world().evdo().state() < Evdo::State::access) return;
  ASSERT_EQ(number(text("kRxAGC1")), std::round(world().receivedPower(1)));
  ASSERT_EQ(number(text("kTxAGC")), std::round(world().evdoTransmitPower()));
}

TEST_P(CdmaDrive, MeasurementsAreTheWorlds) {
  play(3000, [&](const Messages& messages) {
    if (has(messages, 0x119C)) {
      ASSERT_NO_FATAL_FAILURE(checkOneXValues());
    }
    if (has(messages, 0x108A)) {
      ASSERT_NO_FATAL_FAILURE(checkFingers());
    }
    if (has(messages, 0x1183)) {
      ASSERT_NO_FATAL_FAILURE(checkEvdoValues());
    }
    if (!has(messages, 0x12B6)) return;
    std::size_t place = 0;
    const auto shownKeys = keys("kActiveSetPilots");
    for (const std::size_t cell : world().evdo().pilots().active()) {
      const double shown = linear(number(pilot("kActiveSetPilots", shownKeys.at(place++))));
      const double wanted = std::max(linear(world().evdoRatios()[cell]), 1.0 / 512);
      ASSERT_NEAR(shown, wanted, 0.5 / 512 + 0.0012 * shown);
    }
  });
}

// The rate of frame errors, as it must come out of the world's own frames.
TEST_P(CdmaDrive, TheFrameErrorRateFollowsTheFramesAndRisesInAFade) {
  std::optional<float> rate;
  float highestWhenGood = 0;
  float highestInFade = 0;
  int goodSteps = 0;
  int oldRates = 0;
  play(manySteps, [&](const Messages&) {
    const OneX& oneX = world().oneX();
    if (!oneX.isInCall()) {
      if (rate) {
        ASSERT_TRUE(text("k1xTrafficFER").ends_with("% (old)"));
        ++oldRates;
      }
      rate.reset();
      return;
    }
    for (const bool isError : oneX.frames())
      rate = (isError ? 0.015625F : 0.0F) + (rate ? *rate * 0.984375F : 0.0F);
    if (!rate) return;
    char expected[32];
    std::snprintf(expected, sizeof expected, "%.02f%%", static_cast<double>(*rate) * 100);
    ASSERT_EQ(text("k1xTrafficFER"), expected);
    const double ratio = combinedRatio(oneX.pilots(), world().oneXRatios());
    goodSteps = ratio > -11 ? goodSteps + 1 : 0;
    if (goodSteps > 50) highestWhenGood = std::max(highestWhenGood, *rate);
    if (ratio < -18) highestInFade = std::max(highestInFade, *rate);
  });
  EXPECT_GT(oldRates, 5);
  EXPECT_GT(highestWhenGood, 0.0F);
  EXPECT_LT(highestWhenGood, 0.1F);
  EXPECT_GT(highestInFade, 0.5F);
}

// A rate as the display shows it, from two of the world's own sums of bits.
std::string kilobits(std::int64_t bits, std::int64_t before, std::uint32_t seconds) {
  char text[48];
  std::snprintf(text, sizeof text, "%.2f kbps", static_cast<double>(bits - before) / (seconds * 1024.0));
  return text;
}

// Of the steps of this second, counted from 1, how many transferred something. A report may come later than
// its second: none is sent while the radio is 1x's.
std::ptrdiff_t stepsOfSecond(std::uint32_t second, const std::vector<bool>& transferring) {
  constexpr std::ptrdiff_t steps = 5;
  if (second == 0) return 0;
  const auto end = transferring.begin() + steps * static_cast<std::ptrdiff_t>(second);
  return std::count(end - steps, end, true);
}

// What the rates of one link have to be.
struct LinkCheck {
  std::string_view rateName;
  std::string sentKey;
  LogCode logCode;
  std::uint32_t sequence = 0;
  std::int64_t bits = 0;
  int moving = 0;
  int still = 0;

  template <typename Report>
  void check(const Report& report, const DecodingViewer& viewer, const std::vector<bool>& transferring) {
    const auto transferringSteps = stepsOfSecond(report.sequence, transferring);
    const std::string shown = *viewer.sectionOf(rateName).string();
    if (sequence != 0 && report.sequence > sequence) {
      ASSERT_EQ(shown, kilobits(report.bits, bits, report.sequence - sequence));
      if (report.sequence == sequence + 1 && transferringSteps == 5) {
        ASSERT_GT(report.bits, bits);
        ++moving;
      }
      if (report.sequence == sequence + 1 && transferringSteps == 0) {
        ASSERT_EQ(shown, "0.00 kbps");
        ++still;
      }
    }
    ASSERT_EQ(viewer.inState("ExtraInfo").dictionary()->get(sentKey), PlistValue(report.bits));
    ASSERT_GT(report.bits, std::int64_t{1} << 32);
    sequence = report.sequence;
    bits = report.bits;
  }
};

TEST_P(CdmaDrive, RatesAreThoseOfTheDataAndZeroWithoutThem) {
  LinkCheck forward{.rateName = "kFLDataRate", .sentKey = "FLDataSent1", .logCode = 0x1192};
  LinkCheck reverse{.rateName = "kRLDataRate", .sentKey = "RLDataSent1", .logCode = 0x127E};
  std::set<std::string> rates;
  std::vector<bool> transferring;
  play(manySteps, [&](const Messages& messages) {
    transferring.push_back(world().evdo().isTransferring());
    if (has(messages, forward.logCode)) {
      ASSERT_NO_FATAL_FAILURE(forward.check(world().dataLink().forward(), viewer, transferring));
    }
    if (has(messages, reverse.logCode)) {
      ASSERT_NO_FATAL_FAILURE(reverse.check(world().dataLink().reverse(), viewer, transferring));
    }
    rates.insert(text("kFLDataRate"));
  });
  for (const LinkCheck& link : {forward, reverse}) {
    EXPECT_GT(link.moving, 50) << link.rateName;
    EXPECT_GT(link.still, 50) << link.rateName;
  }
  EXPECT_GT(rates.size(), 20u);
}

TEST_P(CdmaDrive, SendsEveryRequiredCodeAndNoneThatTheViewerDoesNotSubscribeTo) {
  std::vector<LogCode> required;
  for (const auto& each : kelvasi::test::requiredC2KRecords) required.push_back(each.logCode);
  test::expectEveryCode(scenario, 2000, viewer.generator(), required);
}

TEST_P(CdmaDrive, GoesThroughEveryStateOfBothAirInterfaces) {
  std::set<std::string> seen;
  OneX::Stage before = world().oneX().stage();
  play(manySteps, [&](const Messages&) {
    for (const char* row : {"k1xDeviceState", "k1xEVDODeviceState", "kSessionState", "kSystemId"})
      seen.insert(text(row));
    const OneX& oneX = world().oneX();
    const bool wasAccess = std::exchange(before, oneX.stage()) == OneX::Stage::accessing;
    if (wasAccess && oneX.stage() == OneX::Stage::idle) seen.insert("registration");
    if (wasAccess && oneX.isInCall()) seen.insert("call set-up");
    if (oneX.hasDroppedCall()) seen.insert("dropped call");
    if (oneX.pilots().active().size() > 2) seen.insert("three-way hand-off");
    if (oneX.isInCall() && !oneX.pilots().candidates().empty()) seen.insert("candidates");
    if (oneX.isInCall() && !oneX.pilots().neighbours().empty()) seen.insert("neighbours");
    if (world().evdo().pilots().active().size() > 1) seen.insert("soft hand-off in EV-DO");
  });
  EXPECT_THAT(seen, IsSupersetOf({"Initial state for CDMA operation [2]",
                                  "Acquisition [3]",
                                  "Sync [4]",
                                  "Paging [6]",
                                  "Slotted mode sleep state [7]",
                                  "Traffic [8]",
                                  "Inactive [0]",
                                  "Acquisition [1]",
                                  "Sync [2]",
                                  "Idle [3]",
                                  "Access [4]",
                                  "Connected [5]",
                                  "Closed [0]",
                                  "AMP setup [1]",
                                  "AT-initiated neg [2]",
                                  "Initiated neg [3]",
                                  "Open [4]",
                                  "4139",
                                  "4206",
                                  "registration",
                                  "call set-up",
                                  "dropped call",
                                  "three-way hand-off",
                                  "candidates",
                                  "neighbours",
                                  "soft hand-off in EV-DO"}));
}

TEST_P(CdmaDrive, ANewStreamIsToldThePresentState) {
  play(500, [](const Messages&) {});
  Messages greeting;
  scenario.greet(greeting);
  DecodingViewer late(kTelvonLogChannelTechnology_Orvane_CDMA, "C2KTemplate", displayTemplate());
  late.take(greeting);
  for (const char* row : {"k1xDeviceState", "k1xEVDODeviceState", "kSessionState", "kServingPNOffset"})
    EXPECT_EQ(late.sectionOf(row), viewer.sectionOf(row)) << row;
}

TEST(CdmaDriveSeed, TheSameGivesTheSameMessages) {
  test::expectTheSeedToDecide<DriveScenario>();
}

}  // namespace
}  // namespace kelvasi::sim::c2k
