// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/RowCells.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using testing::ElementsAre;

// A table whose cells carry the number of their making.
class RowCellsTest : public testing::Test {
 protected:
  struct NumberedCell : TableViewCell {
    NumberedCell(int itsNumber, std::string identifier)
        : TableViewCell(nullptr, std::move(identifier)), number(itsNumber) {}
    int number;
  };

  std::unique_ptr<TableViewCell> cellForRow(std::size_t row) {
    asked.push_back(row);
    auto reused = cells.dequeue("id");
    return reused ? std::move(reused) : std::make_unique<NumberedCell>(++made, "id");
  }
  void show(RowRange rows) {
    asked.clear();
    cells.show(rows, [this](std::size_t row) { return cellForRow(row); });
  }
  void reload(RowRange rows) {
    asked.clear();
    cells.reload(rows, [this](std::size_t row) { return cellForRow(row); });
  }
  // Row and number of every cell in sight.
  std::vector<std::pair<std::size_t, int>> shown() const {
    std::vector<std::pair<std::size_t, int>> pairs;
    for (const auto& [row, cell] : cells.shown())
      pairs.emplace_back(row, static_cast<const NumberedCell&>(*cell).number);
    return pairs;
  }
  static auto at(std::size_t row, int number) { return testing::Pair(row, number); }

  RowCells cells;
  std::vector<std::size_t> asked;
  int made = 0;
};

TEST_F(RowCellsTest, ShowsEveryRowInSight) {
  show({2, 4});
  EXPECT_THAT(shown(), ElementsAre(at(2, 1), at(3, 2)));
}

TEST_F(RowCellsTest, ScrollingAsksForNewRowsOnlyAndReusesTheCellsThatLeft) {
  show({0, 3});
  show({1, 4});
  EXPECT_THAT(asked, ElementsAre(3U));
  EXPECT_THAT(shown(), ElementsAre(at(1, 2), at(2, 3), at(3, 1)));
  EXPECT_EQ(made, 3);
}

TEST_F(RowCellsTest, NeverMakesMoreCellsThanWereInSightAtOnce) {
  for (std::size_t first = 0; first < 10000; first += 7) show({first, first + 15});
  EXPECT_EQ(made, 15);
}

TEST_F(RowCellsTest, AReloadAsksForEveryRowAndGivesItItsOwnCell) {
  show({0, 3});
  reload({0, 3});
  EXPECT_THAT(asked, ElementsAre(0U, 1U, 2U));
  EXPECT_THAT(shown(), ElementsAre(at(0, 1), at(1, 2), at(2, 3)));
}

TEST_F(RowCellsTest, AReloadOfFewerRowsKeepsTheOtherCellsForLater) {
  show({0, 3});
  reload({0, 1});
  EXPECT_THAT(shown(), ElementsAre(at(0, 1)));
  EXPECT_EQ(cells.waiting().size(), 2U);
  reload({0, 3});
  EXPECT_EQ(made, 3);
}

TEST_F(RowCellsTest, ACellWaitsForItsOwnIdentifier) {
  show({0, 1});
  show({0, 0});
  EXPECT_EQ(cells.dequeue("other"), nullptr);
  EXPECT_NE(cells.dequeue("id"), nullptr);
  EXPECT_EQ(cells.dequeue("id"), nullptr);
}

}  // namespace
}  // namespace kelvasi
