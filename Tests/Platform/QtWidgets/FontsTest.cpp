// SPDX-License-Identifier: Apache-2.0
// Fonts and the room that texts take.
#include "Platform/QtWidgets/Fonts.h"

#include <gtest/gtest.h>

#include <QFontDatabase>
#include <QFontInfo>
#include <QFontMetricsF>
#include <cmath>

#include "Platform/QtWidgets/TextLine.h"

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

TEST(Fonts, DigitsAreEquallyWideInBothWeights) {
  for (const Font& font : {Font::system(15), Font::boldSystem(15)}) {
    for (const char* const digits : {"0", "2", "4", "7", "8"})
      EXPECT_EQ(TextLine(qtText(digits), qtFont(font)).width(),
                TextLine(QStringLiteral("1"), qtFont(font)).width());
    EXPECT_EQ(sizeOfText("-111 dBm", font).width, sizeOfText("-888 dBm", font).width);
  }
}

TEST(Fonts, ALineBreakIsASpace) {
  EXPECT_EQ(qtText("one\ntwo\xE2\x80\xA8three"), "one two three");
}

// Marks, embeddings, overrides and isolates; the letters of a script that runs from the right stay.
TEST(Fonts, WhatOnlyTurnsADirectionIsShownAndTurnsNothing) {
  EXPECT_EQ(qtText("a\xE2\x80\xAE"
                   "b"),
            QString::fromUtf8("a\xEF\xBF\xBD"
                              "b"));
  for (const char* const control :
       {"\xD8\x9C", "\xE2\x80\x8E", "\xE2\x80\x8F", "\xE2\x80\xAA", "\xE2\x81\xA6", "\xE2\x81\xA9"})
    EXPECT_EQ(qtText(control), QString(QChar::ReplacementCharacter)) << control;
  const QString hebrew = QString::fromUtf8("\xD7\xA9\xD7\x9C");
  EXPECT_EQ(qtText(hebrew.toStdString()), hebrew);
}

TEST(Fonts, TextsGrowWithTheTextSizeWithinReason) {
  const double usual = sizeOfText("Cell", Font::system(15)).width;
  setTextScale(2);
  EXPECT_EQ(qtFont(Font::system(15)).pixelSize(), 30);
  EXPECT_GT(sizeOfText("Cell", Font::system(15)).width, 1.8 * usual);
  setTextScale(50);
  EXPECT_EQ(textScale(), 3);
  setTextScale(1);
  EXPECT_EQ(sizeOfText("Cell", Font::system(15)).width, usual);
}

TEST(Fonts, TextsAreUtf8) {
  EXPECT_EQ(qtText("\xC3\x85ngstr\xC3\xB6m").size(), 8);
  EXPECT_EQ(qtText(std::string_view("a\0b", 3)).size(), 3);
}

}  // namespace
}  // namespace kelvasi
