// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiCell.h"

#include <gtest/gtest.h>

#include "Tests/Support/UserInterface/MemoryUserInterface.h"

namespace kelvasi {
namespace {

using test::MemoryCellBody;
using test::MemoryLabel;
using test::MemoryScrollView;

// A cell whose key and value are as large as the test says, in a content area that it says.
class KelvasiCellTest : public testing::Test {
 protected:
  void makeKeyCell() {
    cell = std::make_unique<KelvasiCell>(ui, table, KelvasiCell::StyleKey{CellStyle::twoLabelValue}, "id");
  }
  void makeValueCell() { cell = std::make_unique<KelvasiCell>(ui, table, CellStyle::twoLabelValue, "id"); }
  void layOut(Size key, Size value) {
    makeValueCell();
    cell->setKey("key");
    cell->setValue("value");
    ui.sizes[{"key", true}] = key;
    ui.sizes[{"value", true}] = value;
    ui.sizes[{"value", false}] = {1, 1};
    cell->setLayout();
  }

  MemoryCellBody& body() const { return static_cast<MemoryCellBody&>(cell->body()); }
  const MemoryLabel& key() const { return static_cast<const MemoryLabel&>(cell->key()); }
  const MemoryLabel& value() const { return static_cast<const MemoryLabel&>(*cell->value()); }
  const MemoryScrollView& view() const {
    return dynamic_cast<const MemoryScrollView&>(*body().contentView().subviews.parts().at(0));
  }

  test::MemoryUserInterface ui;
  test::MemoryTable table;
  std::unique_ptr<KelvasiCell> cell;
};

TEST_F(KelvasiCellTest, AKeyCellHasOneLabelRightInItsContentArea) {
  makeKeyCell();
  EXPECT_EQ(body().contentView().subviews.parts().size(), 1U);
  EXPECT_TRUE(key().isIn(body().contentView().subviews));
  EXPECT_EQ(cell->value(), nullptr);
}

TEST_F(KelvasiCellTest, AValueCellHasBothLabelsInItsScrollableView) {
  makeValueCell();
  EXPECT_EQ(body().contentView().subviews.parts().size(), 1U);
  EXPECT_TRUE(key().isIn(view().subviews));
  EXPECT_TRUE(value().isIn(view().subviews));
}

TEST_F(KelvasiCellTest, BothKindsKeepStyleAndIdentifier) {
  makeKeyCell();
  EXPECT_EQ(body().style, CellStyle::twoLabelValue);
  EXPECT_EQ(cell->reuseIdentifier(), "id");
  makeValueCell();
  EXPECT_EQ(body().style, CellStyle::twoLabelValue);
  EXPECT_EQ(cell->reuseIdentifier(), "id");
}

TEST_F(KelvasiCellTest, TheKeyIsBoldTheValueRegularBothLeftAlignedAt15Points) {
  makeValueCell();
  EXPECT_EQ(key().fontSet, (Font{.family = "", .size = 15.0, .isBold = true}));
  EXPECT_EQ(value().fontSet, (Font{.family = "", .size = 15.0, .isBold = false}));
  EXPECT_EQ(key().alignmentSet, TextAlignment::left);
  EXPECT_EQ(value().alignmentSet, TextAlignment::left);
  makeKeyCell();
  EXPECT_EQ(key().fontSet, (Font{.family = "", .size = 15.0, .isBold = true}));
  EXPECT_EQ(key().alignmentSet, TextAlignment::left);
}

TEST_F(KelvasiCellTest, AValueSetOnAKeyCellGoesNowhere) {
  makeKeyCell();
  cell->setValue("text");
  EXPECT_EQ(cell->value(), nullptr);
}

TEST_F(KelvasiCellTest, TheKeyStandsTenPointsInAndCentredVertically) {
  table.contentArea = {3, 2, 300, 44};
  makeKeyCell();
  cell->setKey("key");
  ui.sizes[{"key", true}] = {80, 19};
  cell->setLayoutKey();
  EXPECT_EQ(key().frameSet, (Rect{13, 12.5, 80, 19}));
  EXPECT_EQ(body().layouts, 1);
}

TEST_F(KelvasiCellTest, AKeyCellLaidOutForAValuePlacesItsKeyOnly) {
  makeKeyCell();
  cell->setKey("key");
  ui.sizes[{"key", true}] = {80, 20};
  cell->setLayout();
  EXPECT_EQ(key().frameSet, (Rect{10, 12, 80, 20}));
}

TEST_F(KelvasiCellTest, AValueThatFitsStandsFlushRight) {
  layOut({80, 18}, {100, 17});
  EXPECT_EQ(key().frameSet, (Rect{10, 13, 80, 18}));
  EXPECT_EQ(value().frameSet, (Rect{220, 13.5, 100, 17}));
  EXPECT_EQ(view().contentSize, (Size{320, 50}));
  EXPECT_EQ(view().frameSet, (Rect{0, 0, 320, 50}));
  EXPECT_EQ(body().layouts, 1);
}

TEST_F(KelvasiCellTest, AValueThatDoesNotFitStandsFiftyPointsAfterTheKeyAndScrolls) {
  layOut({80, 18}, {250, 18});
  EXPECT_EQ(value().frameSet, (Rect{140, 13, 250, 18}));
  EXPECT_EQ(view().contentSize, (Size{650, 50}));
}

TEST_F(KelvasiCellTest, AnExactFitStandsAfterTheKeyAndDoesNotScroll) {
  layOut({80, 18}, {180, 18});
  EXPECT_EQ(value().frameSet, (Rect{140, 13, 180, 18}));
  EXPECT_EQ(view().contentSize, (Size{320, 50}));
}

TEST_F(KelvasiCellTest, JustUnderAnExactFitStandsFlushRight) {
  layOut({80, 18}, {179.5, 18});
  EXPECT_EQ(value().frameSet, (Rect{140.5, 13, 179.5, 18}));
  EXPECT_EQ(view().contentSize, (Size{320, 50}));
}

TEST_F(KelvasiCellTest, TheContentAreasOriginMovesKeyAndLateValueButNotAFlushOne) {
  table.contentArea = {7, 5, 320, 44};
  layOut({80, 18}, {100, 18});
  EXPECT_EQ(key().frameSet, (Rect{17, 13, 80, 18}));
  EXPECT_EQ(value().frameSet, (Rect{220, 13, 100, 18}));
  EXPECT_EQ(view().frameSet, (Rect{7, 5, 320, 50}));
  layOut({80, 18}, {250, 18});
  EXPECT_EQ(value().frameSet.x, 147);
  layOut({80, 18}, {180, 18});  // fits exactly
  EXPECT_EQ(value().frameSet.x, 147);
}

TEST_F(KelvasiCellTest, TheViewStaysFiftyPointsHighWhateverTheRow) {
  table.contentArea = {0, 0, 320, 90};
  layOut({80, 20}, {100, 20});
  EXPECT_EQ(view().frameSet.height, 50);
  EXPECT_EQ(view().contentSize.height, 50);
  EXPECT_EQ(key().frameSet.y, 35);
}

}  // namespace
}  // namespace kelvasi
