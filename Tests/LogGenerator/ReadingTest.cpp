// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Reading.h"

#include <gtest/gtest.h>

#include "LogGenerator/Readings.h"
#include "LogGenerator/Row.h"

namespace kelvasi {
namespace {

using std::string_view_literals::operator""sv;

constexpr std::array states{"Idle"sv, "Camped"sv};
constexpr Row power{.key = "Power",
                    .quantity = quantity::rsrp,
                    .unit = " dBm",
                    .special = ValueText{511, "Not Present"},
                    .scale = Scale{.factor = 0.25, .offset = -140}};
constexpr Row state{
    .key = "State/Mode", .quantity = quantity::rrcState, .texts = states, .otherwise = "[Reserved %d]"};

const ReadingSection section{.name = "Serving Cell", .path = "/01;Cell/Serving Cell"};

std::string linesOf(const Readings& readings) {
  std::string lines;
  for (const Reading& reading : readings.all())
    lines += pathOf(reading) + " " + std::string(rowOf(reading)) + " " + textOf(reading).value_or("-") + "\n";
  return lines;
}

TEST(Reading, HasTextNumberAndQuantityFromRowAndRawValue) {
  const Reading reading{.section = &section, .row = &power, .raw = 161, .key = "Power"};
  EXPECT_EQ(textOf(reading), "-99.75 dBm");
  EXPECT_EQ(numberOf(reading), -99.75);
  EXPECT_EQ(quantityOf(reading), &quantity::rsrp);
  EXPECT_EQ(pathOf(reading), "/01;Cell/Serving Cell/Power");
}

TEST(Reading, OfAStateHasItsRawNumber) {
  const Reading reading{.section = &section, .row = &state, .raw = 1, .key = "State/Mode"};
  EXPECT_EQ(textOf(reading), "Camped");
  EXPECT_EQ(numberOf(reading), 1);
  EXPECT_EQ(pathOf(reading), "/01;Cell/Serving Cell/State~1Mode");
  EXPECT_EQ(textOf(state, 9), "[Reserved 9]");
  EXPECT_EQ(numberOf(state, 9), 9);
}

TEST(Reading, OfASpecialValueHasNoNumber) {
  EXPECT_EQ(textOf(power, 511), "Not Present");
  EXPECT_EQ(numberOf(power, 511), std::nullopt);
  constexpr Row absent{.key = "Power", .quantity = quantity::rxPower, .unit = " dBm", .absent = "N/A"};
  EXPECT_EQ(textOf(absent, noValue), "N/A");
  EXPECT_EQ(numberOf(absent, noValue), std::nullopt);
}

TEST(Reading, OfWhatIsNotFiniteHasNoNumber) {
  constexpr Row ratio{.key = "Ratio",
                      .quantity = quantity::ecio,
                      .unit = " dB",
                      .scale = Scale{.format = "%+.2f", .curve = fromRaw}};
  EXPECT_EQ(textOf(ratio, rawOf(-3.5)), "-3.50 dB");
  EXPECT_EQ(numberOf(ratio, rawOf(-3.5)), -3.5);
  EXPECT_EQ(textOf(ratio, rawOf(-std::numeric_limits<double>::infinity())), "-inf dB");
  EXPECT_EQ(numberOf(ratio, rawOf(-std::numeric_limits<double>::infinity())), std::nullopt);
}

TEST(Reading, OfPackedDigitsIsTheNumberThatTheyAre) {
  constexpr Row code{.key = "MNC", .quantity = quantity::mnc, .digits = 3};
  EXPECT_EQ(textOf(code, 0xF10), "01 ");
  EXPECT_EQ(numberOf(code, 0xF10), 1);
  EXPECT_EQ(textOf(code, 0xFFF), "   ");
  EXPECT_EQ(numberOf(code, 0xFFF), std::nullopt);
}

TEST(Reading, OfAHalfWordShownWithoutItsSignHasTheSignedNumber) {
  constexpr Row c1{.key = "C1 Value", .quantity = quantity::c1, .lowBits = 16, .isSignedNumber = true};
  EXPECT_EQ(textOf(c1, 0xFFFD), "65533");
  EXPECT_EQ(numberOf(c1, 0xFFFD), -3);
}

TEST(Reading, InAListNamesItsPlace) {
  const Reading inSection{.entry = 2, .section = &section, .row = &power, .key = "Power"};
  EXPECT_EQ(pathOf(inSection), "/01;Cell/Serving Cell/2/Power");
  const Reading inRow{.element = 1, .section = &section, .row = &power, .list = "Ports", .key = "Power"};
  EXPECT_EQ(pathOf(inRow), "/01;Cell/Serving Cell/Ports/1/Power");
  EXPECT_EQ(rowOf(inRow), "Power");
  const Reading element{.element = 1, .section = &section, .row = &power, .list = "Ports"};
  EXPECT_EQ(pathOf(element), "/01;Cell/Serving Cell/Ports/1");
  EXPECT_EQ(rowOf(element), "Ports");
}

TEST(Readings, RemoveTheEntriesOfAListFromItsEnd) {
  Readings readings;
  readings.addRemovals(section, {}, 2);
  readings.addRemovals(section, "Ports", 1);
  readings.addRemovalOfEverything();
  EXPECT_EQ(linesOf(readings),
            "/01;Cell/Serving Cell/1  -\n"
            "/01;Cell/Serving Cell/0  -\n"
            "/01;Cell/Serving Cell/Ports/0 Ports -\n"
            "  -\n");
}

TEST(Readings, OfAPropertyListNameEveryLeafAndEveryContainerThatNothingElseMakes) {
  Readings readings;
  const PlistValue value = PlistDictionary::make({{"text", "a"},
                                                  {"number", 7},
                                                  {"real", 2.0},
                                                  {"flag", true},
                                                  {"data", Bytes{1, 2}},
                                                  {"list", PlistArray::make({"b", PlistDictionary::make()})},
                                                  {"group", PlistDictionary::make({{"~key", "c"}})}});
  readings.addEntry(section, 0, value);
  EXPECT_EQ(linesOf(readings),
            "/01;Cell/Serving Cell/0/text text a\n"
            "/01;Cell/Serving Cell/0/number number 7\n"
            "/01;Cell/Serving Cell/0/real real 2.0\n"
            "/01;Cell/Serving Cell/0/flag flag true\n"
            "/01;Cell/Serving Cell/0/data data AQI=\n"
            "/01;Cell/Serving Cell/0/list list []\n"
            "/01;Cell/Serving Cell/0/list/0 list b\n"
            "/01;Cell/Serving Cell/0/list/1 list {}\n"
            "/01;Cell/Serving Cell/0/group/~0key ~key c\n");
  EXPECT_EQ(numberOf(readings.all()[1]), 7);
  EXPECT_EQ(quantityOf(readings.all()[1]), &quantity::integer);
}

TEST(Readings, OfAGroupThatTakesAnotherValuesPlaceBeginWithTheEmptyGroup) {
  Readings readings;
  readings.addValue(section, "EF-AD", PlistDictionary::make({{"key", "c"}}), false);
  EXPECT_EQ(linesOf(readings),
            "/01;Cell/Serving Cell/EF-AD EF-AD {}\n"
            "/01;Cell/Serving Cell/EF-AD/key key c\n");
}

TEST(Readings, OfAWholeDisplayBeginWithTheRemovalOfTheOneBefore) {
  Readings readings;
  const PlistValue display =
      PlistDictionary::make({{"01;Cell", PlistDictionary::make({{"RSSI", "-95 dBm"}})}, {"Mode", "idle"}});
  readings.addDisplay(display);
  EXPECT_EQ(linesOf(readings),
            "  -\n"
            "/01;Cell/RSSI RSSI -95 dBm\n"
            "/Mode Mode idle\n");
  EXPECT_EQ(readings.all()[1].section->name, "Cell");
}

TEST(Readings, AreThoseOfTheMessageTakenInLast) {
  Readings readings;
  readings.begin(std::chrono::seconds(1), 0xB17F);
  readings.addRemovalOfEverything();
  readings.begin(std::chrono::seconds(2), 0xB0C2);
  EXPECT_TRUE(readings.all().empty());
  EXPECT_EQ(readings.arrival(), std::chrono::seconds(2));
  EXPECT_EQ(readings.logCode(), 0xB0C2u);
}

Reading cellOf(const CellIdentity& cell) {
  return {.section = &section, .row = &power, .cell = cell};
}

TEST(Readings, TakeTheServingCellsChannelWhereItIsAmongThem) {
  const CellIdentity serving{RadioFamily::umts, 10612, 362};
  Readings readings;
  readings.add(cellOf({.family = RadioFamily::umts, .code = 9}));
  readings.add(cellOf({.family = RadioFamily::umts, .code = 362}));
  readings.takeChannel(0, serving);
  EXPECT_EQ(textOf(readings.all()[0].cell), "umts:10612/9");
  EXPECT_EQ(textOf(readings.all()[1].cell), "umts:10612/362");
}

TEST(Readings, LeaveTheChannelOpenWhereTheServingCellIsNotAmongThem) {
  Readings readings;
  readings.add(cellOf({.family = RadioFamily::umts, .code = 9}));
  readings.takeChannel(0, {RadioFamily::umts, 10612, 362});
  EXPECT_EQ(textOf(readings.all()[0].cell), "umts:?/9");
}

}  // namespace
}  // namespace kelvasi
