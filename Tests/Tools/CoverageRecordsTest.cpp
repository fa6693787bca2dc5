// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CoverageRecords.h"

#include <gtest/gtest.h>

#include "Tools/Kelvasictl/LogCodeText.h"
#include "Tools/Kelvasictl/MessageTally.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;

const std::vector<std::uint8_t> bytes{0x01, 0x0F, 0xA0};
const std::vector<LogCode> known{0xB0C2, 0xB179, 0xB17F, 0xFF0001};

std::vector<Json> coverageRecords(const Intake& intake, std::string_view technology,
                                  std::span<const LogCode> codes) {
  Coverage coverage;
  coverage.add(technology, intake, codes);
  return coverage.records();
}

TEST(CoverageRecords, TheMostFrequentComesFirst) {
  Intake intake;
  intake.count(0xB179, Outcome::shown, 0s, bytes);
  for (int count = 0; count < 3; ++count) intake.count(0xB193, Outcome::notAskedFor, count * 1s, bytes, 1);
  const auto records = coverageRecords(intake, "Orvane_LTE", known);
  ASSERT_EQ(records.size(), 2U);
  EXPECT_EQ(
      records[0].dump(),
      R"({"technology":"Orvane_LTE","code":"0xB193","outcome":"not asked for","messages":3,"share":75.0,)"
      R"("first":"1970-01-01T00:00:00.000000Z","last":"1970-01-01T00:00:02.000000Z","length":3,)"
      R"("version":15,"nearest":"0xB17F","sample":"010fa0"})");
  EXPECT_EQ(records[1]["code"], "0xB179");
  EXPECT_EQ(records[1]["version"], nullptr);
  EXPECT_EQ(records[1]["nearest"], nullptr);
}

TEST(CoverageRecords, OneCodeMayEndInSeveralWays) {
  Intake intake;
  intake.count(0xB179, Outcome::shown, 0s, bytes);
  intake.count(0xB179, Outcome::tooShort, 0s, bytes);
  EXPECT_EQ(coverageRecords(intake, "Orvane_LTE", known).size(), 2U);
}

TEST(CoverageRecords, TheNearestCodeIsByNumber) {
  Intake intake;
  intake.count(0xB17C, Outcome::notAskedFor, 0s, bytes);
  intake.count(0xFF0009, Outcome::notAskedFor, 0s, bytes);
  intake.count(0x0001, Outcome::notAskedFor, 0s, bytes);
  const auto records = coverageRecords(intake, "Orvane_LTE", known);
  EXPECT_EQ(records[0]["nearest"], "0xB0C2");
  EXPECT_EQ(records[1]["nearest"], "0xB179");  // as near as 0xB17F
  EXPECT_EQ(records[2]["nearest"], "0xFF0001");
  EXPECT_EQ(coverageRecords(intake, "IFX", {})[0]["nearest"], nullptr);
}

TEST(CoverageRecords, WhatHasNoCodeSaysNone) {
  Intake intake;
  intake.count(0, Outcome::shown, 0s, bytes);
  EXPECT_EQ(coverageRecords(intake, "IFX", {})[0]["code"], nullptr);
}

TEST(CoverageRecords, CapturesAddUp) {
  Intake first;
  Intake second;
  first.count(0xB193, Outcome::notAskedFor, 5s, bytes);
  second.count(0xB193, Outcome::notAskedFor, 1s, std::span(bytes).first(2));
  second.count(0xB193, Outcome::notAskedFor, 9s, std::span(bytes).first(1));
  second.count(0xB179, Outcome::shown, 9s, bytes);
  Coverage coverage;
  coverage.add("Orvane_LTE", first, known);
  coverage.add("Orvane_LTE", second, known);
  coverage.add("Orvane_UTRAN2", second, known);
  const auto records = coverage.records();
  ASSERT_EQ(records.size(), 4U);
  EXPECT_EQ(records[0]["messages"], 3U);
  EXPECT_EQ(records[0]["first"], "1970-01-01T00:00:01.000000Z");
  EXPECT_EQ(records[0]["last"], "1970-01-01T00:00:09.000000Z");
  EXPECT_EQ(records[0]["length"], 1U);
  EXPECT_EQ(records[0]["sample"], "010fa0");
  EXPECT_EQ(records[1]["technology"], "Orvane_UTRAN2");
}

TEST(CoverageRecords, CodesPastTheMostAreOneRecord) {
  Intake intake;
  for (LogCode code = 0; code < Intake::mostCounts + 7; ++code)
    intake.count(code, Outcome::notAskedFor, 0s, bytes);
  const auto records = coverageRecords(intake, "Orvane_LTE", known);
  ASSERT_EQ(records.size(), Intake::mostCounts + 1);
  EXPECT_EQ(records.back()["messages"], 7U);
  EXPECT_EQ(records.back()["outcome"], "of further codes");
  EXPECT_EQ(records.back().size(), records.front().size());
}

std::string tallied(std::uint64_t missing, std::uint64_t messages) {
  Intake intake;
  for (std::uint64_t count = 0; count < messages; ++count)
    intake.count(1, count < missing ? Outcome::notAskedFor : Outcome::shown, 0s, bytes);
  MessageTally tally;
  tally.add(intake);
  return tally.text();
}

TEST(MessageTally, SaysHowManyOfHowManyWereNotShown) {
  EXPECT_EQ(tallied(0, 8812), "");
  EXPECT_EQ(tallied(0, 0), "");
  EXPECT_EQ(tallied(1057, 8812), "12 % of 8,812 messages were not shown");
  EXPECT_EQ(tallied(4, 4), "100 % of 4 messages were not shown");
  EXPECT_EQ(tallied(1, 1), "100 % of 1 message was not shown");
  EXPECT_EQ(tallied(1, 3), "33 % of 3 messages were not shown");
  EXPECT_EQ(tallied(302, 8812), "3.4 % of 8,812 messages were not shown");
  EXPECT_EQ(tallied(1, 1234567), "0.0001 % of 1,234,567 messages were not shown");
  EXPECT_EQ(tallied(123456, 1234567), "10 % of 1,234,567 messages were not shown");
  EXPECT_EQ(tallied(95, 1000), "9.5 % of 1,000 messages were not shown");
}

TEST(MessageTally, AddsUp) {
  Intake intake;
  intake.count(1, Outcome::shown, 0s, bytes);
  intake.count(2, Outcome::tooShort, 0s, bytes);
  MessageTally tally;
  tally.add(intake);
  tally.add(intake);
  EXPECT_EQ(tally.text(), "50 % of 4 messages were not shown");
}

TEST(LogCodeText, HasFourDigitsAtLeast) {
  EXPECT_EQ(logCodeText(0x7), "0x0007");
  EXPECT_EQ(logCodeText(0xB17F), "0xB17F");
  EXPECT_EQ(logCodeText(0xFF0001), "0xFF0001");
}

}  // namespace
}  // namespace kelvasi
