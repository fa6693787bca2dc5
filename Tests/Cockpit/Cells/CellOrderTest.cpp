// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cells/CellOrder.h"

#include <gtest/gtest.h>

namespace kelvasi::cockpit {
namespace {

using namespace std::chrono_literals;
using Numbers = std::vector<std::uint32_t>;

TEST(CellOrder, BeginsWithTheBest) {
  CellOrder order;
  EXPECT_EQ(order.arrange({{1, 0, -110}, {2, 0, -90}, {3, 0, -100}}, 0s), (Numbers{2, 3, 1}));
}

TEST(CellOrder, ChangesAtOnceAfterTwoDecibels) {
  CellOrder order;
  order.arrange({{1, 0, -100}, {2, 0, -101}}, 0s);
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -98.1}}, 1s), (Numbers{1, 2}));
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -98}}, 1s), (Numbers{2, 1}));
}

TEST(CellOrder, ChangesForLessAfterFourSeconds) {
  CellOrder order;
  order.arrange({{1, 0, -100}, {2, 0, -101}}, 0s);
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -99}}, 1s), (Numbers{1, 2}));
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -99}}, 4999ms), (Numbers{1, 2}));
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -99}}, 5s), (Numbers{2, 1}));
}

TEST(CellOrder, FourSecondsWithoutABreak) {
  CellOrder order;
  order.arrange({{1, 0, -100}, {2, 0, -101}}, 0s);
  order.arrange({{1, 0, -100}, {2, 0, -99}}, 1s);
  order.arrange({{1, 0, -100}, {2, 0, -101}}, 3s);
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -99}}, 5s), (Numbers{1, 2}));
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -99}}, 9s), (Numbers{2, 1}));
}

TEST(CellOrder, ABackwardChangeWaitsAgain) {
  CellOrder order;
  order.arrange({{1, 0, -100}, {2, 0, -101}}, 0s);
  order.arrange({{1, 0, -100}, {2, 0, -99}}, 1s);
  order.arrange({{1, 0, -100}, {2, 0, -99}}, 5s);
  EXPECT_EQ(order.arrange({{1, 0, -98.5}, {2, 0, -99}}, 6s), (Numbers{2, 1}));
  EXPECT_EQ(order.arrange({{1, 0, -98.5}, {2, 0, -99}}, 10s), (Numbers{1, 2}));
}

TEST(CellOrder, GroupsStandAboveLevels) {
  CellOrder order;
  EXPECT_EQ(order.arrange({{1, 1, -60}, {2, 0, -110}}, 0s), (Numbers{2, 1}));
  EXPECT_EQ(order.arrange({{1, 0, -60}, {2, 100, -110}}, 0s), (Numbers{1, 2}));
}

TEST(CellOrder, ComersAndGoersMoveNobodyElse) {
  CellOrder order;
  order.arrange({{1, 0, -100}, {2, 0, -101}}, 0s);
  order.arrange({{1, 0, -100}, {2, 0, -99.5}}, 1s);  // not yet
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -99.5}, {3, 0, -105}}, 2s), (Numbers{1, 2, 3}));
  EXPECT_EQ(order.arrange({{2, 0, -99.5}, {3, 0, -105}}, 2s), (Numbers{2, 3}));
}

TEST(CellOrder, NothingMovesWhileHeld) {
  CellOrder order;
  order.arrange({{1, 0, -100}, {2, 0, -110}}, 0s);
  order.hold(true);
  EXPECT_EQ(order.arrange({{2, 0, -60}, {3, 0, -50}}, 10s), (Numbers{1, 2, 3}));
  order.hold(false);
  EXPECT_EQ(order.arrange({{2, 0, -60}, {3, 0, -50}}, 10s), (Numbers{3, 2}));
}

TEST(CellOrder, SettlesForAnyOrder) {
  CellOrder order;
  order.arrange({{1, 0, -60}, {2, 0, -70}, {3, 0, -80}, {4, 0, -90}, {5, 0, -100}}, 0s);
  EXPECT_EQ(order.arrange({{1, 0, -100}, {2, 0, -90}, {3, 0, -80}, {4, 0, -70}, {5, 0, -60}}, 0s),
            (Numbers{5, 4, 3, 2, 1}));
}

}  // namespace
}  // namespace kelvasi::cockpit
