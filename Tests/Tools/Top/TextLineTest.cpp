// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/TextLine.h"

#include <gtest/gtest.h>

#include <clocale>

#include "Tests/Tools/Top/Screen.h"

namespace kelvasi::top {
namespace {

constexpr Look ascii{.set = CharacterSet::ascii};

TEST(TextLine, HasALeftAndARightEdge) {
  EXPECT_EQ(asText({{.left = {{"RSRP"}}, .right = {{"-95 dBm"}}}}, 14), "RSRP   -95 dBm\n");
}

TEST(TextLine, TheLeftMakesWay) {
  EXPECT_EQ(asText({{.left = {{"Serving RSRP"}}, .right = {{"-95 dBm"}}}}, 14), "Servi… -95 dBm\n");
  EXPECT_EQ(asText({{.left = {{"Serving RSRP"}}, .right = {{"-95 dBm"}}}}, 14, ascii), "Servi~ -95 dBm\n");
  EXPECT_EQ(asText({{.right = {{"-95 dBm"}}}}, 3), "-9…\n");
}

TEST(TextLine, IsCutBetweenWideCharacters) {
  EXPECT_EQ(asText({{.left = {{"\u4E2D\u56FD\u79FB\u52A8"}}}}, 6), "\u4E2D\u56FD…\n");
  EXPECT_EQ(asText({{.left = {{"\u4E2D\u56FD\u79FB\u52A8"}}}}, 8), "\u4E2D\u56FD\u79FB\u52A8\n");
}

TEST(TextLine, RulesSayWhatIsBelowThem) {
  EXPECT_EQ(asText({ruleLine("Cells", "1-5 of 9", 30, {})}, 30), "── Cells ───────── 1-5 of 9 ──\n");
  EXPECT_EQ(asText({ruleLine("Cells", "", 12, ascii)}, 12, ascii), "-- Cells ---\n");
  EXPECT_EQ(asText({ruleLine("Cells", "1-5 of 9", 4, {})}, 4), "1-5…\n");
}

TEST(TextLine, TextsBreakAtBlanks) {
  using Texts = std::vector<std::string>;
  EXPECT_EQ(wrapped("Mean power of the resource elements", 12, {}),
            (Texts{"Mean power", "of the", "resource", "elements"}));
  EXPECT_EQ(wrapped("a.very.long.name", 6, {}), (Texts{"a.very", ".long.", "name"}));
  EXPECT_EQ(wrapped("", 6, {}), Texts{""});
}

TEST(TextLine, AWindowShowsAPart) {
  std::setlocale(LC_CTYPE, "C.UTF-8");  // tells the width of characters
  EXPECT_EQ(windowOf("abcdef", 2, 3, {}), "cde");
  EXPECT_EQ(windowOf("\u4E2D\u56FD", 1, 3, {}), "\u56FD");
  std::setlocale(LC_CTYPE, "C");
}

}  // namespace
}  // namespace kelvasi::top
