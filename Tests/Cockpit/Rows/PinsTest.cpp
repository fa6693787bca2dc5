// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/Pins.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

constexpr const char* keyOf362 = "lte:3350/362 /Neighbours/*/rsrp";

// A list that is written anew.
Message listed(Arrival after, std::initializer_list<std::pair<CellIdentity, int>> cells) {
  Message message(after);
  message.removeNeighbours(3);
  for (const auto& [cell, rsrp] : cells) message.neighbour(cell, quantity::rsrp, rsrp);
  return message;
}

TEST(Pins, ARowOfNoListIsKeptByItsPath) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  EXPECT_TRUE(fed.cockpit.pin("/Serving/rsrp"));
  EXPECT_EQ(fed.cockpit.pinKeys(), std::vector<std::string>{"/Serving/rsrp"});
  fed.take(served(1s, cell362, -90));
  const auto pins = fed.at(8s).pins;
  ASSERT_EQ(pins.size(), 1U);
  EXPECT_EQ(pins[0].value, "-90");
  EXPECT_EQ(pins[0].cellText, "LTE 3350/362");
  EXPECT_EQ(pins[0].age.text, "7 s");
}

TEST(Pins, ARowOfAListIsKeptByItsCell) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -105}, {cell257, -110}}));
  EXPECT_TRUE(fed.cockpit.pin("/Neighbours/0/rsrp"));
  EXPECT_EQ(fed.cockpit.pinKey("/Neighbours/0/rsrp"), keyOf362);
  EXPECT_EQ(fed.cockpit.pinKey("/Neighbours/1/rsrp"), "");
  fed.take(listed(1s, {{cell257, -100}, {cell362, -104}}));
  const PinLine pin = fed.at(1s).pins.at(0);
  EXPECT_TRUE(pin.isPresent);
  EXPECT_EQ(pin.path, "/Neighbours/1/rsrp");
  EXPECT_EQ(pin.value, "-104");
  EXPECT_EQ(pin.cellText, "LTE 3350/362");
}

TEST(Pins, ACellThatIsGoneKeepsItsLastValueAndSaysSo) {
  Fed fed;
  fed.take(listed(0s, {{cell362, -105}}));
  fed.cockpit.pin("/Neighbours/0/rsrp");
  fed.at(0s);
  fed.take(listed(9s, {{cell257, -100}}));
  const PinLine pin = fed.at(14s).pins.at(0);
  EXPECT_FALSE(pin.isPresent);
  EXPECT_EQ(pin.value, "-105");
  EXPECT_EQ(pin.age.text, "gone 14 s");
  EXPECT_EQ(pin.cellText, "LTE 3350/362");
}

TEST(Pins, APartOfACellIsTheCellWhenNoOtherCanBe) {
  constexpr CellIdentity whole{RadioFamily::gsm, 84, 18};
  constexpr CellIdentity part{RadioFamily::gsm, 84};
  Fed fed;
  fed.take(listed(0s, {{whole, -70}}));
  fed.cockpit.pin("/Neighbours/0/rsrp");
  fed.take(listed(1s, {{cell362, -100}, {part, -72}}));
  EXPECT_EQ(fed.at(1s).pins.at(0).value, "-72");
  fed.take(listed(2s, {{part, -74}, {cell362, -100}, {part, -90}}));
  EXPECT_FALSE(fed.at(2s).pins.at(0).isPresent);
}

TEST(Pins, AreRememberedFromSessionToSession) {
  Fed fed;
  fed.cockpit.restorePins({keyOf362, "/Plain/tx_power", "lte:/List", "x /y", "", keyOf362, "lte:3350/1"});
  EXPECT_EQ(fed.cockpit.pinKeys(), (std::vector<std::string>{keyOf362, "/Plain/tx_power"}));
  EXPECT_EQ(fed.at(0s).pins.at(0).value, "not reported");
  EXPECT_EQ(fed.at(0s).pins.at(0).cellText, "LTE 3350/362");
  fed.take(listed(0s, {{cell257, -100}, {cell362, -104}}));
  EXPECT_EQ(fed.at(0s).pins.at(0).value, "-104");
  fed.cockpit.unpin(keyOf362);
  EXPECT_EQ(fed.cockpit.pinKeys(), std::vector<std::string>{"/Plain/tx_power"});
}

TEST(Pins, AreBoundedAndOfRowsThatThereAre) {
  Fed fed;
  EXPECT_FALSE(fed.cockpit.pin("/Serving/rsrp"));
  std::vector<std::string> keys;
  for (std::size_t pin = 0; pin < Pins::mostPins + 5; ++pin) keys.push_back("/Row " + std::to_string(pin));
  fed.cockpit.restorePins(keys);
  EXPECT_EQ(fed.cockpit.pinKeys().size(), Pins::mostPins);
  fed.take(served(0s, cell404, -95));
  EXPECT_FALSE(fed.cockpit.pin("/Serving/rsrp"));
}

TEST(Pins, PinningAgainDoesNothing) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  EXPECT_TRUE(fed.cockpit.pin("/Serving/rsrp"));
  EXPECT_TRUE(fed.cockpit.pin("/Serving/rsrp"));
  EXPECT_EQ(fed.cockpit.pinKeys().size(), 1U);
}

}  // namespace
}  // namespace kelvasi::cockpit
