// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Serving/ServingCell.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

constexpr CellIdentity umtsCell{RadioFamily::umts, 10663, 288};
constexpr CellIdentity gsmCell{RadioFamily::gsm, 62, 17};
constexpr CellIdentity oneXCell{RadioFamily::cdma, 283, 344};
constexpr CellIdentity evdoCell{RadioFamily::evdo, 242, 344};

std::string textOf(const std::vector<NamedValue>& values) {
  std::string text;
  for (const NamedValue& each : values) text += each.name + " " + each.value + ";";
  return text;
}

Message named(Arrival after, const CellIdentity& cell, const Quantity& code) {
  Message message(after);
  message.serving(cell, code, cell.code);
  return message;
}

TEST(ServingCell, OfUmtsWithOperatorAndAreas) {
  Fed fed;
  fed.take(named(0s, umtsCell, quantity::scramblingCode)
               .serving(umtsCell, quantity::mcc, 262)
               .serving(umtsCell, quantity::mnc, 1)
               .serving(umtsCell, quantity::lac, 517)
               .serving(umtsCell, quantity::cellId, 63001615));
  fed.take(Message(0s).plain(quantity::lac, 517).plain(quantity::rac, 3));
  const ServingCell serving = fed.at(0s).serving;
  EXPECT_EQ(serving.technology, "UMTS");
  EXPECT_EQ(serving.networkNumber, "262-01");
  EXPECT_EQ(serving.country, "Germany");
  EXPECT_TRUE(serving.network.starts_with("262-01 "));
  EXPECT_EQ(serving.title, "UMTS " + serving.network);
  EXPECT_EQ(textOf(serving.area), "LAC 517;RAC 3;");
  EXPECT_EQ(textOf(serving.ids), "RNC 961/21519;Cell 63001615;");
  EXPECT_EQ(serving.bands, "Band I");
  EXPECT_EQ(serving.frequency, "2132.6 MHz");
  EXPECT_EQ(serving.code, (NamedValue{"PSC", "288"}));
}

TEST(ServingCell, ARoutingAreaOfAnotherAreaIsNotShown) {
  Fed fed;
  fed.take(named(0s, umtsCell, quantity::scramblingCode).serving(umtsCell, quantity::lac, 517));
  fed.take(Message(0s).plain(quantity::lac, 518).plain(quantity::rac, 3));
  EXPECT_EQ(textOf(fed.at(0s).serving.area), "LAC 517;");
}

TEST(ServingCell, WhatIsNotReportedSaysSo) {
  Fed fed;
  fed.take(named(0s, gsmCell, quantity::bsic));
  const ServingCell serving = fed.at(0s).serving;
  EXPECT_EQ(serving.network, "not reported");
  EXPECT_EQ(serving.title, "GSM, operator not reported");
  EXPECT_EQ(textOf(serving.area), "LAC not reported;");
  EXPECT_EQ(textOf(serving.ids), "Cell not reported;");
  EXPECT_EQ(serving.levels.at(0).text, "not reported");
}

TEST(ServingCell, AnOperatorThatNobodyKnowsIsItsNumber) {
  Fed fed;
  fed.take(named(0s, gsmCell, quantity::bsic)
               .serving(gsmCell, quantity::mcc, 289)
               .serving(gsmCell, quantity::mnc, 99));
  EXPECT_EQ(fed.at(0s).serving.network, "289-99");
  EXPECT_EQ(fed.at(0s).serving.networkName, "");
}

TEST(ServingCell, AUsersNamesAreUsed) {
  CockpitSetUp setUp;
  setUp.operators.addNames("999,02,Test Network,test\n");
  Fed fed(std::move(setUp));
  fed.take(named(0s, gsmCell, quantity::bsic)
               .serving(gsmCell, quantity::mcc, 999)
               .serving(gsmCell, quantity::mnc, 2));
  EXPECT_EQ(fed.at(0s).serving.title, "GSM 999-02 Test Network (test)");
}

TEST(ServingCell, CdmaHasTwo) {
  Fed fed;
  fed.take(named(0s, oneXCell, quantity::pnOffset)
               .serving(oneXCell, quantity::sid, 4206)
               .serving(oneXCell, quantity::nid, 1)
               .serving(oneXCell, quantity::baseId, 785)
               .serving(oneXCell, quantity::ecio, -8));
  fed.take(named(1s, evdoCell, quantity::pnOffset).serving(evdoCell, quantity::ecio, -2));
  const Snapshot both = fed.at(1s);
  EXPECT_EQ(both.serving.title, "1x SID 4206");
  EXPECT_EQ(textOf(both.serving.area), "NID 1;");
  EXPECT_EQ(textOf(both.serving.ids), "Base 785;");
  EXPECT_EQ(both.serving.levels.at(0).text, "-8.0");
  ASSERT_TRUE(both.second);
  EXPECT_EQ(both.second->technology, "EV-DO");
  EXPECT_EQ(both.second->levels.at(0).text, "-2.0");
  // The one that is heard of takes the place of the one that is gone.
  fed.take(named(31s, evdoCell, quantity::pnOffset));
  EXPECT_EQ(fed.at(31s).serving.technology, "EV-DO");
  EXPECT_FALSE(fed.at(31s).second);
}

TEST(ServingCell, TheBandClassOfItsChannelNamesItsBand) {
  Fed fed;
  fed.take(named(0s, oneXCell, quantity::pnOffset));
  EXPECT_EQ(fed.at(0s).serving.bands, "");
  fed.take(Message(0s).plain(quantity::bandClass, 0).plain(quantity::cdmaChannel, 283));
  EXPECT_EQ(fed.at(0s).serving.bands, "BC0");
  EXPECT_EQ(fed.at(0s).serving.frequency, "878.49 MHz");
}

TEST(ServingCell, TheReceiversLevelIsCdmasRssi) {
  static const ReadingSection oneX{.name = "1x", .path = "/1x"};
  static const Row row{.key = "Receiver 0 AGC", .quantity = quantity::rxPower};
  Fed fed;
  fed.take(named(0s, oneXCell, quantity::pnOffset));
  Readings readings;
  readings.begin(noon, 0x119C);
  readings.add({.section = &oneX, .row = &row, .raw = -57, .key = row.key});
  fed.cockpit.take(readings, fed.intake);
  const Level rssi = fed.at(4s).serving.levels.at(1);
  EXPECT_EQ(rssi.name, "RSSI");
  EXPECT_EQ(rssi.text, "-57");
  EXPECT_EQ(rssi.age.text, "4 s");
  EXPECT_EQ(rssi.line.points[55].mean, -57);
}

TEST(ServingCell, FadesAndGoes) {
  Fed fed;
  fed.take(named(0s, gsmCell, quantity::bsic));
  EXPECT_EQ(fed.at(5s).serving.age.fade, Fade::none);
  EXPECT_EQ(fed.at(6s).serving.age.fade, Fade::faded);
  EXPECT_EQ(fed.at(15s).serving.age.fade, Fade::faint);
  EXPECT_EQ(fed.at(30s).serving.age.text, "gone 30 s");
}

}  // namespace
}  // namespace kelvasi::cockpit
