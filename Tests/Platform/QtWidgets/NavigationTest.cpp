// SPDX-License-Identifier: Apache-2.0
// Panes coming and going, the bars around them, and the keys that work everywhere.
#include <QLabel>

#include "Platform/QtWidgets/BarButton.h"
#include "Platform/QtWidgets/NavigationBar.h"
#include "Platform/QtWidgets/SlideOverlay.h"
#include "Platform/QtWidgets/Spinner.h"
#include "Platform/QtWidgets/StackWidget.h"
#include "Platform/QtWidgets/Toolbar.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowsController;
using testing::ElementsAre;
using testing::IsEmpty;

class NavigationTest : public test::QtFixture {
 protected:
  NavigationBar& bar() const { return *the<NavigationBar>(); }
  Toolbar& toolbar() const { return *the<Toolbar>(); }
  // Lets an animation run to its end.
  void awaitSlide() const {
    while (the<SlideOverlay>()) QTest::qWait(1);
  }
};

TEST_F(NavigationTest, TheRootHasATitleAndNoBackButton) {
  showRows(3);
  EXPECT_EQ(bar().title(), "Root");
  EXPECT_TRUE(bar().backButton().isHidden());
}

TEST_F(NavigationTest, APushedPaneHasItsTitleAndABackButtonNamedAfterTheOneBelow) {
  showRows(3);
  push(3, "Next");
  EXPECT_EQ(bar().title(), "Next");
  EXPECT_TRUE(bar().backButton().isVisible());
  EXPECT_EQ(bar().backButton().text(), "Root");
}

TEST_F(NavigationTest, APaneOverOneWithoutATitleHasABackButtonToo) {
  showRows(3).setTitle("");
  push(3, "");
  EXPECT_TRUE(bar().backButton().isVisible());
  EXPECT_EQ(bar().backButton().accessibleName(), "Back");
  QTest::mouseClick(the<BarButton>(), Qt::LeftButton);
  EXPECT_EQ(stack->viewControllers().size(), 1U);
  EXPECT_TRUE(bar().backButton().isHidden());
}

TEST_F(NavigationTest, OnlyTheTopPaneIsSeenAndItFillsTheRoomBetweenTheBars) {
  const RowsController& root = showRows(3);
  const RowsController& next = push(3, "Next");
  EXPECT_FALSE(tableOf(root).isVisible());
  EXPECT_TRUE(tableOf(next).isVisible());
  const QRect table(tableOf(next).mapTo(&windowWidget(), QPoint()), tableOf(next).size());
  EXPECT_EQ(table, QRect(0, 44, 390, 844 - 44));
  stack->setToolbarHidden(false, false);
  settle();
  EXPECT_EQ(tableOf(next).height(), 844 - 44 - 44);
}

TEST_F(NavigationTest, ThePaneOfARowThatWasOpenedByKeyboardGoesOnByKeyboard) {
  showRows(3);
  key(Qt::Key_Down);
  const RowsController& next = push(3, "Next");
  EXPECT_TRUE(tableOf(next).cellAt(0)->hasFocusMark());
  key(Qt::Key_Return);
  EXPECT_THAT(next.opened, ElementsAre(0));
  const RowsController& empty = push(0, "Empty");
  key(Qt::Key_Return);
  EXPECT_THAT(empty.opened, IsEmpty());
}

TEST_F(NavigationTest, ThePaneOfARowThatWasTappedMarksNone) {
  const RowsController& root = showRows(3);
  key(Qt::Key_Down);
  QTest::mouseClick(tableOf(root).viewport(), Qt::LeftButton, {}, {100, 75});
  const RowsController& next = push(3, "Next");
  EXPECT_FALSE(tableOf(next).cellAt(0)->hasFocusMark());
  key(Qt::Key_Return);
  EXPECT_THAT(next.opened, IsEmpty());
}

TEST_F(NavigationTest, TheBackButtonGoesBack) {
  showRows(3);
  push(3, "Next");
  QTest::mouseClick(the<BarButton>(), Qt::LeftButton);
  EXPECT_EQ(stack->viewControllers().size(), 1U);
  EXPECT_EQ(bar().title(), "Root");
}

TEST_F(NavigationTest, EscapeBackspaceAndAltLeftGoBack) {
  showRows(3);
  for (const auto& [pressed, modifiers] :
       {std::pair(Qt::Key_Escape, Qt::NoModifier), std::pair(Qt::Key_Backspace, Qt::NoModifier),
        std::pair(Qt::Key_Left, Qt::AltModifier)}) {
    push(3, "Next");
    key(pressed, modifiers);
    EXPECT_EQ(stack->viewControllers().size(), 1U) << pressed;
  }
}

TEST_F(NavigationTest, AtTheRootBackDoesNothing) {
  showRows(3);
  key(Qt::Key_Escape);
  EXPECT_EQ(stack->viewControllers().size(), 1U);
}

TEST_F(NavigationTest, APaneThatIsPoppedIsDestroyed) {
  showRows(3);
  bool isGone = false;
  push(3, "Next").gone = [&] { isGone = true; };
  key(Qt::Key_Escape);
  EXPECT_TRUE(isGone);
  settle();
  EXPECT_EQ(all<TableWidget>().size(), 1U);
}

TEST_F(NavigationTest, TheKeyboardWorksThePaneThatIsShown) {
  RowsController& root = showRows(3);
  RowsController& next = push(3, "Next");
  key(Qt::Key_Down);
  key(Qt::Key_Return);
  EXPECT_THAT(next.opened, ElementsAre(0));
  key(Qt::Key_Escape);
  key(Qt::Key_Down);
  key(Qt::Key_Return);
  EXPECT_THAT(root.opened, ElementsAre(0));
}

TEST_F(NavigationTest, ASlideEndsWithTheNewPaneInPlaceAndNothingOverIt) {
  animate();
  showRows(3);
  const RowsController& next = push(3, "Next");
  ASSERT_NE(the<SlideOverlay>(), nullptr);
  EXPECT_EQ(the<SlideOverlay>()->geometry(), QRect(0, 0, 390, 844));
  awaitSlide();
  EXPECT_TRUE(tableOf(next).isVisible());
  EXPECT_EQ(tableOf(next).mapTo(&windowWidget(), QPoint()), QPoint(0, 44));
  stack->popViewController(true);
  ASSERT_NE(the<SlideOverlay>(), nullptr);
  awaitSlide();
  EXPECT_EQ(bar().title(), "Root");
}

TEST_F(NavigationTest, KeysDuringASlideReachTheNewPane) {
  animate();
  showRows(3);
  RowsController& next = push(3, "Next");
  ASSERT_NE(the<SlideOverlay>(), nullptr);
  key(Qt::Key_Down);
  key(Qt::Key_Return);
  EXPECT_THAT(next.opened, ElementsAre(0));
}

TEST_F(NavigationTest, WithoutAnimationNothingSlides) {
  animate();
  showRows(3);
  push(3, "Next", false);
  EXPECT_EQ(the<SlideOverlay>(), nullptr);
}

TEST_F(NavigationTest, TheTitleOfAPaneMayChangeWhileItIsShown) {
  showRows(3).setTitle("Other");
  EXPECT_EQ(bar().title(), "Other");
  push(3, "Next");
  EXPECT_EQ(bar().backButton().text(), "Other");
}

TEST_F(NavigationTest, TheToolbarShowsTheItemsOfThePaneOnTop) {
  RowsController& root = showRows(3);
  RowsController& next = push(3, "Next");
  stack->setToolbarHidden(false, false);
  next.setToolbarItems({ToolbarLabel{.text = "top", .font = Font::system(14), .size = {30, 20}}}, true);
  root.setToolbarItems({ToolbarLabel{.text = "below", .font = Font::system(14), .size = {30, 20}}}, true);
  EXPECT_EQ(toolbar().findChild<QLabel*>()->text(), "top");
  key(Qt::Key_Escape);
  settle();
  EXPECT_EQ(toolbar().findChild<QLabel*>()->text(), "below");
}

TEST_F(NavigationTest, CtrlSAndTheSaveButtonRunTheNewestAction) {
  RowsController& root = showRows(3);
  stack->setToolbarHidden(false, false);
  int older = 0;
  int newer = 0;
  root.setToolbarItems({FlexibleSpace{}, SaveButton{[&] { ++older; }}}, true);
  root.setToolbarItems({FlexibleSpace{}, SaveButton{[&] { ++newer; }}}, true);
  key(Qt::Key_S, Qt::ControlModifier);
  toolbar().saveButton()->click();
  EXPECT_EQ(older, 0);
  EXPECT_EQ(newer, 2);
}

TEST_F(NavigationTest, CtrlSThatIsHeldSavesOnce) {
  int saves = 0;
  showRows(3).setToolbarItems({FlexibleSpace{}, SaveButton{[&] { ++saves; }}}, true);
  stack->setToolbarHidden(false, false);
  key(Qt::Key_S, Qt::ControlModifier);
  repeatKey(Qt::Key_S, Qt::ControlModifier);
  EXPECT_EQ(saves, 1);
}

TEST_F(NavigationTest, WithoutASaveButtonCtrlSDoesNothing) {
  showRows(3).setToolbarItems({FlexibleSpace{}}, true);
  key(Qt::Key_S, Qt::ControlModifier);
  EXPECT_EQ(toolbar().saveButton(), nullptr);
}

TEST_F(NavigationTest, ToolbarItemsStandInTheirOrderAndTheSpaceTakesTheRest) {
  showRows(3).setToolbarItems(
      {ActivitySpinner{.isAnimating = true},
       ToolbarLabel{.text = "Connecting...", .font = Font::system(14), .size = {90, 17}}, FlexibleSpace{},
       SaveButton{[] {}}},
      true);
  stack->setToolbarHidden(false, false);
  settle();
  const QLabel& label = *toolbar().findChild<QLabel*>();
  EXPECT_LT(the<Spinner>()->geometry().right(), label.geometry().left());
  EXPECT_LT(label.geometry().right(), 200);
  EXPECT_GT(toolbar().saveButton()->geometry().right(), 380);
  EXPECT_EQ(label.font().pixelSize(), 14);
}

TEST_F(NavigationTest, ASpinnerThatStopsHidesAndTheSameWidgetsGoOn) {
  RowsController& root = showRows(3);
  stack->setToolbarHidden(false, false);
  const auto items = [](bool isAnimating) {
    return ToolbarItems{ActivitySpinner{.isAnimating = isAnimating, .hidesWhenStopped = true},
                        FlexibleSpace{}};
  };
  root.setToolbarItems(items(true), true);
  const Spinner* const spinner = the<Spinner>();
  EXPECT_TRUE(spinner->isVisible());
  EXPECT_TRUE(spinner->isAnimating());
  root.setToolbarItems(items(false), true);
  EXPECT_EQ(the<Spinner>(), spinner);
  EXPECT_FALSE(spinner->isVisible());
  EXPECT_FALSE(spinner->isAnimating());
}

TEST_F(NavigationTest, ALongTitleDoesNotRunIntoTheBackButton) {
  showRows(3);
  push(3, "A pane whose title is so long that it cannot stand in the middle of the bar");
  EXPECT_LE(bar().backButton().geometry().right(), 390 / 3);
}

}  // namespace
}  // namespace kelvasi
