// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LogGenerator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/GSM/Orvane_GSMLogGenerator.h"
#include "Telvon/Technology.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;

const PlistArray& historyOf(const PlistDictionary& state) {
  return *state.find("History")->array();
}

TEST(LogGenerator, AnnouncesItself) {
  test::TestPlatform surroundings;
  const LogGenerator generator(surroundings.platform());
  EXPECT_THAT(surroundings.log.warnings(), ElementsAre("Creating Log object: <ptr>"));
}

TEST(LogGenerator, ItsAbstractOperationsThrow) {
  test::TestPlatform surroundings;
  LogGenerator generator(surroundings.platform());
  PlistDictionary state;
  EXPECT_THROW(generator.updateState(state, {}), UnimplementedMethodError);
  EXPECT_THROW(generator.generateLogUsingState(state), UnimplementedMethodError);
  EXPECT_THROW(generator.getStartCommand(), UnimplementedMethodError);
  EXPECT_THROW(generator.getSaveContentsFromState(state), UnimplementedMethodError);
}

TEST(History, AnEntryHasFiveKeys) {
  const test::FakeClock clock;
  PlistDictionary state{
      {"DisplayState", Bytes{1}}, {"Display", "shown"}, {"ExtraInfo", PlistDictionary::make()}};
  LogGenerator::updateHistoryInState(state, clock);
  EXPECT_EQ(historyOf(state).at(0), PlistValue(PlistDictionary::make({
                                        {"DisplayState", Bytes{1}},
                                        {"Display", "shown"},
                                        {"ExtraInfo", PlistDictionary::make()},
                                        {"Date", "2024-03-05 14:07:09 +0000"},
                                        {"Description", "Snapshot (2024-03-05 14:07:09 +0000)"},
                                    })));
}

TEST(History, AnEntryWithoutDisplayStateIsEmptyAndLaterOnesStillCome) {
  const test::FakeClock clock;
  PlistDictionary state{{"Display", "shown"}, {"ExtraInfo", PlistDictionary::make()}};
  LogGenerator::updateHistoryInState(state, clock);
  LogGenerator::updateHistoryInState(state, clock);
  ASSERT_EQ(historyOf(state).size(), 2u);
  EXPECT_TRUE(historyOf(state).at(0).dictionary()->empty());
}

TEST(History, AnEntryEndsBeforeItsFirstAbsentValue) {
  const test::FakeClock clock;
  PlistDictionary state{{"DisplayState", "raw"}, {"ExtraInfo", PlistDictionary::make()}};
  LogGenerator::updateHistoryInState(state, clock);
  EXPECT_EQ(historyOf(state).at(0), PlistValue(PlistDictionary::make({{"DisplayState", "raw"}})));
}

TEST(History, TheSixthEntryDropsTheOldest) {
  const test::FakeClock clock;
  PlistDictionary state;
  for (int number = 1; number <= 6; ++number) {
    state.set("DisplayState", number);
    LogGenerator::updateHistoryInState(state, clock);
  }
  ASSERT_EQ(historyOf(state).size(), 5u);
  EXPECT_EQ(*historyOf(state).at(0).dictionary()->get("DisplayState").integer(), 2);
  EXPECT_EQ(*historyOf(state).at(4).dictionary()->get("DisplayState").integer(), 6);
}

TEST(History, AnEntryIsWrittenOverWhenNobodyElseHoldsIt) {
  const test::FakeClock clock;
  PlistDictionary state{{"DisplayState", Bytes{}}, {"Display", PlistDictionary::make({{"row", 1}})}};
  for (int number = 1; number <= 5; ++number) LogGenerator::updateHistoryInState(state, clock);
  const PlistDictionary* oldest = historyOf(state).at(0).dictionary();
  const PlistValue held = historyOf(state).at(1);
  state.set("Display", PlistDictionary::make({{"row", 2}, {"other", 3}}));
  LogGenerator::updateHistoryInState(state, clock);
  EXPECT_EQ(historyOf(state).at(4).dictionary(), oldest);
  EXPECT_EQ(oldest->get("Display"), state.get("Display"));
  LogGenerator::updateHistoryInState(state, clock);
  EXPECT_NE(historyOf(state).at(4).dictionary(), held.dictionary());
  EXPECT_EQ(held.dictionary()->get("Display"), PlistValue(PlistDictionary::make({{"row", 1}})));
}

TEST(History, ALongHistoryIsCutToFourBeforeTheNewEntry) {
  const test::FakeClock clock;
  const auto history = PlistArray::make({1, 2, 3, 4, 5, 6, 7, 8, 9});
  PlistDictionary state{{"History", history}};
  LogGenerator::updateHistoryInState(state, clock);
  ASSERT_EQ(history->size(), 5u);
  EXPECT_EQ(*history->at(0).integer(), 6);
  EXPECT_TRUE(history->at(4).dictionary());
}

TEST(History, CopiesAreShallow) {
  const test::FakeClock clock;
  const auto rows = PlistDictionary::make({{"row", "before"}});
  const auto display = PlistDictionary::make({{"Section", rows}, {"Text", "before"}});
  PlistDictionary state{{"DisplayState", Bytes{}}, {"Display", display}};
  LogGenerator::updateHistoryInState(state, clock);
  display->set("Text", "after");
  rows->set("row", "after");
  const PlistValue copy = historyOf(state).at(0).dictionary()->get("Display");
  EXPECT_EQ(*copy.dictionary()->get("Text").string(), "before");
  EXPECT_EQ(*copy.dictionary()->get("Section").dictionary()->get("row").string(), "after");
}

TEST(TechnologyRegistry, GivesTheGeneratorOfATechnology) {
  test::TestPlatform surroundings;
  const auto generator =
      LogGenerator::generatorFromTechnology(kTelvonLogChannelTechnology_Orvane_GSM, surroundings.platform());
  EXPECT_TRUE(dynamic_cast<Orvane_GSMLogGenerator*>(generator.get()));
}

TEST(TechnologyRegistry, GivesNoGeneratorForAnythingElse) {
  test::TestPlatform surroundings;
  for (const char* technology : {"", "Orvane_GSM", "kTelvonLogChannelTechnology_Orvane_GSM ", "something"}) {
    EXPECT_EQ(LogGenerator::generatorFromTechnology(technology, surroundings.platform()), nullptr)
        << technology;
  }
}

TEST(Orvane_GSMLogGenerator, LogsItsCreationBeforeAnythingElse) {
  test::TestPlatform surroundings;
  { const Orvane_GSMLogGenerator generator(surroundings.platform()); }
  EXPECT_THAT(surroundings.log.errors(),
              ElementsAre("Creating Orvane_GSMLogGenerator object",
                          "Creating OrvaneLogGenerator2 object with <ptr>", "Class Index: 1"));
  EXPECT_EQ(surroundings.log.firstLine(), "Creating Orvane_GSMLogGenerator object");
  const auto warnings = surroundings.log.warnings();
  EXPECT_EQ(warnings[warnings.size() - 3], "Creating Log object: <ptr>");
  EXPECT_EQ(warnings[warnings.size() - 2], "Orvane_GSMLogGenerator is destructed <ptr>");
  EXPECT_EQ(warnings[warnings.size() - 1], "Orvane_GSMLogGenerator is destructed <ptr>");
  EXPECT_THAT(surroundings.trace.lines,
              ElementsAre("Deallocing Orvane_GSMClassIndex", "Deallocing ClassIndex"));
}

}  // namespace
}  // namespace kelvasi
