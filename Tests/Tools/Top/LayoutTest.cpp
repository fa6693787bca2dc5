// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Layout.h"

#include <gtest/gtest.h>

namespace kelvasi::top {
namespace {

const Wishes full{.head = 3,
                  .levels = 4,
                  .second = 3,
                  .alarms = 2,
                  .pins = 5,
                  .cells = 16,
                  .carriers = 3,
                  .events = 40,
                  .panes = 31,
                  .timeline = 3};

std::vector<Area> areasOf(const Layout& layout) {
  return {layout.head,   layout.alarms,   layout.levels, layout.second, layout.pins,     layout.cells,
          layout.events, layout.carriers, layout.chart,  layout.panes,  layout.timeline, layout.foot};
}

bool overlap(const Area& one, const Area& other) {
  return one.column < other.column + other.columns && other.column < one.column + one.columns &&
         one.row < other.row + other.rows && other.row < one.row + one.rows;
}

TEST(Layout, NothingOverlapsNorStandsOut) {
  for (int columns = 1; columns <= 300; columns += 7) {
    for (int rows = 1; rows <= 100; rows += 3) {
      const auto areas = areasOf(layOut({columns, rows}, full));
      for (std::size_t at = 0; at < areas.size(); ++at) {
        if (areas[at].rows <= 0) continue;
        EXPECT_TRUE(areas[at].row >= 0 && areas[at].row + areas[at].rows <= rows)
            << columns << "x" << rows << " " << at;
        EXPECT_TRUE(areas[at].column + areas[at].columns <= columns) << columns << "x" << rows << " " << at;
        for (std::size_t other = at + 1; other < areas.size(); ++other)
          EXPECT_FALSE(areas[other].rows > 0 && overlap(areas[at], areas[other]))
              << columns << "x" << rows << " " << at << " " << other;
      }
    }
  }
}

TEST(Layout, TheSmallestScreenHasCockpitAndPanes) {
  const Layout layout = layOut({40, 12}, {.head = 2, .levels = 3, .cells = 5, .events = 3, .panes = 10});
  EXPECT_EQ(layout.head, (Area{0, 0, 40, 2}));
  EXPECT_EQ(layout.levels, (Area{0, 2, 40, 3}));
  EXPECT_EQ(layout.panes, (Area{0, 6, 40, 5}));
  EXPECT_EQ(layout.foot, (Area{0, 11, 40, 1}));
}

TEST(Layout, WidthPutsThemBesideEachOther) {
  EXPECT_EQ(layOut({99, 40}, full).divider, -1);
  EXPECT_GT(layOut({100, 40}, full).divider, 0);
  EXPECT_EQ(layOut({100, 40}, full).chart.rows, 0);
  EXPECT_GT(layOut({160, 40}, full).chart.rows, 0);
}

}  // namespace
}  // namespace kelvasi::top
