// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiPaneController.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "App/KelvasiCell.h"
#include "Tests/Support/PaneParts.h"
#include "Tests/Support/UserInterface/MemoryUserInterface.h"

namespace kelvasi {
namespace {

using test::branch;
using test::FakeShell;
using test::leaf;
using test::MemoryTableBody;
using testing::ElementsAre;

class KelvasiPaneControllerTest : public testing::Test {
 protected:
  // The root pane, in a stack.
  KelvasiPaneController& show(NodeRef node, RowRange rows = {0, 20}) {
    auto pane = std::make_unique<KelvasiPaneController>(ui, shell, std::move(node), "/");
    KelvasiPaneController& shown = *pane;
    stack = ui.makeNavigationStack(std::move(pane));
    stack->willAppear();
    table().show(rows);
    return shown;
  }
  MemoryTableBody& body() const { return ui.pane(0); }
  test::MemoryTable& table() const { return body().tableView(); }
  const KelvasiCell& cell(std::size_t row) const {
    return static_cast<const KelvasiCell&>(table().cell(row));
  }

  FakeShell shell;
  test::MemoryUserInterface ui;
  std::unique_ptr<NavigationStack> stack;
};

TEST_F(KelvasiPaneControllerTest, StartsLoadingWithAnEmptyStatus) {
  show(nullptr);
  EXPECT_EQ(body().label().text, "");
  EXPECT_TRUE(body().spinner().isAnimating);
}

TEST_F(KelvasiPaneControllerTest, WithoutANodeTheTitleIsKelvasiAndThereAreNoRows) {
  show(nullptr);
  EXPECT_EQ(body().title, "Kelvasi");
  EXPECT_EQ(table().rows(), 0U);
  EXPECT_EQ(table().sections(), 1U);
}

TEST_F(KelvasiPaneControllerTest, ALeafAsNodeShowsNoRows) {
  show(leaf("Lonely", "text"));
  EXPECT_EQ(body().title, "Lonely");
  EXPECT_EQ(table().rows(), 0U);
}

TEST_F(KelvasiPaneControllerTest, AppearingShowsTheToolbar) {
  show(nullptr);
  EXPECT_FALSE(ui.stack->isToolbarHidden);
}

TEST_F(KelvasiPaneControllerTest, DisappearingGivesUpTheKeyboard) {
  show(branch("Root", {branch("A")}));
  table().tap(0);
  EXPECT_EQ(body().resignations, 1);
}

TEST_F(KelvasiPaneControllerTest, ALeafRowShowsNameAndValueWithoutAccessory) {
  show(branch("Root", {leaf("Channel", "62")}));
  EXPECT_EQ(cell(0).key().text(), "Channel");
  EXPECT_EQ(cell(0).value()->text(), "62");
  EXPECT_EQ(table().body(0).accessory, CellAccessory::none);
  EXPECT_EQ(table().body(0).layouts, 1);
}

TEST_F(KelvasiPaneControllerTest, ABranchRowShowsItsNameAndADisclosureEvenWithoutChildren) {
  show(branch("Root", {branch("Empty")}));
  EXPECT_EQ(cell(0).key().text(), "Empty");
  EXPECT_EQ(cell(0).value(), nullptr);
  EXPECT_EQ(table().body(0).accessory, CellAccessory::disclosureIndicator);
  EXPECT_EQ(table().body(0).layouts, 1);
}

TEST_F(KelvasiPaneControllerTest, AllCellsShareOneIdentifier) {
  show(branch("Root", {branch("A"), leaf("B", "b")}));
  EXPECT_EQ(cell(0).reuseIdentifier(), "KelvasiPaneControllerCell");
  EXPECT_EQ(cell(1).reuseIdentifier(), "KelvasiPaneControllerCell");
}

TEST_F(KelvasiPaneControllerTest, AKeyCellUsedAgainForALeafShowsNoValue) {
  show(branch("Root", {branch("A"), leaf("B", "b")}), {0, 1});
  table().show({1, 2});
  EXPECT_EQ(table().cellsMade, 1);
  EXPECT_EQ(cell(1).key().text(), "B");
  EXPECT_EQ(cell(1).value(), nullptr);
  EXPECT_EQ(table().body(1).accessory, CellAccessory::none);
}

TEST_F(KelvasiPaneControllerTest, AValueCellUsedAgainForABranchHasAnEmptyValue) {
  KelvasiPaneController& pane = show(branch("Root", {leaf("A", "a")}));
  pane.reloadWithNode(branch("Root", {branch("A")}));
  EXPECT_EQ(table().cellsMade, 1);
  ASSERT_NE(cell(0).value(), nullptr);
  EXPECT_EQ(cell(0).value()->text(), "");
  EXPECT_EQ(table().body(0).accessory, CellAccessory::disclosureIndicator);
}

// Its key is placed anew and nothing else: a long value leaves a row that scrolls.
TEST_F(KelvasiPaneControllerTest, AValueCellUsedAgainForABranchKeepsWhereItsValueAndHowWideItsContentWas) {
  ui.sizes[{"A", true}] = {80, 18};
  ui.sizes[{"long", true}] = {250, 18};
  ui.sizes[{"Another", true}] = {120, 20};
  KelvasiPaneController& pane = show(branch("Root", {leaf("A", "long")}));
  pane.reloadWithNode(branch("Root", {branch("Another")}));
  const auto& view =
      dynamic_cast<const test::MemoryScrollView&>(*table().body(0).contentView().subviews.parts().at(0));
  EXPECT_EQ(static_cast<const test::MemoryLabel&>(cell(0).key()).frameSet, (Rect{10, 12, 120, 20}));
  EXPECT_EQ(static_cast<const test::MemoryLabel&>(*cell(0).value()).frameSet, (Rect{140, 13, 250, 18}));
  EXPECT_EQ(view.contentSize, (Size{650, 50}));
  EXPECT_EQ(view.frameSet, (Rect{0, 0, 320, 50}));
}

// The content area ends where the accessory begins.
TEST_F(KelvasiPaneControllerTest, ARowIsLaidOutWithItsNewAccessory) {
  KelvasiPaneController& pane = show(branch("Root", {leaf("A", "a"), branch("B")}));
  pane.reloadWithNode(branch("Root", {branch("A"), leaf("B", "b")}));
  EXPECT_EQ(table().body(0).laidOutWith, CellAccessory::disclosureIndicator);
  EXPECT_EQ(table().body(1).laidOutWith, CellAccessory::none);
}

TEST_F(KelvasiPaneControllerTest, AReloadTakesTitleAndRowsFromTheNewNode) {
  KelvasiPaneController& pane = show(branch("Old", {leaf("A", "1")}));
  pane.reloadWithNode(branch("New", {leaf("A", "2"), leaf("B", "3")}));
  EXPECT_EQ(body().title, "New");
  EXPECT_EQ(table().rows(), 2U);
  EXPECT_EQ(cell(0).value()->text(), "2");
  pane.reloadWithNode(nullptr);
  EXPECT_EQ(body().title, "Kelvasi");
  EXPECT_EQ(table().rows(), 0U);
}

TEST_F(KelvasiPaneControllerTest, AReloadKeepsEveryRowsCell) {
  KelvasiPaneController& pane = show(branch("Root", {leaf("A", "1"), branch("B"), leaf("C", "3")}));
  const std::vector before{&table().cell(0), &table().cell(1), &table().cell(2)};
  pane.reloadWithNode(branch("Root", {leaf("A", "2"), branch("B"), leaf("C", "4")}));
  EXPECT_EQ((std::vector{&table().cell(0), &table().cell(1), &table().cell(2)}), before);
}

TEST_F(KelvasiPaneControllerTest, AReloadMakesTheToolbarAnew) {
  KelvasiPaneController& pane = show(nullptr);
  const std::size_t before = body().statuses.size();
  pane.reloadWithNode(branch("Root"));
  EXPECT_EQ(body().statuses.size(), before + 1);
}

TEST_F(KelvasiPaneControllerTest, TheToolbarIsSpinnerStatusAndFlexibleSpace) {
  show(nullptr).setStatus("Connecting...", true);
  ASSERT_EQ(body().items.size(), 3U);
  EXPECT_TRUE(body().spinner().isAnimating);
  EXPECT_TRUE(body().spinner().hidesWhenStopped);
  EXPECT_EQ(body().label().text, "Connecting...");
  EXPECT_EQ(body().label().font, Font::system(14.0));
  EXPECT_EQ(body().label().size, (Size{13 * 8, 18}));
  EXPECT_TRUE(std::holds_alternative<FlexibleSpace>(body().items[2]));
  EXPECT_TRUE(body().itemsAnimated);
}

TEST_F(KelvasiPaneControllerTest, WithThePermissionTheSaveButtonComesLast) {
  shell.allows = true;
  show(nullptr);
  ASSERT_EQ(body().items.size(), 4U);
  ASSERT_TRUE(body().hasSaveButton());
  body().pressSave();
  EXPECT_EQ(shell.shown, 1);
}

TEST_F(KelvasiPaneControllerTest, EveryNewToolbarAsksForThePermissionAgain) {
  KelvasiPaneController& pane = show(nullptr);
  shell.allows = true;
  pane.reloadWithNode(nullptr);
  EXPECT_EQ(body().items.size(), 4U);
  shell.allows = false;
  pane.setStatus("text", false);
  EXPECT_EQ(body().items.size(), 3U);
}

TEST_F(KelvasiPaneControllerTest, NoStatusIsShownAsAnEmptyOne) {
  KelvasiPaneController& pane = show(nullptr);
  pane.setStatus("text", true);
  pane.setStatus(std::nullopt, false);
  EXPECT_EQ(body().label().text, "");
  EXPECT_FALSE(body().spinner().isAnimating);
}

TEST_F(KelvasiPaneControllerTest, ATappedLeafIsOnlyDeselectedWithoutAnimation) {
  show(branch("Root", {leaf("A", "1")}));
  table().tap(0);
  EXPECT_THAT(table().deselections, ElementsAre(test::MemoryTable::Deselection{{0, 0}, false}));
  EXPECT_EQ(stack->viewControllers().size(), 1U);
}

TEST_F(KelvasiPaneControllerTest, ASelectionOfNoRowDoesNothing) {
  show(branch("Root", {branch("A")}));
  table().selectNothing();
  EXPECT_EQ(stack->viewControllers().size(), 1U);
  EXPECT_TRUE(table().deselections.empty());
}

TEST_F(KelvasiPaneControllerTest, ATappedBranchOpensAPaneThatTakesOverTheStatus) {
  KelvasiPaneController& root =
      show(branch("Root", {leaf("A", "1"), branch("Serving Cell", {leaf("B", "2")})}));
  root.setStatus("Updated now", false);
  table().tap(1);
  ASSERT_EQ(stack->viewControllers().size(), 2U);
  auto& pane = static_cast<KelvasiPaneController&>(stack->topViewController());
  EXPECT_EQ(pane.path(), "/Serving Cell");
  EXPECT_EQ(ui.topPane().title, "Serving Cell");
  EXPECT_EQ(ui.topPane().tableView().rows(), 1U);
  EXPECT_EQ(ui.topPane().label().text, "Updated now");
  EXPECT_FALSE(ui.topPane().spinner().isAnimating);
  EXPECT_EQ(ui.journal.back(), "push Serving Cell (animated)");
}

TEST_F(KelvasiPaneControllerTest, AnEmptyBranchOpensToAnEmptyPane) {
  show(branch("Root", {branch("Empty")}));
  table().tap(0);
  ASSERT_EQ(stack->viewControllers().size(), 2U);
  EXPECT_EQ(ui.topPane().tableView().rows(), 0U);
}

TEST_F(KelvasiPaneControllerTest, PathsJoinAsTheTreesDo) {
  show(branch("Root", {branch("A", {branch("B/C")})}));
  table().tap(0);
  ui.topPane().tableView().tap(0);
  EXPECT_EQ(static_cast<KelvasiPaneController&>(stack->topViewController()).path(), "/A/B/C");
}

TEST_F(KelvasiPaneControllerTest, TheOpenedRowIsDeselectedWhenItsPaneComesBack) {
  show(branch("Root", {branch("A")}));
  table().tap(0);
  EXPECT_TRUE(table().selected);
  stack->popViewController(true);
  EXPECT_THAT(table().deselections, ElementsAre(test::MemoryTable::Deselection{{0, 0}, true}));
}

}  // namespace
}  // namespace kelvasi
