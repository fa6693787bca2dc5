// SPDX-License-Identifier: Apache-2.0
#include "Report/Report.h"

#include <gtest/gtest.h>

#include "Report/Drawing.h"
#include "Report/Moments.h"

namespace kelvasi::report {
namespace {

bool has(const std::string& text, const std::string& piece) {
  return text.find(piece) != std::string::npos;
}

TEST(Report, TextsAreEscaped) {
  EXPECT_EQ(escaped("<script>\"'&\n\x7f"), "&lt;script&gt;&quot;&#39;&amp;  ");
  Report page;
  page.title = "<var>";
  page.summary = {{"<i>", "<u>"}};
  page.tables = {{.title = "<p>", .headings = {"<q>"}, .rows = {{"<s>"}}, .note = "<em>"}};
  page.charts = {{.title = "<h1>",
                  .unit = "<h2>",
                  .from = 0,
                  .to = 2,
                  .lines = {{"<h3>", {{0, 1, 2, 3}}}},
                  .note = "<h4>"}};
  page.histograms = {{.title = "<h5>", .unit = "<h6>", .bins = {1}}};
  const std::string html = htmlOf(page);
  for (const char* tag : {"<var>", "<i>", "<u>", "<q>", "<s>", "<em>", "<h3>", "<h4>", "<h5>", "<h6>"}) {
    EXPECT_FALSE(has(html, tag)) << tag;
    EXPECT_TRUE(has(html, "&lt;" + std::string(tag + 1, std::string(tag).size() - 2) + "&gt;")) << tag;
  }
}

TEST(Report, AsksForNothingFromElsewhere) {
  const std::string html = htmlOf({});
  EXPECT_TRUE(has(html, "default-src 'none'"));
  EXPECT_FALSE(has(html, "http://"));
  EXPECT_FALSE(has(html, "https://"));
}

TEST(TimeChart, LineIsBrokenWhereValuesAreMissing) {
  const Chart chart{.title = "RSRP",
                    .unit = "dBm",
                    .from = 0,
                    .to = 10,
                    .step = 1,
                    .lines = {{"one", {{0, -100, -100, -100}, {1, -100, -100, -100}, {5, -95, -90, -85}}}}};
  // From -100 at the bottom to -85 at the top.
  const std::string svg = svgOf(chart);
  EXPECT_TRUE(has(svg, "d=\"M0 300L100 300M500 100h.01\"")) << svg;
  EXPECT_TRUE(has(svg, "d=\"M0 300V300M100 300V300M500 200V0\"")) << svg;
}

TEST(TimeChart, NothingWithoutLinesOrTime) {
  EXPECT_EQ(svgOf(Chart{.title = "", .unit = "", .from = 0, .to = 1, .lines = {}}), "");
  EXPECT_EQ(svgOf(Chart{.title = "", .unit = "", .from = 1, .to = 1, .lines = {{"one", {}}}}), "");
}

TEST(Histogram, BarsAndTheCurve) {
  const std::string svg =
      svgOf(Histogram{.title = "", .unit = "dB", .first = -10, .width = 1, .bins = {1, 3}});
  EXPECT_TRUE(has(svg, "-10 to -9 dB: 25 %")) << svg;
  EXPECT_TRUE(has(svg, "-9 to -8 dB: 75 %")) << svg;
  EXPECT_TRUE(has(svg, "d=\"M0 300L500 225L1000 0\"")) << svg;
  EXPECT_EQ(svgOf(Histogram{.title = "", .unit = "", .bins = {0}}), "");
}

TEST(Scale, HasRoundSteps) {
  const Scale scale = Scale::around(-112.3, -71);
  EXPECT_DOUBLE_EQ(scale.least, -120);
  EXPECT_DOUBLE_EQ(scale.most, -70);
  EXPECT_DOUBLE_EQ(scale.step, 10);
  EXPECT_GT(Scale::around(5, 5).most, 5);
}

TEST(Numeral, IsShort) {
  EXPECT_EQ(numeral(12.0), "12");
  EXPECT_EQ(numeral(-0.04), "0");
  EXPECT_EQ(numeral(100.0, 0), "100");
  EXPECT_EQ(numeral(2.5, 3), "2.5");
}

TEST(Moments, AreInUtc) {
  EXPECT_EQ(dateAndTime(1709647629.9), "2024-03-05 14:07:09");
  EXPECT_EQ(timeOfDay(0), "00:00:00");
  EXPECT_EQ(duration(59.4), "59 s");
  EXPECT_EQ(duration(3729), "1 h 02 min 09 s");
}

}  // namespace
}  // namespace kelvasi::report
