// SPDX-License-Identifier: Apache-2.0
#include "Survey/Survey.h"

#include <gtest/gtest.h>

#include "Tests/Survey/TypedReadings.h"

namespace kelvasi::survey {
namespace {

using namespace test;

constexpr CellIdentity here{RadioFamily::lte, 3350, 404};
constexpr CellIdentity there{RadioFamily::lte, 3350, 362};

Message served(Arrival after, const CellIdentity& cell, std::int64_t rsrp) {
  Message message(after);
  message.serving(cell, quantity::earfcn, cell.channel)
      .serving(cell, quantity::pci, cell.code)
      .serving(cell, quantity::rsrp, rsrp);
  return message;
}

struct Surveyed {
  explicit Surveyed(std::string_view rule = {}) : survey(setUp(rule)) {}

  SurveySetUp setUp(std::string_view rule) {
    SurveySetUp result;
    if (!rule.empty()) result.rules.push_back(std::get<AlarmRule>(parseAlarmRule(rule)));
    result.onEvent = [this](const Event& event) { events.push_back(event.text()); };
    result.onAlarm = [this](const Alarm& alarm) {
      alarms.push_back(
          textOf(alarm.cell) + " " +
          (alarm.value ? std::to_string(static_cast<int>(*alarm.value)) : std::string(alarm.event)));
    };
    return result;
  }
  void take(const Readings& readings) { survey.take(readings, intake); }

  std::vector<std::string> events;
  std::vector<std::string> alarms;
  Intake intake;
  Survey survey;
};

Spread whole(const Survey& survey, const CellIdentity& identity) {
  for (const SeenCell& cell : survey.cells().all()) {
    if (cell.identity == identity) return survey.series()->whole({cell.number, &quantity::rsrp});
  }
  return {};
}

TEST(Survey, ASeriesFollowsItsCell) {
  Surveyed drive;
  drive.take(served(0s, here, -90).neighbour(there, quantity::rsrp, -100));
  drive.take(served(1s, there, -91).neighbour(here, quantity::rsrp, -95));
  drive.take(served(2s, there, -92));
  EXPECT_EQ(whole(drive.survey, here).minimum, -95);
  EXPECT_EQ(whole(drive.survey, here).maximum, -90);
  EXPECT_EQ(whole(drive.survey, there).minimum, -100);
  EXPECT_EQ(whole(drive.survey, there).maximum, -91);
  EXPECT_EQ(whole(drive.survey, there).count, 3U);
}

TEST(Survey, AnAlarmLooksAtTheServingCell) {
  Surveyed drive("rsrp < -99");
  drive.take(served(0s, here, -90).neighbour(there, quantity::rsrp, -120));
  EXPECT_EQ(drive.alarms, std::vector<std::string>{});
  drive.take(served(1s, there, -100));
  EXPECT_EQ(drive.alarms, std::vector<std::string>{"lte:3350/362 -100"});
}

TEST(Survey, AnAlarmLooksAtNoNeighbourWhoseCellIsNotKnown) {
  const ReadingSection others{.name = "Others", .path = "/Others", .role = CellRole::neighbour};
  const Row row{.key = "RSRP", .quantity = quantity::rsrp};
  Surveyed drive("rsrp < -99");
  const Message message = served(0s, here, -90);
  Readings readings = message;
  readings.add({.section = &others, .row = &row, .raw = -120, .key = row.key});
  drive.take(readings);
  EXPECT_EQ(drive.alarms, std::vector<std::string>{});
}

TEST(Survey, AnAlarmLooksAtTheHandsetItself) {
  Surveyed drive("tx_power > 20");
  drive.take(Message(0s).plain(quantity::txPower, 23));
  EXPECT_EQ(drive.alarms, std::vector<std::string>{" 23"});
}

TEST(Survey, AnEventIsKeptGivenAndMayBeAnAlarm) {
  Surveyed drive("event cell_change");
  drive.take(served(0s, here, -90));
  drive.take(served(1s, there, -90));
  const std::string change = "cell change lte:3350/404 to lte:3350/362";
  EXPECT_EQ(drive.events, std::vector<std::string>{change});
  EXPECT_EQ(drive.alarms, std::vector<std::string>{"lte:3350/362 " + change});
  ASSERT_EQ(drive.survey.events().size(), 1U);
  EXPECT_EQ(drive.survey.events().at(0).time, noon + 1s);
}

TEST(Survey, ACellThatIsSilentIsNoService) {
  Surveyed drive;
  drive.take(served(0s, here, -90));
  for (int second = 2; second < 20; second += 2) drive.take(Message(second * 1s));
  drive.take(served(20s, here, -90));
  EXPECT_EQ(drive.events, (std::vector<std::string>{"service lost: no serving cell for 15 s",
                                                    "service back: lte:3350/404"}));
}

TEST(Survey, TimePassesWithoutMessages) {
  Surveyed drive("rsrp absent for 10s");
  drive.take(served(0s, here, -90));
  drive.survey.pass(noon + 10s);
  EXPECT_EQ(drive.alarms, std::vector<std::string>{"lte:3350/404 "});
  drive.survey.pass(noon + 16s);
  EXPECT_EQ(drive.events, std::vector<std::string>{"link lost: no message for 15 s"});
}

TEST(Survey, SeriesCanBeDoneWithout) {
  SurveySetUp setUp;
  setUp.keepsSeries = false;
  Survey survey(std::move(setUp));
  survey.take(served(0s, here, -90), Intake());
  EXPECT_EQ(survey.series(), nullptr);
  EXPECT_EQ(survey.cells().all().size(), 1U);
}

TEST(Survey, MergedDrivesShareCellsAndSeries) {
  Surveyed one;
  Surveyed other;
  one.take(served(0s, there, -80));
  other.take(served(100s, here, -70));
  other.take(served(101s, there, -90));
  other.take(Message(102s).plain(quantity::txPower, 5));
  one.survey.merge(other.survey);
  EXPECT_EQ(whole(one.survey, there).count, 2U);
  EXPECT_EQ(whole(one.survey, there).minimum, -90);
  EXPECT_EQ(whole(one.survey, here).maximum, -70);
  EXPECT_EQ(one.survey.series()->whole({0, &quantity::txPower}).count, 1U);
}

}  // namespace
}  // namespace kelvasi::survey
