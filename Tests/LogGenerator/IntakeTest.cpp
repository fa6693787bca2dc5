// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Intake.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using std::chrono::seconds;

TEST(Intake, CountsByCodeAndOutcome) {
  Intake intake;
  const Bytes whole(38);
  const Bytes cut(20);
  intake.count(0xB0C2, Outcome::shown, seconds(1), whole);
  intake.count(0xB0C2, Outcome::tooShort, seconds(2), cut);
  intake.count(0xB0C2, Outcome::shown, seconds(3), whole);
  ASSERT_EQ(intake.counts().size(), 2u);
  EXPECT_EQ(intake.counts()[0].messages, 2u);
  EXPECT_EQ(intake.counts()[0].first, seconds(1));
  EXPECT_EQ(intake.counts()[0].last, seconds(3));
  EXPECT_EQ(intake.counts()[1].outcome, Outcome::tooShort);
  EXPECT_EQ(intake.counts()[1].lastLength, 20u);
  EXPECT_EQ(intake.messages(), 3u);
  EXPECT_EQ(intake.messages(Outcome::shown), 2u);
}

TEST(Intake, KeepsTheBeginningOfTheFirstRecord) {
  Intake intake;
  Bytes record(100, 7);
  intake.count(0x1234, Outcome::notAskedFor, seconds(1), record);
  record.assign(3, 9);
  intake.count(0x1234, Outcome::notAskedFor, seconds(2), record);
  const IntakeCount& counted = intake.counts()[0];
  EXPECT_EQ(counted.sampled, IntakeCount::sampleSize);
  EXPECT_EQ(counted.sample.front(), 7);
  EXPECT_EQ(counted.lastLength, 3u);
}

TEST(Intake, KnowsTheVersionWhereTheRecordHasOne) {
  Intake intake;
  Bytes record(20);
  record[13] = 5;
  intake.count(0xB17F, Outcome::shown, seconds(1), record, 13);
  intake.count(0xB0C1, Outcome::shown, seconds(1), record);
  EXPECT_EQ(intake.counts()[0].lastVersion, 5);
  EXPECT_EQ(intake.counts()[1].lastVersion, std::nullopt);
  record.resize(13);
  intake.count(0xB17F, Outcome::shown, seconds(2), record, 13);
  EXPECT_EQ(intake.counts()[0].lastVersion, 5) << "a record that ends before it says nothing";
}

TEST(Intake, IsBoundedAndCountsWhatIsBeyond) {
  Intake intake;
  for (LogCode code = 0; code < Intake::mostCounts + 10; ++code)
    intake.count(code, Outcome::notAskedFor, seconds(1), {});
  intake.count(3, Outcome::notAskedFor, seconds(2), {});
  EXPECT_EQ(intake.counts().size(), Intake::mostCounts);
  EXPECT_EQ(intake.counts()[3].messages, 2u);
  EXPECT_EQ(intake.beyond(), 10u);
  EXPECT_EQ(intake.messages(), Intake::mostCounts + 11);
}

}  // namespace
}  // namespace kelvasi
