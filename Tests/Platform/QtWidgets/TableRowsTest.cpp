// SPDX-License-Identifier: Apache-2.0
// Which rows of a table have widgets, and what a reload does to them.
#include <QScrollBar>
#include <map>

#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::RowContents;
using test::RowsController;
using testing::UnorderedElementsAre;

// Counts events of a kind by widget.
class EventCount : public QObject {
 public:
  explicit EventCount(std::vector<QEvent::Type> kinds) : kinds_(std::move(kinds)) {}
  void watch(const std::vector<CellWidget*>& cells) {
    for (CellWidget* const cell : cells) cell->installEventFilter(this);
  }
  std::map<std::size_t, int> byRow;

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override {
    if (std::ranges::count(kinds_, event->type()) > 0) ++byRow[dynamic_cast<CellWidget&>(*watched).row()];
    return false;
  }

 private:
  std::vector<QEvent::Type> kinds_;
};

std::vector<std::size_t> rowsOf(const std::vector<CellWidget*>& cells) {
  std::vector<std::size_t> rows;
  for (const CellWidget* const cell : cells) rows.push_back(cell->row());
  return rows;
}

class TableRowsTest : public test::QtFixture {
 protected:
  static std::size_t fittingRows(const TableWidget& table) {
    return static_cast<std::size_t>(table.viewport()->height() + 49) / 50;
  }
};

TEST_F(TableRowsTest, OfTenThousandRowsOnlyThoseInSightHaveWidgets) {
  const RowsController& pane = showRows(10'000);
  EXPECT_EQ(tableOf(pane).rows(), 10'000U);
  EXPECT_EQ(pane.cellsMade, fittingRows(tableOf(pane)));
  EXPECT_EQ(all<CellWidget>().size(), pane.cellsMade);
}

TEST_F(TableRowsTest, ScrollingUsesTheSameWidgetsAgain) {
  const RowsController& pane = showRows(10'000);
  QScrollBar& bar = *tableOf(pane).verticalScrollBar();
  EXPECT_EQ(bar.maximum(), 10'000 * 50 - tableOf(pane).viewport()->height());
  for (int value = 0; value < bar.maximum(); value += 7'001) {
    bar.setValue(value);
    settle();
  }
  EXPECT_LE(pane.cellsMade, fittingRows(tableOf(pane)) + 1);
  bar.setValue(bar.maximum());
  const CellWidget* const last = tableOf(pane).cellsInSight().back();
  EXPECT_EQ(last->spokenName(), "Row 9999");
  EXPECT_EQ(last->geometry().bottom(), tableOf(pane).viewport()->rect().bottom());
}

TEST_F(TableRowsTest, RowsStandBelowEachOtherFiftyPointsHighAndAsWideAsTheTable) {
  const RowsController& pane = showRows(3);
  const auto cells = tableOf(pane).cellsInSight();
  ASSERT_EQ(rowsOf(cells), (std::vector<std::size_t>{0, 1, 2}));
  for (int row = 0; row < 3; ++row)
    EXPECT_EQ(cells[static_cast<std::size_t>(row)]->geometry(), QRect(0, 50 * row, 390, 50));
}

TEST_F(TableRowsTest, AReloadKeepsTheScrollPosition) {
  const RowsController& pane = showRows(200);
  tableOf(pane).verticalScrollBar()->setValue(1'234);
  pane.tableView().reloadData();
  settle();
  EXPECT_EQ(tableOf(pane).verticalScrollBar()->value(), 1'234);
  EXPECT_EQ(tableOf(pane).cellsInSight().front()->row(), 24U);
}

TEST_F(TableRowsTest, AReloadKeepsTheSelection) {
  const RowsController& pane = showRows(200);
  tableOf(pane).open(3);
  pane.tableView().reloadData();
  EXPECT_EQ(pane.tableView().indexPathForSelectedRow(), (IndexPath{0, 3}));
}

TEST_F(TableRowsTest, AReloadWithFewerRowsScrollsBackToThemAndForgetsASelectionThatIsGone) {
  RowsController& pane = showRows(200);
  tableOf(pane).open(150);
  tableOf(pane).verticalScrollBar()->setValue(9'000);
  pane.rows = 20;
  pane.tableView().reloadData();
  settle();
  EXPECT_EQ(tableOf(pane).verticalScrollBar()->value(), 20 * 50 - tableOf(pane).viewport()->height());
  EXPECT_EQ(tableOf(pane).cellsInSight().back()->row(), 19U);
  EXPECT_FALSE(pane.tableView().indexPathForSelectedRow());
}

TEST_F(TableRowsTest, AReloadWithoutRowsShowsNone) {
  RowsController& pane = showRows(20);
  pane.rows = 0;
  pane.tableView().reloadData();
  EXPECT_TRUE(tableOf(pane).cellsInSight().empty());
  for (const CellWidget* const cell : all<CellWidget>()) EXPECT_TRUE(cell->isHidden());
}

TEST_F(TableRowsTest, AReloadLeavesEveryRowItsWidgetWhereItIs) {
  const RowsController& pane = showRows(200);
  tableOf(pane).verticalScrollBar()->setValue(777);
  settle();
  const auto before = tableOf(pane).cellsInSight();
  EventCount changes({QEvent::Hide, QEvent::Show, QEvent::Move, QEvent::Resize});
  changes.watch(before);
  pane.tableView().reloadData();
  settle();
  EXPECT_EQ(tableOf(pane).cellsInSight(), before);
  EXPECT_TRUE(changes.byRow.empty());
}

TEST_F(TableRowsTest, AReloadPaintsOnlyRowsWhoseTextChanged) {
  std::string value = "old";
  const RowsController& pane = showRows(
      10, [&](std::size_t row) { return RowContents{.text = row == 4 ? value : std::to_string(row)}; });
  EventCount paints({QEvent::Paint});
  paints.watch(tableOf(pane).cellsInSight());
  value = "new";
  pane.tableView().reloadData();
  settle();
  EXPECT_THAT(paints.byRow, UnorderedElementsAre(testing::Pair(4U, testing::Ge(1))));
}

TEST_F(TableRowsTest, AReloadOfATableThatIsNotSeenWaitsUntilItIs) {
  RowsController& root = showRows(10);
  push(5, "Next");
  root.contentsOf = [](std::size_t) { return RowContents{.text = "later"}; };
  root.tableView().reloadData();
  EXPECT_EQ(tableOf(root).cellsInSight().front()->spokenName(), "Row 0");
  stack->popViewController(false);
  settle();
  EXPECT_EQ(tableOf(root).cellsInSight().front()->spokenName(), "later");
}

TEST_F(TableRowsTest, ATableThatIsNotSeenAsksForNoRowThatAReloadTookAway) {
  RowsController& root = showRows(200);
  push(5, "Next");
  root.rows = 2;
  std::size_t asked = 0;
  root.contentsOf = [&](std::size_t row) {
    asked = std::max(asked, row);
    return RowContents{};
  };
  root.tableView().reloadData();
  tableOf(root).verticalScrollBar()->setValue(5'000);
  stack->popViewController(false);
  settle();
  EXPECT_EQ(asked, 1U);
}

TEST_F(TableRowsTest, AnotherWidthLaysOutEveryRowAnew) {
  const RowsController& pane = showRows(10);
  windowWidget().resize(600, 844);
  settle();
  for (const CellWidget* const cell : tableOf(pane).cellsInSight()) EXPECT_EQ(cell->width(), 600);
}

TEST_F(TableRowsTest, AHigherWindowShowsMoreRows) {
  const RowsController& pane = showRows(100);
  const std::size_t before = tableOf(pane).cellsInSight().size();
  windowWidget().resize(390, 1044);
  settle();
  EXPECT_EQ(tableOf(pane).cellsInSight().size(), before + 4);
}

TEST_F(TableRowsTest, DeselectingTakesTheMarkOff) {
  const RowsController& pane = showRows(3);
  tableOf(pane).open(1);
  pane.tableView().deselectRowAtIndexPath({0, 2}, false);
  EXPECT_EQ(pane.tableView().indexPathForSelectedRow(), (IndexPath{0, 1}));
  pane.tableView().deselectRowAtIndexPath({0, 1}, false);
  EXPECT_FALSE(pane.tableView().indexPathForSelectedRow());
}

TEST_F(TableRowsTest, DeselectingWithoutAnimationStopsTheFadeOfTheRowBefore) {
  const RowsController& pane = showRows(3);
  const auto groundOf = [&](std::size_t row) {
    return tableOf(pane).cellAt(row)->grab().toImage().pixelColor(300, 25);
  };
  const QColor ground = groundOf(2);
  tableOf(pane).open(0);
  pane.tableView().deselectRowAtIndexPath({0, 0}, true);
  ASSERT_NE(groundOf(0), ground);
  tableOf(pane).open(1);
  ASSERT_NE(groundOf(1), ground);
  pane.tableView().deselectRowAtIndexPath({0, 1}, false);
  EXPECT_EQ(groundOf(0), ground);
  EXPECT_EQ(groundOf(1), ground);
}

TEST_F(TableRowsTest, FittedToItsRowsTheTableIsNoHigher) {
  const RowsController& pane = showRows(3);
  tableOf(pane).sizeToFit();
  EXPECT_EQ(tableOf(pane).maximumHeight(), 150);
  EXPECT_EQ(tableOf(pane).sizeHint().height(), 150);
}

}  // namespace
}  // namespace kelvasi
