// SPDX-License-Identifier: Apache-2.0
// Fingers on the window and on a chart.
#include <gtest/gtest.h>

#include <QPointingDevice>
#include <QTest>
#include <QVBoxLayout>
#include <QWindow>
#include <memory>

#include "Tools/Kelvasi/Cockpit/ChartPage.h"
#include "Tools/Kelvasi/Cockpit/TouchWatch.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;

constexpr Arrival noon = 480000h;

QPointingDevice& fingers() {
  static const std::unique_ptr<QPointingDevice> device(QTest::createTouchDevice());
  return *device;
}

// A window with a chart in it, and what is watched for.
class TouchTest : public testing::Test {
 protected:
  TouchTest() {
    window_.resize(400, 800);
    auto* const layout = new QVBoxLayout(&window_);
    layout->setContentsMargins(0, 0, 0, 0);
    chart_ = new ChartPage(&window_, {cockpit_, time_, [] { return noon; }}, {});
    layout->addWidget(chart_);
    window_.show();
    EXPECT_TRUE(QTest::qWaitForWindowExposed(&window_));
    new TouchWatch(window(), {.twoFingers = [this] { ++marks_; }, .fromEdge = [this] { ++backs_; }});
    chart_->refresh();
  }
  QWindow& window() { return *window_.windowHandle(); }
  void swipe(QPoint from, QPoint to) {
    QTest::touchEvent(&window(), &fingers()).press(0, from);
    QTest::touchEvent(&window(), &fingers()).move(0, (from + to) / 2);
    QTest::touchEvent(&window(), &fingers()).move(0, to);
    QTest::touchEvent(&window(), &fingers()).release(0, to);
  }

  cockpit::Cockpit cockpit_;
  cockpit::Chart time_;
  QWidget window_;
  ChartPage* chart_;
  int marks_ = 0;
  int backs_ = 0;
};

TEST_F(TouchTest, TwoFingersPutDownAndLiftedMark) {
  QTest::touchEvent(&window(), &fingers()).press(0, {100, 300}).press(1, {200, 300});
  QTest::touchEvent(&window(), &fingers()).release(0, {100, 300}).release(1, {200, 300});
  EXPECT_EQ(marks_, 1);
  EXPECT_FALSE(time_.cursors()[0]);
}

TEST_F(TouchTest, OneFingerDoesNotMark) {
  QTest::touchEvent(&window(), &fingers()).press(0, {100, 300});
  QTest::touchEvent(&window(), &fingers()).release(0, {100, 300});
  EXPECT_EQ(marks_, 0);
}

TEST_F(TouchTest, TwoFingersThatMoveApartComeNearerAndDoNotMark) {
  const auto before = time_.length();
  QTest::touchEvent(&window(), &fingers()).press(0, {150, 300}).press(1, {250, 300});
  QTest::touchEvent(&window(), &fingers()).move(0, {125, 300}).move(1, {275, 300});
  QTest::touchEvent(&window(), &fingers()).move(0, {100, 300}).move(1, {300, 300});
  QTest::touchEvent(&window(), &fingers()).release(0, {100, 300}).release(1, {300, 300});
  EXPECT_EQ(time_.length(), before / 2);
  EXPECT_EQ(marks_, 0);
  EXPECT_FALSE(time_.cursors()[0]);
}

TEST_F(TouchTest, ASwipeFromTheLeftEdgeGoesBack) {
  swipe({4, 300}, {160, 310});
  EXPECT_EQ(backs_, 1);
  EXPECT_TRUE(time_.follows());
}

TEST_F(TouchTest, ASwipeFromElsewhereOrUpwardsDoesNot) {
  swipe({60, 300}, {220, 310});
  swipe({4, 300}, {20, 100});
  swipe({4, 300}, {40, 300});
  EXPECT_EQ(backs_, 0);
}

TEST_F(TouchTest, AFingerDragsTheChartAndTapsSetTheCursors) {
  swipe({60, 300}, {220, 300});
  EXPECT_FALSE(time_.follows());
  swipe({220, 300}, {60, 300});
  QTest::touchEvent(&window(), &fingers()).press(0, {200, 300});
  QTest::touchEvent(&window(), &fingers()).release(0, {200, 300});
  ASSERT_TRUE(time_.cursors()[0]);
  EXPECT_FALSE(time_.cursors()[1]);
  QTest::touchEvent(&window(), &fingers()).press(0, {100, 300});
  QTest::qWait(700);
  QTest::touchEvent(&window(), &fingers()).release(0, {100, 300});
  ASSERT_TRUE(time_.cursors()[1]);
  EXPECT_LT(*time_.cursors()[1], *time_.cursors()[0]);
}

TEST_F(TouchTest, KeysMoveBothCursorsAndHomeTakesThemAway) {
  QTest::keyClick(chart_, Qt::Key_Period);
  QTest::keyClick(chart_, Qt::Key_Less);
  ASSERT_TRUE(time_.cursors()[0] && time_.cursors()[1]);
  EXPECT_EQ(*time_.cursors()[0], noon - 150s + 5s);
  EXPECT_EQ(*time_.cursors()[1], noon - 150s);
  QTest::keyClick(chart_, Qt::Key_Home);
  EXPECT_FALSE(time_.cursors()[0] || time_.cursors()[1]);
}

TEST_F(TouchTest, AllChartsShowOneTime) {
  ChartPage other(nullptr, {cockpit_, time_, [] { return noon; }}, {});
  other.resize(300, 300);
  QTest::keyClick(&other, Qt::Key_Plus);
  EXPECT_EQ(time_.length(), std::chrono::nanoseconds(210s));
  chart_->refresh();
  EXPECT_FALSE(chart_->image().isNull());
}

}  // namespace
}  // namespace kelvasi
