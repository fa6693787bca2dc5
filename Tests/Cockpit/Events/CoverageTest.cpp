// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/Coverage.h"

#include <gtest/gtest.h>

#include "Cockpit/Events/CoverageBook.h"

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;

TEST(Coverage, NothingYet) {
  EXPECT_EQ(coverageOf(Intake(), 0s).words, "Nothing received yet");
}

TEST(Coverage, EveryOneShown) {
  Intake intake;
  for (int message = 0; message < 1200; ++message) intake.count(0xB0C2, Outcome::shown, 1s, {});
  EXPECT_EQ(coverageOf(intake, 1s).words, "1,200 messages, every one shown");
  EXPECT_TRUE(coverageOf(intake, 1s).lines.empty());
}

TEST(Coverage, WhatWasNotShownTheMostFrequentFirst) {
  constexpr std::array<std::uint8_t, 3> record{0x05, 0x7F, 0xA0};
  Intake intake;
  intake.count(0xB0C2, Outcome::shown, 1s, {});
  intake.count(0x1FEB, Outcome::notAskedFor, 1s, {});
  intake.count(0xB17F, Outcome::notUnderstood, 2s, record, 0);
  intake.count(0xB17F, Outcome::notUnderstood, 3s, record, 0);
  intake.count(0, Outcome::notARecord, 3s, {});
  const Coverage coverage = coverageOf(intake, 10s);
  EXPECT_EQ(coverage.words, "5 messages, 80 % not shown");
  ASSERT_EQ(coverage.lines.size(), 3U);
  EXPECT_EQ(coverage.lines[0].code, "0xB17F");
  EXPECT_EQ(coverage.lines[0].words, "not understood");
  EXPECT_EQ(coverage.lines[0].messages, 2U);
  EXPECT_EQ(coverage.lines[0].version, "version 5");
  EXPECT_EQ(coverage.lines[0].sample, "05 7F A0");
  EXPECT_EQ(coverage.lines[0].age.text, "7 s");
  EXPECT_EQ(coverage.lines[1].code, "0x1FEB");
  EXPECT_EQ(coverage.lines[2].code, "");
}

TEST(Coverage, MessagesThatNoLineTellsOfAreCounted) {
  Intake intake;
  for (LogCode code = 0; code < Intake::mostCounts + 3; ++code)
    intake.count(code, Outcome::notAskedFor, 1s, {});
  EXPECT_EQ(coverageOf(intake, 1s).beyond, intake.beyond());
  EXPECT_GT(coverageOf(intake, 1s).beyond, 0U);
}

TEST(CoverageBook, KnowsWhatTheIntakeCounted) {
  constexpr std::array<std::uint8_t, 2> record{0x05, 0x7F};
  Intake intake;
  CoverageBook book;
  EXPECT_EQ(book.at(0s).words, "Nothing received yet");
  intake.count(0xB0C2, Outcome::shown, 1s, {});
  book.take(intake);
  EXPECT_EQ(book.at(1s).words, "1 message, every one shown");
  intake.count(0xB17F, Outcome::notUnderstood, 2s, record, 0);
  book.take(intake);
  intake.count(0xB0C2, Outcome::shown, 3s, {});
  book.take(intake);
  const Coverage coverage = book.at(10s);
  EXPECT_EQ(coverage.words, "3 messages, 33 % not shown");
  ASSERT_EQ(coverage.lines.size(), 1U);
  EXPECT_EQ(coverage.lines[0].version, "version 5");
  EXPECT_EQ(coverage.lines[0].age.text, "8 s");
}

TEST(CoverageBook, AnotherGeneratorsCountsAreAddedToThoseBeforeIt) {
  CoverageBook book;
  Intake first;
  for (int message = 0; message < 3; ++message) {
    first.count(0xB17F, Outcome::tooShort, 1s, {});
    book.take(first);
  }
  Intake second;
  second.count(0xB17F, Outcome::tooShort, 5s, {});
  book.take(second);
  second.count(0x1FEB, Outcome::notAskedFor, 6s, {});
  book.take(second);
  const Coverage coverage = book.at(8s);
  EXPECT_EQ(coverage.messages, 5U);
  EXPECT_EQ(coverage.notShown, 5U);
  ASSERT_EQ(coverage.lines.size(), 2U);
  EXPECT_EQ(coverage.lines[0].messages, 4U);
  EXPECT_EQ(coverage.lines[0].age.text, "live");
  EXPECT_EQ(coverage.lines[1].code, "0x1FEB");
}

TEST(Counters, AShareIsNeverRoundedAway) {
  EXPECT_EQ(countersText(1, 0), "1 message");
  EXPECT_EQ(countersText(1, 1), "1 message, 100 % not shown");
  EXPECT_EQ(countersText(1000, 9), "1,000 messages, less than 1 % not shown");
  EXPECT_EQ(countersText(1000, 10), "1,000 messages, 1 % not shown");
  EXPECT_EQ(countersText(1000, 999), "1,000 messages, 99 % not shown");
}

TEST(CodeText, HasFourDigitsAtLeast) {
  EXPECT_EQ(codeText(0x1), "0x0001");
  EXPECT_EQ(codeText(0xB17F), "0xB17F");
  EXPECT_EQ(codeText(0xFF0001), "0xFF0001");
}

}  // namespace
}  // namespace kelvasi::cockpit
