// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiApp.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "App/KelvasiCell.h"
#include "Tests/Support/AppFixture.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* updated = "'Updated' yyyy-MM-dd 'at' HH:mm:ss of 2024-03-05 14:07:09 +0000";

class KelvasiAppTest : public testing::Test, protected test::AppFixture {
 protected:
  std::size_t depth() const { return ui.stack->viewControllers().size(); }
  std::size_t listRow() const { return 0; }
  const std::string& status() const { return ui.topPane().label().text; }
  bool isLoading() const { return ui.topPane().spinner().isAnimating; }
  static const KelvasiCell& firstCell(test::MemoryTableBody& pane) {
    return static_cast<const KelvasiCell&>(pane.tableView().cell(0));
  }
  // A list of one context, which is a dictionary of one row.
  static PlistValue contexts(const char* address) {
    return PlistArray::make({PlistDictionary::make({{"Address", address}})});
  }
  // Opens the list, then its first context.
  void openContext() {
    showList(contexts("10.0.0.1"));
    ui.topPane().tableView().tap(listRow());
    ui.topPane().tableView().tap(0);
    ASSERT_EQ(depth(), 3U);
  }
};

TEST_F(KelvasiAppTest, TheWindowTakesTheWholeScreenAndHoldsTheStack) {
  launch();
  EXPECT_EQ(ui.window->frameSet, (Rect{0, 0, 320, 480}));
  EXPECT_EQ(ui.window->root, ui.stack);
  EXPECT_TRUE(ui.stack->view().isIn(ui.window->subviews));
  EXPECT_TRUE(ui.window->isVisible);
  EXPECT_THAT(ui.journal,
              ElementsAre("window gets its root", "window gets a subview", "window visible", "show Kelvasi"));
}

TEST_F(KelvasiAppTest, TheRootPaneFirstSaysConnectingThenConnectingWithDots) {
  link.daemonIsThere = false;
  launch();
  EXPECT_EQ(ui.pane(0).statuses.front(), "Connecting");
  EXPECT_EQ(status(), "Connecting...");
  EXPECT_TRUE(isLoading());
  EXPECT_EQ(ui.topPane().title, "Kelvasi");
  EXPECT_EQ(application.updateMessage(), "Connecting...");
}

TEST_F(KelvasiAppTest, ConnectsOnlyAfterLaunchHasReturned) {
  application.applicationDidFinishLaunching(application);
  EXPECT_THAT(link.localPortNames, IsEmpty());
  queue.runPosted();
  EXPECT_THAT(link.localPortNames, ElementsAre("KelvasiApp.UUID"));
}

TEST_F(KelvasiAppTest, ATickWithDataWhileConnectedShowsTheTimeAndStopsTheSpinner) {
  launch();
  showList(PlistArray::make());
  EXPECT_EQ(status(), updated);
  EXPECT_FALSE(isLoading());
}

TEST_F(KelvasiAppTest, ATickWithoutDataKeepsTheStatus) {
  launch();
  tick();
  EXPECT_EQ(status(), "Connecting...");
  showList(PlistArray::make());
  surroundings.clock.time.secondsSince1970 += 10;
  tick();
  EXPECT_EQ(status(), updated);
}

TEST_F(KelvasiAppTest, TheRowsOfTheDisplayAppearWithItsFirstTick) {
  launch();
  showList(PlistArray::make());
  ASSERT_EQ(ui.topPane().tableView().rows(), 2U);
  EXPECT_EQ(firstCell(ui.topPane()).key().text(), "PDP Context Info");
}

TEST_F(KelvasiAppTest, EveryPaneOfTheStackIsReloadedButOnlyTheTopOneGetsTheStatus) {
  launch();
  openContext();
  surroundings.clock.time.secondsSince1970 += 60;
  const int rootReloads = ui.pane(0).tableView().reloads;
  const int listReloads = ui.pane(1).tableView().reloads;
  showList(contexts("10.0.0.2"));
  EXPECT_EQ(ui.pane(0).tableView().reloads, rootReloads + 1);
  EXPECT_EQ(ui.pane(1).tableView().reloads, listReloads + 1);
  EXPECT_EQ(firstCell(ui.pane(2)).value()->text(), "10.0.0.2");
  EXPECT_EQ(ui.pane(0).label().text, updated);
  EXPECT_EQ(ui.pane(1).label().text, updated);
  EXPECT_NE(ui.pane(2).label().text, updated);
  ui.stack->popViewController(true);
  EXPECT_EQ(status(), application.updateMessage());
}

TEST_F(KelvasiAppTest, APaneWhoseBranchIsGonePopsToItsParentWhichWasReloaded) {
  launch();
  openContext();
  const int rootReloads = ui.pane(0).tableView().reloads;
  const int parentReloads = ui.pane(1).tableView().reloads;
  showList(PlistArray::make());
  EXPECT_EQ(depth(), 2U);
  EXPECT_EQ(ui.pane(0).tableView().reloads, rootReloads + 1);
  EXPECT_EQ(ui.pane(1).tableView().reloads, parentReloads + 1);
  EXPECT_EQ(ui.topPane().title, "PDP Context Info");
  EXPECT_EQ(ui.topPane().tableView().rows(), 0U);
  EXPECT_EQ(ui.journal.back(), "pop PDP Context Info (animated)");
}

TEST_F(KelvasiAppTest, PanesAboveTheOneThatIsGoneGoTooAndAreNotReloaded) {
  launch();
  const PlistValue deep = PlistArray::make({PlistArray::make({PlistArray::make({"leaf"})})});
  showList(deep);
  for (const std::size_t row : {listRow(), std::size_t{0}, std::size_t{0}}) ui.topPane().tableView().tap(row);
  ASSERT_EQ(depth(), 4U);
  std::vector<std::size_t> reloaded;
  for (std::size_t place = 0; place < depth(); ++place)
    ui.pane(place).tableView().reloaded = [&reloaded, place] { reloaded.push_back(place); };
  showList(PlistArray::make());
  EXPECT_EQ(depth(), 2U);
  EXPECT_THAT(reloaded, ElementsAre(0, 1));
}

TEST_F(KelvasiAppTest, BranchesThatWereOpenAreOpenedWithTheFirstRows) {
  application.reopenBranches({"PDP Context Info", "1", "not there"});
  launch();
  EXPECT_EQ(ui.stack->viewControllers().size(), 1U);
  showList(
      PlistArray::make({PlistDictionary::make({{"Name", "a"}}), PlistDictionary::make({{"Name", "b"}})}));
  EXPECT_EQ(application.openBranches(), (std::vector<std::string>{"PDP Context Info", "1"}));
  EXPECT_EQ(ui.topPane().title, "1");
}

TEST_F(KelvasiAppTest, BranchesAreOpenedOnlyOnceAndNotOverTheUsersOwn) {
  application.reopenBranches({"Process CO"});
  launch();
  showList(PlistArray::make({}));
  application.navController()->popViewController(false);
  tick();
  showList(PlistArray::make({}));
  EXPECT_THAT(application.openBranches(), IsEmpty());
}

TEST_F(KelvasiAppTest, ABranchThatBecameALeafStaysOpenWithoutRows) {
  launch();
  openContext();
  showList(PlistArray::make({"a text"}));
  EXPECT_EQ(depth(), 3U);
  EXPECT_EQ(ui.topPane().tableView().rows(), 0U);
}

TEST_F(KelvasiAppTest, WhileDisconnectedARefreshReloadsAllPanesAndSaysConnecting) {
  launch();
  openContext();
  receiveList(contexts("10.0.0.9"));
  *link.remoteValid = false;
  link.daemonIsThere = false;
  surroundings.clock.time.secondsSince1970 += 60;
  std::vector<int> reloads;
  for (std::size_t place = 0; place < depth(); ++place)
    reloads.push_back(ui.pane(place).tableView().reloads + 1);
  tick();
  EXPECT_EQ(status(), "Connecting...");
  EXPECT_TRUE(isLoading());
  for (std::size_t place = 0; place < depth(); ++place)
    EXPECT_EQ(ui.pane(place).tableView().reloads, reloads.at(place)) << place;
  EXPECT_EQ(firstCell(ui.pane(2)).value()->text(), "10.0.0.9");
  EXPECT_EQ(application.updateMessage(), updated);
}

TEST_F(KelvasiAppTest, APaneAboutToBeShownSaysConnectingWhileDisconnected) {
  launch();
  showList(contexts("10.0.0.1"));
  *link.remoteValid = false;
  link.daemonIsThere = false;
  tick();
  ui.topPane().tableView().tap(listRow());
  EXPECT_EQ(status(), "Connecting...");
  EXPECT_TRUE(isLoading());
}

TEST_F(KelvasiAppTest, APaneAboutToBeShownBeforeTheFirstDataSaysConnectingWithoutASpinner) {
  launch();
  application.navigationControllerWillShowViewControllerAnimated(*ui.stack, ui.stack->topViewController(),
                                                                 true);
  EXPECT_EQ(status(), "Connecting...");
  EXPECT_FALSE(isLoading());
}

TEST_F(KelvasiAppTest, WithoutAGeneratorTheRootPaneKeepsItsDefaultTitle) {
  link.technologyResult.reply = plists.standFor(PlistDictionary::make({{"GetTechnology", "none known"}}));
  launch();
  application.updateViewControllerFromModel();
  EXPECT_EQ(ui.topPane().title, "Kelvasi");
  EXPECT_EQ(ui.topPane().tableView().rows(), 0U);
}

TEST_F(KelvasiAppTest, TheSaveButtonIsOfferedWhereTheMarkerExists) {
  files.existing.insert("/marker");
  launch();
  EXPECT_TRUE(ui.topPane().hasSaveButton());
}

TEST_F(KelvasiAppTest, WithoutTheMarkerTheToolbarHasNoSaveButton) {
  launch();
  EXPECT_FALSE(ui.topPane().hasSaveButton());
  EXPECT_EQ(ui.topPane().items.size(), 3U);
}

TEST_F(KelvasiAppTest, PressingSaveTwicePresentsOneSaveView) {
  files.existing.insert("/marker");
  launch();
  ui.topPane().pressSave();
  const KelvasiSaveViewController* const first = application.saveViewController();
  ui.topPane().pressSave();
  EXPECT_EQ(application.saveViewController(), first);
  EXPECT_EQ(std::ranges::count(ui.journal, "present (animated)"), 1);
}

TEST_F(KelvasiAppTest, ClosingTheSaveViewDismissesAndReleasesIt) {
  launch();
  application.closeSaveView();
  EXPECT_EQ(std::ranges::count(ui.journal, "dismiss (animated)"), 0);
  application.showSaveView();
  application.closeSaveView();
  EXPECT_EQ(application.saveViewController(), nullptr);
  EXPECT_EQ(ui.stack->modalViewController(), nullptr);
  EXPECT_EQ(ui.journal.back(), "dismiss (animated)");
}

// Only the lists are copied: the displays in them are those that go on being shown.
TEST_F(KelvasiAppTest, DataThatArrivesWhileTheSaveViewIsOpenChangesNeitherEntriesNorRawMessagesNorDLF) {
  launch();
  showList(PlistArray::make());
  application.showSaveView();
  ui.interface->use("savePressed");
  const PlistArray& before = *plists.last.dictionary()->get("Data").array();
  ASSERT_EQ(before.size(), 2U);  // one interval and its raw records
  const Bytes messages = *before.at(0).dictionary()->get("DisplayState").data();
  const Bytes dlf = *before.at(1).dictionary()->get("DLF").data();
  EXPECT_FALSE(messages.empty());
  queue.runPosted();
  application.showSaveView();
  showList(PlistArray::make({"later"}));
  ui.interface->use("savePressed");
  const PlistArray& after = *plists.last.dictionary()->get("Data").array();
  ASSERT_EQ(after.size(), 2U);
  EXPECT_EQ(*after.at(0).dictionary()->get("DisplayState").data(), messages);
  EXPECT_EQ(*after.at(1).dictionary()->get("DLF").data(), dlf);
}

TEST_F(KelvasiAppTest, WithoutAGeneratorOnlyTheTimestampIsSaved) {
  link.daemonIsThere = false;
  launch();
  application.showSaveView();
  EXPECT_EQ(ui.interface->table.rows(), 0U);
  ui.interface->use("savePressed");
  EXPECT_EQ(files.written.size(), 1U);
  EXPECT_EQ(plists.last, PlistDictionary::make({{"Timestamp", "2024-03-05 14:07:09 +0000"}}));
}

}  // namespace
}  // namespace kelvasi
