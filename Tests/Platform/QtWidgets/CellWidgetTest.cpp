// SPDX-License-Identifier: Apache-2.0
// What a row draws, and where.
#include "Tests/Platform/QtWidgets/QtFixture.h"

namespace kelvasi {
namespace {

using test::differenceOf;
using test::RowContents;
using test::RowsController;

class CellWidgetTest : public test::QtFixture {
 protected:
  QImage pictureOf(const RowContents& contents) {
    RowsController& pane = showRows(1, [contents](std::size_t) { return contents; });
    return tableOf(pane).cellAt(0)->grab().toImage();
  }
  QRect drawnBy(CellAccessory accessory) {
    const QImage bare = pictureOf({});
    return differenceOf(bare, pictureOf({.text = {}, .accessory = accessory}));
  }

  QWidget windowlessParent;
};

TEST_F(CellWidgetTest, AChevronStandsAtTheRightInTheMiddle) {
  const QRect chevron = drawnBy(CellAccessory::disclosureIndicator);
  EXPECT_GE(chevron.left(), 390 - 34);
  EXPECT_LE(chevron.right(), 390 - 8);
  EXPECT_NEAR(chevron.center().y(), 25, 1);
  EXPECT_GT(chevron.height(), chevron.width());
}

TEST_F(CellWidgetTest, ACheckmarkStandsAtTheRightInTheMiddle) {
  const QRect mark = drawnBy(CellAccessory::checkmark);
  EXPECT_GE(mark.left(), 390 - 34);
  EXPECT_LE(mark.right(), 390 - 4);
  EXPECT_NEAR(mark.center().y(), 25, 2);
  EXPECT_GT(mark.width(), mark.height());
}

TEST_F(CellWidgetTest, TheContentAreaEndsWhereTheAccessoryBegins) {
  for (const auto& [accessory, width] :
       {std::pair(CellAccessory::none, 380.0), std::pair(CellAccessory::disclosureIndicator, 356.0),
        std::pair(CellAccessory::checkmark, 356.0)}) {
    const RowsController& pane = showRows(
        1, [accessory = accessory](std::size_t) { return RowContents{.text = {}, .accessory = accessory}; });
    EXPECT_EQ(tableOf(pane).cellAt(0)->contentView().bounds(), (Rect{0, 0, width, 50}));
  }
}

TEST_F(CellWidgetTest, ATextIsDrawnWhereItsLabelStands) {
  const QRect text = differenceOf(pictureOf({}), pictureOf({.text = "HHHH"}));
  EXPECT_NEAR(text.left(), 11, 2);
  EXPECT_NEAR(text.center().y(), 25, 3);
}

TEST_F(CellWidgetTest, ALabelWithoutAFrameOfItsOwnIsNotCut) {
  const QImage picture = pictureOf({.text = "A value that is wider than its label"});
  const QRect text = differenceOf(pictureOf({}), picture);
  EXPECT_GT(text.right(), 210);
}

TEST_F(CellWidgetTest, AScrolledViewDrawsItsContentFurtherLeft) {
  const RowsController& pane = showRows(2, [](std::size_t row) {
    return RowContents{.text = row == 0 ? "" : "HHHHHHHHHHHH", .wideContent = 1000};
  });
  const auto textOf = [&](double offset) {
    for (const std::size_t row : {0U, 1U}) tableOf(pane).cellAt(row)->scrollView()->scrollTo(offset);
    const auto pictureOfRow = [&](std::size_t row) { return tableOf(pane).cellAt(row)->grab().toImage(); };
    return differenceOf(pictureOfRow(0), pictureOfRow(1));
  };
  const QRect before = textOf(0);
  const QRect after = textOf(60);
  EXPECT_EQ(after.right(), before.right() - 60);
}

TEST_F(CellWidgetTest, NothingIsDrawnOutsideAScrollableView) {
  const RowContents text{.text = std::string(200, 'H')};
  EXPECT_LT(differenceOf(pictureOf({}), pictureOf(text)).right(), 380);
}

TEST_F(CellWidgetTest, WhatIsHiddenBeyondAnEdgeHasASignThere) {
  const RowsController& pane =
      showRows(1, [](std::size_t) { return RowContents{.text = std::string(40, 'H'), .wideContent = 800}; });
  CellWidget& cell = *tableOf(pane).cellAt(0);
  const QColor ground = paletteOf(ColourScheme::light).color(QPalette::Base);
  const auto isMarked = [&](int middle) {
    const QImage picture = cell.grab().toImage();
    const auto isDark = [&](int x) { return picture.pixelColor(x, 25).lightness() < 100; };
    return isDark(middle) && isDark(middle - 5) && isDark(middle + 5) &&
           picture.pixelColor(middle, 12) == ground && picture.pixelColor(middle + 5, 31) == ground;
  };
  // The label is 200 points wide and ends at 210, in sight.
  EXPECT_FALSE(isMarked(380 - 8));
  EXPECT_FALSE(isMarked(8));
  cell.scrollView()->scrollTo(60);
  EXPECT_TRUE(isMarked(8));
}

TEST_F(CellWidgetTest, ASelectedRowIsMarked) {
  const RowsController& pane = showRows(1);
  const QColor before = tableOf(pane).cellAt(0)->grab().toImage().pixelColor(300, 5);
  tableOf(pane).open(0);
  const QColor after = tableOf(pane).cellAt(0)->grab().toImage().pixelColor(300, 5);
  EXPECT_EQ(before, paletteOf(ColourScheme::light).color(QPalette::Base));
  EXPECT_EQ(after, paletteOf(ColourScheme::light).color(QPalette::AlternateBase));
}

TEST_F(CellWidgetTest, TextsOfARowComeInTheOrderInWhichTheyWereAdded) {
  CellWidget cell(windowlessParent, CellStyle::oneLabel);
  cell.textLabel().setText("Snapshot");
  QtLabel second;
  second.setText("second");
  cell.contentView().addSubview(second);
  EXPECT_EQ(cell.spokenName(), "Snapshot");
  EXPECT_EQ(cell.spokenValue(), "second");
}

TEST_F(CellWidgetTest, AViewThatGoesLeavesItsContainer) {
  CellWidget cell(windowlessParent, CellStyle::oneLabel);
  {
    QtLabel gone;
    gone.setText("gone");
    cell.contentView().addSubview(gone);
  }
  EXPECT_EQ(cell.texts(), QStringList());
}

TEST_F(CellWidgetTest, AScrollableViewOffersItsVisiblePartAsBounds) {
  QtScrollView view;
  view.setFrame({0, 0, 320, 50});
  view.setContentSize({650, 50});
  view.scrollTo(1000);
  EXPECT_EQ(view.bounds(), (Rect{330, 0, 320, 50}));
  view.setContentSize({320, 50});
  EXPECT_EQ(view.bounds(), (Rect{0, 0, 320, 50}));
}

}  // namespace
}  // namespace kelvasi
