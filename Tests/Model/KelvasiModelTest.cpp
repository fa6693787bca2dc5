// SPDX-License-Identifier: Apache-2.0
#include "Model/KelvasiModel.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"
#include "Tests/Support/ModelFixture.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;
using test::record;

class KelvasiModelTest : public testing::Test, protected test::ModelFixture {
 protected:
  void take(const Bytes& message) { link.receive(0, message); }
  void loseTheGenerator() {
    answerTechnology("kTelvonLogChannelTechnology_Unheard");
    model.restartMonitor();
    ASSERT_EQ(model.logGenerator(), nullptr);
  }
  std::string stateShown() { return *model.nodeAtPath("/Process CO/MM State")->value(); }
};

TEST_F(KelvasiModelTest, WithoutDataATickNotifiesNobodyAndKeepsTheTree) {
  model.startMonitor();
  const NodeRef before = model.topLevelNodes();
  queue.advance(10s);
  EXPECT_EQ(updates, 0);
  EXPECT_EQ(model.topLevelNodes(), before);
}

TEST_F(KelvasiModelTest, SeveralMessagesInOneIntervalGiveOneNotificationAndOneTree) {
  model.startMonitor();
  for (int count = 0; count < 5; ++count) take(record(0x7131, "13", 16));
  queue.advance(2s);
  EXPECT_EQ(updates, 1);
  const NodeRef tree = model.topLevelNodes();
  EXPECT_EQ(stateShown(), "MM_IDLE");
  EXPECT_EQ(model.topLevelNodes(), tree);
  queue.advance(2s);
  EXPECT_EQ(updates, 1);
}

TEST_F(KelvasiModelTest, TheNotificationComesAfterTheTickHasReturned) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  model.refresh();
  EXPECT_EQ(updates, 0);
  queue.runPosted();
  EXPECT_EQ(updates, 1);
}

TEST_F(KelvasiModelTest, TheTreeStaysUntilTheNextTickThoughDataArrives) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  queue.advance(2s);
  EXPECT_EQ(stateShown(), "MM_IDLE");
  take(record(0x7131, "06", 16));
  EXPECT_EQ(stateShown(), "MM_IDLE");
  queue.advance(2s);
  EXPECT_EQ(stateShown(), "MM_CONNECTION_ACTIVE");
}

TEST_F(KelvasiModelTest, TellsWhatAMessageSaidAndWhenItCame) {
  std::vector<std::string> told;
  model.gatherReadings([&](const Readings& readings, const Intake& intake) {
    for (const Reading& reading : readings.all()) told.push_back(textOf(reading).value_or("removed"));
    EXPECT_EQ(readings.arrival(), 1709647629s);
    EXPECT_EQ(intake.messages(), 1U);
  });
  model.startMonitor();
  take(record(0x7131, "13", 16));
  EXPECT_EQ(told, std::vector<std::string>{"MM_IDLE"});
  EXPECT_EQ(model.technology(), kTelvonLogChannelTechnology_Orvane_GSM);
}

TEST_F(KelvasiModelTest, ReadingsMayBeAskedForLater) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  std::size_t told = 0;
  model.gatherReadings([&](const Readings& readings, const Intake&) { told += readings.all().size(); });
  take(record(0x7131, "06", 16));
  EXPECT_EQ(told, 1U);
}

TEST_F(KelvasiModelTest, MessagesAreCountedOnAfterANewSession) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  model.restartMonitor();
  take(record(0x7131, "13", 16));
  ASSERT_TRUE(model.logGenerator());
  EXPECT_EQ(model.logGenerator()->intake().messages(), 2U);
  answerTechnology(kTelvonLogChannelTechnology_IFX);
  model.restartMonitor();
  EXPECT_EQ(model.logGenerator()->intake().messages(), 0U);
}

TEST_F(KelvasiModelTest, DataWithoutAGeneratorStillMarksTheModelUpdated) {
  model.updateWithData(record(0x7131, "13", 16));
  model.refresh();
  queue.runPosted();
  EXPECT_EQ(updates, 1);
  EXPECT_EQ(model.topLevelNodes(), nullptr);
  EXPECT_EQ(model.nodeAtPath("/"), nullptr);
}

TEST_F(KelvasiModelTest, ATreeThatIsThereIsShownThoughThereIsNoGenerator) {
  model.startMonitor();
  const NodeRef tree = model.topLevelNodes();
  loseTheGenerator();
  EXPECT_NE(model.topLevelNodes(), nullptr);
  EXPECT_EQ(model.topLevelNodes(), tree);
}

TEST_F(KelvasiModelTest, ATickWithDataDropsThePathsWithTheTree) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  EXPECT_NE(model.nodeAtPath("/Process CO/MM State"), nullptr);
  loseTheGenerator();
  model.refresh();
  EXPECT_EQ(model.nodeAtPath("/Process CO/MM State"), nullptr);
}

TEST_F(KelvasiModelTest, APathThatTheTreeDoesNotHoldGivesNothing) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  EXPECT_NE(model.nodeAtPath("/Process CO"), nullptr);
  EXPECT_EQ(model.nodeAtPath("/Process CO/"), nullptr);
  EXPECT_EQ(model.nodeAtPath("/process co"), nullptr);
  EXPECT_EQ(model.nodeAtPath(""), nullptr);
}

TEST_F(KelvasiModelTest, LookingUpAPathBuildsTheTree) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  EXPECT_EQ(model.nodeAtPath("/")->displayName(), "Kelvasi");
}

TEST_F(KelvasiModelTest, AnOldTreeLivesAsLongAsAPaneHoldsIt) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  const NodeRef held = model.nodeAtPath("/Process CO/MM State");
  take(record(0x7131, "06", 16));
  model.refresh();
  EXPECT_EQ(*held->value(), "MM_IDLE");
  EXPECT_EQ(stateShown(), "MM_CONNECTION_ACTIVE");
}

TEST_F(KelvasiModelTest, DivertedMessagesGoToTheirHandlerAndNotToTheGenerator) {
  std::vector<Bytes> diverted;
  model.divertMessages([&](auto message) { diverted.emplace_back(message.begin(), message.end()); });
  model.startMonitor();
  take(record(0x7131, "13", 16));
  EXPECT_EQ(diverted, std::vector<Bytes>{record(0x7131, "13", 16)});
  model.topLevelNodes();
  EXPECT_TRUE(model.state().get("DisplayState").data()->empty());
  queue.advance(2s);
  EXPECT_EQ(updates, 1);
}

TEST_F(KelvasiModelTest, SaveContentsWithoutAGeneratorAreAbsent) {
  EXPECT_TRUE(model.getSaveContents().isAbsent());
}

TEST_F(KelvasiModelTest, SaveContentsHoldTheHistoryAndTheDlf) {
  model.startMonitor();
  take(record(0x7131, "13", 16));
  model.topLevelNodes();
  const PlistValue contents = model.getSaveContents();
  ASSERT_EQ(contents.array()->size(), 2u);
  EXPECT_EQ(*contents.array()->at(1).dictionary()->get("Description").string(), "DLF binary (176 bytes)");
}

TEST_F(KelvasiModelTest, ANotificationThatIsOnItsWayWhenTheModelGoesIsDropped) {
  {
    KelvasiModel passing({surroundings.log, surroundings.trace, plists, resources, surroundings.clock},
                         {queue, link, link}, [this] { ++updates; });
    passing.updateWithData({});
    passing.refresh();
  }
  queue.runPosted();
  EXPECT_EQ(updates, 0);
}

}  // namespace
}  // namespace kelvasi
