// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cockpit.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi::cockpit {
namespace {

std::vector<std::string> namesOf(const std::vector<CellLine>& cells) {
  std::vector<std::string> names;
  for (const CellLine& cell : cells) names.push_back(cell.name);
  return names;
}

TEST(Cockpit, SaysWhyItIsEmpty) {
  Fed fed;
  const Snapshot snapshot = fed.at(0s);
  EXPECT_EQ(snapshot.link.words, "nothing received yet");
  EXPECT_FALSE(snapshot.serving.isKnown);
  EXPECT_EQ(snapshot.serving.why, "Nothing received yet");
  EXPECT_EQ(snapshot.cellsWhy, "Nothing received yet");
  EXPECT_EQ(snapshot.eventsWhy, "Nothing has happened yet");
}

TEST(Cockpit, SaysThatNoCellIsReported) {
  Fed fed;
  fed.take(Message(0s).plain(quantity::txPower, 5));
  EXPECT_EQ(fed.at(0s).serving.why, "No serving cell reported yet");
  EXPECT_EQ(fed.at(0s).cellsWhy, "No neighbours reported in the last minute");
}

TEST(Cockpit, ShowsTheServingCellWithItsLevels) {
  Fed fed;
  fed.take(Message(0s)
               .serving(cell404, quantity::pci, 404)
               .serving(cell404, quantity::tac, 4517)
               .serving(cell404, quantity::cellId, 5121 * 256 + 3)
               .serving(cell404, quantity::rsrp, -95)
               .serving(cell404, quantity::rsrq, -7));
  const ServingCell serving = fed.at(0s).serving;
  EXPECT_EQ(serving.title, "LTE, operator not reported");
  EXPECT_EQ(serving.subtitle, "B7 2680 MHz  PCI 404  TAC 4517  eNB 5121/3");
  EXPECT_EQ(serving.channel, (NamedValue{"E-ARFCN", "3350"}));
  ASSERT_EQ(serving.levels.size(), 4U);
  EXPECT_EQ(serving.levels[0].text, "-95");
  EXPECT_EQ(serving.levels[0].verdictWord, "fair");
  EXPECT_EQ(serving.levels[1].text, "-7.0");
  EXPECT_EQ(serving.levels[1].verdictWord, "excellent");
  EXPECT_EQ(serving.levels[2].text, "not reported");
  EXPECT_EQ(serving.levels[2].verdictWord, "");
}

TEST(Cockpit, ShowsNeighboursBestFirst) {
  Fed fed;
  Message message = served(0s, cell404, -95);
  message.neighbour(cell257, quantity::rsrp, -110).neighbour(cell362, quantity::rsrp, -105);
  fed.take(message);
  const auto cells = fed.at(0s).cells;
  EXPECT_EQ(namesOf(cells), (std::vector<std::string>{"PCI 362", "PCI 257"}));
  EXPECT_EQ(cells[0].differenceText, "-10");
  EXPECT_EQ(cells[1].differenceText, "-15");
}

TEST(Cockpit, TheLastThreeEventsTheNewestFirst) {
  Fed fed;
  for (int turn = 0; turn < 5; ++turn) fed.take(served(turn * 1s, turn % 2 == 0 ? cell404 : cell362, -90));
  const Snapshot snapshot = fed.at(5s);
  ASSERT_EQ(snapshot.events.size(), 3U);
  EXPECT_EQ(snapshot.events[0].words, "cell change PCI 362 to 404");
  EXPECT_EQ(snapshot.events[0].timeText, "00:00:04");
  EXPECT_EQ(snapshot.eventCount, 4U);
  EXPECT_EQ(fed.cockpit.events(10, 3).size(), 1U);
}

TEST(Cockpit, SeriesOfADayAreInThirtyTwoMegabytes) {
  EXPECT_LE(Cockpit().bytes(), 32U * 1000 * 1000);
}

// What nobody looks at costs no text.
TEST(Cockpit, TakingAMessageAllocatesNothing) {
  Fed fed;
  Message message = served(0s, cell404, -95);
  message.neighbour(cell362, quantity::rsrp, -105).plain(quantity::txPower, 5);
  const Readings& readings = message;
  fed.cockpit.take(readings, fed.intake);
  EXPECT_EQ(allocationsDuring([&] {
              for (int turn = 0; turn < 100; ++turn) fed.cockpit.take(readings, fed.intake);
            }),
            0U);
}

TEST(Cockpit, AlarmsComeAndGo) {
  Fed fed;
  EXPECT_EQ(fed.cockpit.addAlarm("rsrp < -100"), "");
  EXPECT_EQ(fed.cockpit.addAlarm("event reject"), "");
  EXPECT_EQ(fed.cockpit.addAlarm("rsrp < -100"), "");  // it is there
  EXPECT_EQ(fed.cockpit.alarmRules(), (std::vector<std::string>{"rsrp < -100", "event reject"}));
  fed.take(served(0s, cell404, -110));
  fed.cockpit.removeAlarm(1);
  EXPECT_EQ(fed.at(0s).alarms.size(), 1U);
  EXPECT_EQ(fed.at(0s).alarms[0].words, "RSRP -110 dBm, LTE 3350/404");
  EXPECT_TRUE(fed.at(0s).alarms[0].isRaised);
  fed.take(served(1s, cell404, -90));
  EXPECT_FALSE(fed.at(1s).alarms[0].isRaised);
  EXPECT_EQ(fed.at(1s).alarms[0].given, 1U);
  fed.cockpit.removeAlarm(5);
  fed.cockpit.removeAlarm(0);
  EXPECT_EQ(fed.cockpit.alarmRules().size(), 0U);
}

TEST(Cockpit, HandsOnWhatHappens) {
  std::vector<std::string> words;
  std::vector<std::string> alarms;
  CockpitSetUp setUp;
  setUp.onEvent = [&](const EventLine& event) { words.push_back(event.words); };
  setUp.onAlarm = [&](const AlarmLine& alarm) { alarms.push_back(alarm.words); };
  Fed fed(std::move(setUp));
  EXPECT_EQ(fed.cockpit.addAlarm("rsrp < -100"), "");
  EXPECT_NE(fed.cockpit.addAlarm("rsrp weak"), "");
  fed.take(served(0s, cell404, -90));
  fed.take(served(1s, cell362, -117));
  EXPECT_EQ(words, std::vector<std::string>{"cell change PCI 404 to 362"});
  EXPECT_EQ(alarms, std::vector<std::string>{"RSRP -117 dBm, LTE 3350/362"});
  EXPECT_TRUE(fed.at(1s).alarms.front().isRaised);
}

TEST(Cockpit, CoverageTellsWhatWasNotShown) {
  Fed fed;
  fed.take(served(0s, cell404, -95));
  EXPECT_EQ(fed.cockpit.coverage(noon).words, "1 message, every one shown");
  fed.intake.count(0xB17F, Outcome::tooShort, noon + 1s, {});
  fed.take(served(1s, cell404, -95));
  const Coverage coverage = fed.cockpit.coverage(noon + 1s);
  ASSERT_EQ(coverage.lines.size(), 1U);
  EXPECT_EQ(coverage.lines[0].code + " " + coverage.lines[0].words, "0xB17F too short");
}

}  // namespace
}  // namespace kelvasi::cockpit
