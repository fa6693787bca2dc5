// SPDX-License-Identifier: Apache-2.0
// Fonts and the room that texts take.
#include "Platform/QtWidgets/Fonts.h"

#include <gtest/gtest.h>

#include <QFontDatabase>
#include <QFontInfo>
#include <QFontMetricsF>
#include <cmath>

namespace kelvasi {
namespace {

TEST(Fonts, APointIsAPixelOfTheLogicalScreen) {
  EXPECT_EQ(qtFont(Font::system(14.0)).pixelSize(), 14);
  EXPECT_EQ(qtFont(Font::boldSystem(15.0)).pixelSize(), 15);
  EXPECT_EQ(qtFont({.family = "Helvetica", .size = 13.0, .isBold = false}).pixelSize(), 13);
}

TEST(Fonts, BoldIsBoldAndRegularIsNot) {
  EXPECT_TRUE(qtFont(Font::boldSystem(15)).bold());
  EXPECT_FALSE(qtFont(Font::system(15)).bold());
  EXPECT_GT(sizeOfText("Serving Cell", Font::boldSystem(15)).width,
            sizeOfText("Serving Cell", Font::system(15)).width);
}

TEST(Fonts, AFamilyThatIsNamedIsAskedFor) {
  EXPECT_EQ(qtFont({.family = "Helvetica", .size = 13.0, .isBold = false}).family(), "Helvetica");
}

TEST(Fonts, TheSystemsFontExists) {
  EXPECT_TRUE(QFontDatabase::hasFamily(QFontInfo(qtFont(Font::system(15))).family()));
}

TEST(Fonts, ATextTakesWholePoints) {
  const Size size = sizeOfText("Cell Reselection", Font::boldSystem(15));
  EXPECT_EQ(size.width, std::floor(size.width));
  EXPECT_EQ(size.height, std::floor(size.height));
  EXPECT_GE(size.height, 15);
  for (const char* const text : {"MM State", "RSCP", "-86 dBm", "Scrambling Code"}) {
    const double advance = QFontMetricsF(qtFont(Font::boldSystem(15))).horizontalAdvance(text);
    EXPECT_GE(sizeOfText(text, Font::boldSystem(15)).width, advance) << text;
  }
}

TEST(Fonts, ALongerTextIsWiderAndNoneHasNoWidth) {
  EXPECT_EQ(sizeOfText("", Font::system(15)).width, 0);
  EXPECT_LT(sizeOfText("-85", Font::system(15)).width, sizeOfText("-85 dBm", Font::system(15)).width);
  EXPECT_EQ(sizeOfText("", Font::system(15)).height, sizeOfText("g", Font::system(15)).height);
}

TEST(Fonts, TextsAreUtf8) {
  EXPECT_EQ(qtText("\xC3\x85ngstr\xC3\xB6m").size(), 8);
  EXPECT_EQ(qtText(std::string_view("a\0b", 3)).size(), 3);
}

}  // namespace
}  // namespace kelvasi
