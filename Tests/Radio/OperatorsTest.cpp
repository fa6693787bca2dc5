// SPDX-License-Identifier: Apache-2.0
#include "Radio/Operators.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "Radio/OperatorTables.h"

namespace kelvasi {
namespace {

using ::testing::AllOf;
using ::testing::ElementsAre;
using ::testing::Field;
using ::testing::IsEmpty;

std::string described(const Operators& operators, std::string_view mcc, std::string_view mnc) {
  return operators.describe(networkIdFromDigits(mcc, mnc).value());
}

auto isFault(std::size_t line, const std::string& what) {
  return AllOf(Field(&Operators::Fault::line, line), Field(&Operators::Fault::what, what));
}

TEST(OperatorTables, AreInOrderAndWithoutEmptyNames) {
  const auto networks = networkTable();
  const auto isBefore = [](const NetworkEntry& one, const NetworkEntry& next) {
    return one.network < next.network;
  };
  for (std::size_t at = 1; at < networks.size(); ++at) EXPECT_TRUE(isBefore(networks[at - 1], networks[at]));
  for (const NetworkEntry& entry : networks) {
    EXPECT_FALSE(entry.name.empty()) << textOf(entry.network);
    EXPECT_EQ(networkIdFromNumbers(entry.network.mcc, entry.network.mnc).has_value(), true);
    EXPECT_TRUE(entry.network.mncDigits == 3 || (entry.network.mncDigits == 2 && entry.network.mnc < 100));
  }
  EXPECT_GT(networks.size(), 500U);
}

TEST(OperatorTables, EveryNetworkHasACountry) {
  const auto countries = countryTable();
  EXPECT_TRUE(std::ranges::is_sorted(countries, {}, &CountryEntry::mcc));
  EXPECT_GT(countries.size(), 200U);
  for (const NetworkEntry& entry : networkTable())
    EXPECT_NE(std::ranges::find(countries, entry.network.mcc, &CountryEntry::mcc), countries.end())
        << textOf(entry.network);
}

TEST(Operators, TheNumberIsAlwaysBesideTheName) {
  const Operators operators;
  EXPECT_EQ(described(operators, "262", "01"), "262-01 Telekom (Germany)");
  EXPECT_EQ(described(operators, "310", "410"), "310-410 AT&T (United States)");
  EXPECT_EQ(described(operators, "234", "30"), "234-30 EE (United Kingdom)");
  EXPECT_EQ(described(operators, "001", "01 "), "001-01 Test network (test)");
}

TEST(Operators, WhatIsNotKnownIsLeftOut) {
  const Operators operators;
  EXPECT_EQ(described(operators, "999", "02"), "999-02 (private network)");
  EXPECT_EQ(described(operators, "262", "999"), "262-999 (Germany)");
  EXPECT_EQ(described(operators, "000", "00"), "000-00");
  EXPECT_EQ(operators.find({0, 0, 2}).name, "");
}

TEST(Operators, CountriesAreNamedAsOneSaysThem) {
  const Operators operators;
  EXPECT_EQ(operators.find({630, 1, 2}).country, "The Democratic Republic of the Congo");
  EXPECT_EQ(operators.find({332, 1, 3}).country, "U.S. Virgin Islands");
  EXPECT_EQ(operators.find({348, 1, 3}).country, "British Virgin Islands");
  EXPECT_EQ(operators.find({450, 1, 2}).country, "South Korea");
  EXPECT_EQ(operators.find({221, 1, 2}).country, "Kosovo");
  EXPECT_EQ(operators.find({647, 10, 2}).country, "Réunion / Mayotte");
}

TEST(Operators, TwoAndThreeDigitsAreDifferentNetworks) {
  Operators operators;
  EXPECT_THAT(operators.addNames("310,41,Short\n310,041,Long\n"), IsEmpty());
  EXPECT_EQ(described(operators, "310", "41"), "310-41 Short (United States)");
  EXPECT_EQ(described(operators, "310", "041"), "310-041 Long (United States)");
}

TEST(Operators, AMereNumberIsTheOneReadingThatHasAName) {
  Operators operators;
  EXPECT_EQ(operators.describe({262, 1, 0}), "262-01 Telekom (Germany)");
  EXPECT_EQ(operators.describe({310, 32, 0}), "310-32 (United States)");
  operators.addNames("310,032,Only\n");
  EXPECT_EQ(operators.describe({310, 32, 0}), "310-032 Only (United States)");
  operators.addNames("310,32,Other\n");
  EXPECT_EQ(operators.describe({310, 32, 0}), "310-32 (United States)");
}

TEST(Operators, AUsersNamesStandOverThoseBuiltIn) {
  Operators operators;
  EXPECT_THAT(operators.addNames("\xEF\xBB\xBF# mine\r\n\r\n262,01,First\n262,01,\"Bench, left\"\r\n"
                                 "999,02,Test Network,test"),
              IsEmpty());
  EXPECT_EQ(described(operators, "262", "01"), "262-01 Bench, left (Germany)");
  EXPECT_EQ(described(operators, "999", "02"), "999-02 Test Network (test)");
}

TEST(Operators, LinesThatAreNotUnderstoodAreToldAndTheOthersCount) {
  Operators operators;
  EXPECT_THAT(
      operators.addNames("262,01\n999,01,Home\n26,01,Short\n262,1,One\n262,01,\n262,02,\"Open\n262,03,a\tb\n"
                         "262,04,a,b,c\n"),
      ElementsAre(isFault(1, "is not MCC, MNC, name and, if wanted, country"),
                  isFault(3, "does not begin with an MCC of three digits and an MNC of two or three"),
                  isFault(4, "does not begin with an MCC of three digits and an MNC of two or three"),
                  isFault(5, "has no name"),
                  isFault(6, "has a quote that is not closed before a comma or the end"),
                  isFault(7, "holds a control character"),
                  isFault(8, "is not MCC, MNC, name and, if wanted, country")));
  EXPECT_EQ(described(operators, "999", "01"), "999-01 Home (private network)");
}

}  // namespace
}  // namespace kelvasi
