// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Chart/Chart.h"

#include <gtest/gtest.h>

#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

constexpr Arrival now = noon + 100h;

TEST(Chart, FollowsTheTime) {
  Chart chart;
  EXPECT_EQ(chart.endAt(now), now);
  EXPECT_EQ(chart.beginAt(now), now - 5min);
  EXPECT_EQ(chart.endAt(now + 1s), now + 1s);
}

TEST(Chart, ItsWindowIsAMinuteToADay) {
  Chart chart;
  chart.setLength(1s);
  EXPECT_EQ(chart.length(), Chart::shortest);
  chart.setLength(100h);
  EXPECT_EQ(chart.length(), Chart::longest);
}

TEST(Chart, ZoomsAboutAPlace) {
  Chart chart;
  chart.show(now - 20min, now - 10min);
  chart.zoom(0.5, 0.5, now);
  EXPECT_EQ(chart.beginAt(now), now - 17min - 30s);
  EXPECT_EQ(chart.endAt(now), now - 12min - 30s);
  chart.zoom(2, 0, now);
  EXPECT_EQ(chart.beginAt(now), now - 17min - 30s);
  EXPECT_EQ(chart.length(), 10min);
}

TEST(Chart, ZoomingAtNowStaysThere) {
  Chart chart;
  chart.zoom(2, 1, now);
  EXPECT_TRUE(chart.follows());
  EXPECT_EQ(chart.length(), 10min);
  chart.zoom(0.5, 0.5, now);
  EXPECT_FALSE(chart.follows());
  chart.zoom(10, 0.5, now);  // reaches past now
  EXPECT_TRUE(chart.follows());
}

TEST(Chart, PansUpToNow) {
  Chart chart;
  chart.pan(-0.5, now);
  EXPECT_EQ(chart.endAt(now), now - 150s);
  EXPECT_EQ(chart.endAt(now + 1h), now - 150s);
  chart.pan(0.25, now);
  EXPECT_EQ(chart.endAt(now), now - 75s);
  chart.pan(0.5, now);
  EXPECT_TRUE(chart.follows());
}

TEST(Chart, HoldsEightLinesEachOnce) {
  Chart chart;
  EXPECT_TRUE(chart.add({.cell = 1, .level = LevelKind::rsrp}));
  EXPECT_FALSE(chart.add({.cell = 1, .level = LevelKind::rsrp}));
  for (std::uint32_t cell = 2; cell < 9; ++cell)
    EXPECT_TRUE(chart.add({.cell = cell, .level = LevelKind::rsrp}));
  EXPECT_FALSE(chart.add({.cell = 9, .level = LevelKind::rsrp}));
  chart.remove({.cell = 1, .level = LevelKind::rsrp});
  EXPECT_EQ(chart.lines().size(), 7U);
}

// A minute of two cells: 404 falls by one each second, 362 is there once; after half a minute 362 serves.
class PictureTest : public testing::Test {
 protected:
  PictureTest() {
    for (int second = 0; second < 30; ++second) {
      Message message = served(second * 1s, cell404, -80 - second);
      if (second == 10) message.neighbour(cell362, quantity::rsrp, -99);
      fed_.take(message);
    }
    fed_.take(served(30s, cell362, -95));
    for (const ChartLineKey& key : fed_.cockpit.chartLines(end)) chart_.add(key);
    chart_.setLength(1min);
  }
  ChartPicture draw(std::size_t columns) { return fed_.cockpit.draw(chart_, end, columns); }

  static constexpr Arrival end = noon + 31s;
  Fed fed_;
  Chart chart_;
};

TEST_F(PictureTest, ItsLinesAreTheServingCellAndThoseBesideIt) {
  const ChartPicture picture = draw(60);
  ASSERT_EQ(picture.lines.size(), 2U);
  EXPECT_EQ(picture.lines[0].name, "PCI 362 RSRP");
  EXPECT_TRUE(picture.lines[0].isServing);
  EXPECT_EQ(picture.lines[0].newest, "-95 dBm");
  EXPECT_EQ(picture.lines[1].name, "PCI 404 RSRP");
  EXPECT_FALSE(picture.lines[1].isServing);
  EXPECT_EQ(picture.unit, "dBm");
  EXPECT_EQ(picture.why, "");
}

TEST_F(PictureTest, MinimumAndMaximumSurviveZoomingOut) {
  const ChartPicture picture = draw(6);
  const auto& points = picture.lines[1].points;
  ASSERT_EQ(points.size(), 6U);
  EXPECT_EQ(points[0].count, 0U);  // before the drive
  EXPECT_EQ(points[3].count, 10U);
  EXPECT_EQ(points[3].maximum, -81);
  EXPECT_EQ(points[3].minimum, -90);
  EXPECT_EQ(picture.lines[0].points[3].maximum, -99);
}

TEST_F(PictureTest, ItsAxisIsRoundAndHoldsAll) {
  const ChartPicture picture = draw(60);
  EXPECT_EQ(picture.least, -110);
  EXPECT_EQ(picture.most, -80);
  EXPECT_DOUBLE_EQ(picture.heightOf(-95), 0.5);
  EXPECT_EQ(picture.timeTicks.size(), 4U);
}

TEST_F(PictureTest, BandsFillTheAxis) {
  const ChartPicture picture = draw(60);
  std::string bands;
  for (const ChartBand& band : picture.bands)
    bands += std::string(wordOf(band.verdict)) + " " + std::to_string(std::lround(band.from * 30)) + " to " +
             std::to_string(std::lround(band.to * 30)) + ";";
  EXPECT_EQ(bands, "good 20 to 30;fair 10 to 20;poor 0 to 10;");
}

TEST_F(PictureTest, EventsAndMarksAreMarks) {
  fed_.cockpit.mark(noon + 16s, "bridge");
  fed_.cockpit.mark(noon - 1h, "long ago");
  const ChartPicture picture = draw(60);
  ASSERT_EQ(picture.marks.size(), 2U);
  EXPECT_EQ(picture.marks[0].kind, ChartMark::Kind::mark);
  EXPECT_EQ(picture.marks[0].words, "bridge");
  EXPECT_DOUBLE_EQ(picture.marks[0].place, 45.0 / 60);
  EXPECT_EQ(picture.marks[1].kind, ChartMark::Kind::cellChange);
  EXPECT_EQ(picture.marks[1].words, "cell change PCI 404 to 362");
}

TEST_F(PictureTest, ACursorReadsAllLines) {
  chart_.setCursor(0, noon + 10s + 500ms);
  const ChartPicture picture = draw(60);
  ASSERT_EQ(picture.cursors.size(), 1U);
  EXPECT_EQ(picture.cursors[0].timeText, "00:00:10");
  EXPECT_EQ(picture.cursors[0].values.at(0).text, "-99 dBm");
  EXPECT_EQ(picture.cursors[0].values.at(1).text, "-90 dBm");
  EXPECT_EQ(picture.differences.size(), 0U);
}

TEST_F(PictureTest, TwoCursorsHaveADifference) {
  chart_.setCursor(0, noon + 5s);
  chart_.setCursor(1, noon + 20s);
  const ChartPicture picture = draw(60);
  ASSERT_EQ(picture.cursors.size(), 2U);
  EXPECT_EQ(picture.cursorTime, "15 s");
  EXPECT_EQ(picture.cursors[0].values.at(0).text, "no value");
  EXPECT_EQ(picture.differences, (std::vector<std::string>{"", "-15 dBm"}));
  chart_.setCursor(1, {});
  EXPECT_EQ(draw(60).cursors.size(), 1U);
}

TEST_F(PictureTest, ACursorTakesWhatWasLiveThen) {
  chart_.setCursor(0, noon + 13s);
  EXPECT_EQ(draw(60).cursors[0].values.at(0).text, "-99 dBm");
  chart_.setCursor(0, noon + 14s);
  EXPECT_EQ(draw(60).cursors[0].values.at(0).text, "no value");
}

TEST_F(PictureTest, CsvHasALineASecond) {
  chart_.show(noon + 9s, noon + 69s);
  const std::string csv = fed_.cockpit.csv(chart_, noon + 69s);
  EXPECT_TRUE(
      csv.starts_with("time,PCI 362 RSRP minimum (dBm),PCI 362 RSRP mean (dBm),PCI 362 RSRP maximum (dBm),"
                      "PCI 404 RSRP minimum (dBm),PCI 404 RSRP mean (dBm),PCI 404 RSRP maximum (dBm)\r\n"
                      "2024-10-04T00:00:09Z,,,,-89,-89,-89\r\n"
                      "2024-10-04T00:00:10Z,-99,-99,-99,-90,-90,-90\r\n"))
      << csv;
  EXPECT_EQ(std::ranges::count(csv, '\n'), 1 + 22);
}

TEST_F(PictureTest, AnEmptyOneSaysWhy) {
  EXPECT_EQ(fed_.cockpit.draw(Chart(), end, 60).why, "No value chosen yet");
  chart_.show(noon - 10min, noon - 5min);
  EXPECT_EQ(draw(60).why, "No values in this time");
}

TEST(ChartLineOf, ARowIsItsCellsLevelOrItself) {
  Fed fed;
  fed.take(served(0s, cell404, -95).plain(quantity::txPower, 5));
  const auto level = fed.cockpit.chartLine("/Serving/rsrp");
  ASSERT_TRUE(level);
  EXPECT_EQ(level->level, LevelKind::rsrp);
  const auto power = fed.cockpit.chartLine("/Plain/tx_power");
  ASSERT_TRUE(power);
  EXPECT_NE(power->row, 0U);
  EXPECT_FALSE(fed.cockpit.chartLine("/Serving/pci"));
  EXPECT_FALSE(fed.cockpit.chartLine("/Serving"));
  Chart chart;
  chart.add(*power);
  const ChartPicture picture = fed.cockpit.draw(chart, noon + 1s, 300);
  EXPECT_EQ(picture.lines[0].name, "tx_power");
  EXPECT_EQ(picture.lines[0].newest, "5 dBm");
  EXPECT_EQ(picture.bands.size(), 0U);
}

}  // namespace
}  // namespace kelvasi::cockpit
