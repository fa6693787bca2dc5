// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/Grid.h"

#include <gtest/gtest.h>

namespace kelvasi::terminal {
namespace {

const Glyph letter{.points = {U'a'}};
const Glyph wide{.points = {U'\u4E2D'}, .columns = 2};

TEST(Grid, KeepsWhatIsSet) {
  Grid grid({4, 2});
  grid.set({1, 1}, letter, {.role = Role::good});
  EXPECT_EQ(grid.textOfRow(0), "");
  EXPECT_EQ(grid.textOfRow(1), " a");
  EXPECT_EQ(grid.at({1, 1}).style.role, Role::good);
}

TEST(Grid, NothingIsSetOutside) {
  Grid grid({2, 1});
  for (const Place place : {Place{-1, 0}, Place{2, 0}, Place{0, 1}, Place{0, -1}})
    grid.set(place, letter, {});
  grid.set({1, 0}, wide, {});  // its half would stand out
  EXPECT_EQ(grid, Grid({2, 1}));
}

TEST(Grid, HalfOfAWideCharacterIsNeverLeft) {
  Grid grid({4, 1});
  grid.set({1, 0}, wide, {});
  grid.set({2, 0}, letter, {});
  EXPECT_EQ(grid.textOfRow(0), "  a");
  grid.set({1, 0}, wide, {});
  grid.set({1, 0}, letter, {});
  EXPECT_EQ(grid.textOfRow(0), " a");
  EXPECT_FALSE(grid.at({2, 0}).isTail);
}

TEST(Grid, MayBeOfNoSize) {
  EXPECT_EQ(Grid({-3, 5}).size(), (Size{0, 5}));
}

TEST(Grid, ComparesRows) {
  Grid one({3, 2});
  Grid other({3, 2});
  other.set({2, 1}, letter, {});
  EXPECT_TRUE(rowsAreEqual(one, other, 0));
  EXPECT_FALSE(rowsAreEqual(one, other, 1));
}

}  // namespace
}  // namespace kelvasi::terminal
