// SPDX-License-Identifier: Apache-2.0
// Keyboard, mouse and wheel on a table.
#include <QScrollBar>
#include <QScroller>
#include <QWheelEvent>

#include <QAbstractButton>
#include <QContextMenuEvent>

#include "Platform/QtWidgets/Toolbar.h"
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowContents;
using test::RowsController;
using testing::ElementsAre;
using testing::IsEmpty;

class TableInputTest : public test::QtFixture {
 protected:
  static std::optional<std::size_t> markedRow(const RowsController& pane) {
    for (const CellWidget* const cell : tableOf(pane).cellsInSight()) {
      if (cell->hasFocusMark()) return cell->row();
    }
    return std::nullopt;
  }
  static QPoint middleOf(int row) { return {100, 50 * row + 25}; }
  static void turnWheel(const RowsController& pane, QPoint at, QPoint angle,
                        Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
    QWidget& viewport = *tableOf(pane).viewport();
    QWheelEvent event(at, viewport.mapToGlobal(at), {}, angle, Qt::NoButton, modifiers, Qt::NoScrollPhase,
                      false);
    QApplication::sendEvent(&viewport, &event);
  }
  static double offsetOf(const RowsController& pane, std::size_t row) {
    return tableOf(pane).cellAt(row)->scrollView()->offset();
  }
};

RowContents wide(std::size_t) {
  return {.text = "wide", .wideContent = 1000};
}

TEST_F(TableInputTest, NoRowIsMarkedBeforeTheKeyboardIsUsed) {
  EXPECT_EQ(markedRow(showRows(5)), std::nullopt);
}

TEST_F(TableInputTest, TheFirstArrowMarksTheFirstRowAndTheNextOnesMove) {
  const RowsController& pane = showRows(5);
  key(Qt::Key_Down);
  EXPECT_EQ(markedRow(pane), 0U);
  key(Qt::Key_Down);
  key(Qt::Key_Down);
  EXPECT_EQ(markedRow(pane), 2U);
  key(Qt::Key_Up);
  EXPECT_EQ(markedRow(pane), 1U);
}

TEST_F(TableInputTest, TheKeyboardStopsAtTheEnds) {
  const RowsController& pane = showRows(3);
  key(Qt::Key_End);
  key(Qt::Key_Down);
  EXPECT_EQ(markedRow(pane), 2U);
  key(Qt::Key_Home);
  key(Qt::Key_Up);
  EXPECT_EQ(markedRow(pane), 0U);
}

TEST_F(TableInputTest, TheKeyboardBringsItsRowIntoSight) {
  const RowsController& pane = showRows(1000);
  key(Qt::Key_End);
  EXPECT_EQ(markedRow(pane), 999U);
  EXPECT_EQ(tableOf(pane).verticalScrollBar()->value(), tableOf(pane).verticalScrollBar()->maximum());
  key(Qt::Key_Home);
  EXPECT_EQ(tableOf(pane).verticalScrollBar()->value(), 0);
}

TEST_F(TableInputTest, PageKeysMoveByAScreenfulLessARow) {
  const RowsController& pane = showRows(1000);
  const std::size_t page = static_cast<std::size_t>(tableOf(pane).viewport()->height() / 50 - 1);
  key(Qt::Key_Home);
  key(Qt::Key_PageDown);
  EXPECT_EQ(markedRow(pane), page);
  key(Qt::Key_PageUp);
  EXPECT_EQ(markedRow(pane), 0U);
}

TEST_F(TableInputTest, EnterOpensTheMarkedRow) {
  const RowsController& pane = showRows(5);
  key(Qt::Key_Down);
  key(Qt::Key_Return);
  key(Qt::Key_Down);
  key(Qt::Key_Enter);
  EXPECT_THAT(pane.opened, ElementsAre(0, 1));
}

// Whoever knows more of a row takes it from the window.
class AskedPlaces : public QObject {
 public:
  std::vector<QPoint> places;

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override {
    if (event->type() != QEvent::ContextMenu) return QObject::eventFilter(watched, event);
    places.push_back(dynamic_cast<QContextMenuEvent&>(*event).globalPos());
    return true;
  }
};

TEST_F(TableInputTest, SpaceAndAHoldAskForMoreOfTheRowAndOpenNothing) {
  const RowsController& pane = showRows(5);
  AskedPlaces asked;
  windowWidget().installEventFilter(&asked);
  key(Qt::Key_Down);
  key(Qt::Key_Down);
  key(Qt::Key_Space);
  const QPoint row(100, 60);
  QTest::mousePress(tableOf(pane).viewport(), Qt::LeftButton, Qt::NoModifier, row);
  ASSERT_TRUE(QTest::qWaitFor([&] { return asked.places.size() == 2; }, 60'000));
  QTest::mouseRelease(tableOf(pane).viewport(), Qt::LeftButton, Qt::NoModifier, row);
  for (const QPoint& place : asked.places)
    EXPECT_EQ(tableOf(pane).rowUnder(tableOf(pane).viewport()->mapFromGlobal(place)), 1U);
  EXPECT_THAT(pane.opened, ElementsAre());
}

TEST_F(TableInputTest, TheFirstTabGoesToTheRowsAndTheNextOnLeavesThem) {
  RowsController& pane = showRows(3);
  stack->setToolbarHidden(false, false);
  pane.setToolbarItems({SaveButton{[] {}}}, true);
  settle();
  key(Qt::Key_Tab);
  EXPECT_EQ(QApplication::focusWidget(), &tableOf(pane));
  ASSERT_NE(tableOf(pane).cellAtKeyboard(), nullptr);
  EXPECT_TRUE(tableOf(pane).cellAt(0)->hasFocusMark());
  key(Qt::Key_Tab);
  EXPECT_EQ(QApplication::focusWidget(), the<Toolbar>()->saveButton());
}

TEST_F(TableInputTest, EnterWithoutAMarkedRowOpensNone) {
  const RowsController& pane = showRows(5);
  key(Qt::Key_Return);
  EXPECT_THAT(pane.opened, IsEmpty());
}

TEST_F(TableInputTest, KeysOfAnEmptyTableDoNothing) {
  const RowsController& pane = showRows(0);
  for (const Qt::Key pressed : {Qt::Key_Down, Qt::Key_End, Qt::Key_Return, Qt::Key_Right}) key(pressed);
  EXPECT_EQ(markedRow(pane), std::nullopt);
}

TEST_F(TableInputTest, RightAndLeftMoveAValueThatIsTooWide) {
  const RowsController& pane = showRows(3, wide);
  const double furthest = tableOf(pane).cellAt(0)->scrollView()->furthestOffset();
  EXPECT_EQ(furthest, 1000 - (390 - 10));
  key(Qt::Key_Down);
  key(Qt::Key_Right);
  EXPECT_GT(offsetOf(pane, 0), 0);
  EXPECT_EQ(offsetOf(pane, 1), 0);
  for (int press = 0; press < 100; ++press) key(Qt::Key_Right);
  EXPECT_EQ(offsetOf(pane, 0), furthest);
  for (int press = 0; press < 100; ++press) key(Qt::Key_Left);
  EXPECT_EQ(offsetOf(pane, 0), 0);
}

TEST_F(TableInputTest, AReloadKeepsHowFarAValueWasMoved) {
  const RowsController& pane = showRows(3, wide);
  key(Qt::Key_Down);
  key(Qt::Key_Right);
  const double before = offsetOf(pane, 0);
  pane.tableView().reloadData();
  EXPECT_EQ(offsetOf(pane, 0), before);
}

TEST_F(TableInputTest, AWidgetThatComesToAnotherRowIsNotMovedAnyMore) {
  const RowsController& pane = showRows(1000, wide);
  key(Qt::Key_Down);
  key(Qt::Key_Right);
  tableOf(pane).verticalScrollBar()->setValue(20'000);
  for (const CellWidget* const cell : tableOf(pane).cellsInSight())
    EXPECT_EQ(cell->scrollView()->offset(), 0);
}

TEST_F(TableInputTest, ATapOpensARow) {
  const RowsController& pane = showRows(5);
  QTest::mouseClick(tableOf(pane).viewport(), Qt::LeftButton, {}, middleOf(2));
  EXPECT_THAT(pane.opened, ElementsAre(2));
  EXPECT_EQ(pane.tableView().indexPathForSelectedRow(), (IndexPath{0, 2}));
}

TEST_F(TableInputTest, ASecondTapSoonAfterTheFirstOpensARowToo) {
  const RowsController& pane = showRows(5);
  QWidget* const viewport = tableOf(pane).viewport();
  QTest::mouseClick(viewport, Qt::LeftButton, {}, middleOf(2));
  QTest::mouseDClick(viewport, Qt::LeftButton, {}, middleOf(2));
  QTest::mouseRelease(viewport, Qt::LeftButton, {}, middleOf(2));
  EXPECT_THAT(pane.opened, ElementsAre(2, 2));
}

TEST_F(TableInputTest, ATapBelowTheLastRowOpensNone) {
  const RowsController& pane = showRows(2);
  QTest::mouseClick(tableOf(pane).viewport(), Qt::LeftButton, {}, middleOf(4));
  EXPECT_THAT(pane.opened, IsEmpty());
}

TEST_F(TableInputTest, APressThatIsLetGoElsewhereOpensNone) {
  const RowsController& pane = showRows(5);
  QWidget* const viewport = tableOf(pane).viewport();
  QTest::mousePress(viewport, Qt::LeftButton, {}, middleOf(2));
  QTest::mouseMove(viewport, middleOf(3));
  QTest::mouseRelease(viewport, Qt::LeftButton, {}, middleOf(3));
  EXPECT_THAT(pane.opened, IsEmpty());
}

TEST_F(TableInputTest, OtherButtonsOpenNone) {
  const RowsController& pane = showRows(5);
  QTest::mouseClick(tableOf(pane).viewport(), Qt::RightButton, {}, middleOf(2));
  EXPECT_THAT(pane.opened, IsEmpty());
}

TEST_F(TableInputTest, AFingerScrollsTheTableAndItsSpeedScrollsItOn) {
  const RowsController& pane = showRows(1000);
  QWidget* const viewport = tableOf(pane).viewport();
  const QScrollBar& bar = *tableOf(pane).verticalScrollBar();
  ASSERT_TRUE(QScroller::hasScroller(viewport));
  EXPECT_NE(QScroller::grabbedGesture(viewport), Qt::GestureType());
  QScroller& scroller = *QScroller::scroller(viewport);
  scroller.handleInput(QScroller::InputPress, {100, 600}, 0);
  for (int step = 1; step <= 5; ++step)
    scroller.handleInput(QScroller::InputMove, {100, 600.0 - 60 * step}, 20 * step);
  ASSERT_TRUE(QTest::qWaitFor([&] { return bar.value() > 0; }, 60'000));
  const int dragged = bar.value();
  scroller.handleInput(QScroller::InputRelease, {100, 300}, 110);
  EXPECT_TRUE(QTest::qWaitFor([&] { return bar.value() > dragged; }, 60'000));
  scroller.stop();
}

TEST_F(TableInputTest, TheWheelScrollsTheTable) {
  const RowsController& pane = showRows(1000);
  turnWheel(pane, middleOf(1), {0, -120});
  EXPECT_GT(tableOf(pane).verticalScrollBar()->value(), 0);
}

TEST_F(TableInputTest, SidewaysOrWithShiftTheWheelMovesTheRowUnderIt) {
  const RowsController& pane = showRows(1000, wide);
  turnWheel(pane, middleOf(1), {-120, 0});
  turnWheel(pane, middleOf(2), {0, -120}, Qt::ShiftModifier);
  EXPECT_EQ(offsetOf(pane, 0), 0);
  EXPECT_EQ(offsetOf(pane, 1), 60);
  EXPECT_EQ(offsetOf(pane, 2), 60);
  EXPECT_EQ(tableOf(pane).verticalScrollBar()->value(), 0);
}

}  // namespace
}  // namespace kelvasi
