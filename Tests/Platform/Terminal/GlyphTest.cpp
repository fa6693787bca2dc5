// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/Glyph.h"

#include <gtest/gtest.h>

#include <clocale>
#include <string>

namespace kelvasi::terminal {
namespace {

class GlyphTest : public testing::Test {
 protected:
  GlyphTest() { std::setlocale(LC_CTYPE, "C.UTF-8"); }
  ~GlyphTest() override { std::setlocale(LC_CTYPE, "C"); }

  static std::string shown(std::string_view text, CharacterSet set = CharacterSet::utf8) {
    std::string shown;
    for (const Glyph& glyph : glyphsOf(text, set)) shown += textOf(glyph);
    return shown;
  }
};

TEST_F(GlyphTest, PlainTextStaysAsItIs) {
  EXPECT_EQ(shown("PCI 404  -105"), "PCI 404  -105");
  EXPECT_EQ(widthOf("PCI 404", CharacterSet::utf8), 7);
}

TEST_F(GlyphTest, NoControlCharacterComesThrough) {
  EXPECT_EQ(shown(std::string_view("a\x1b[2Jb\x07\x7f\0c\n\t", 12)), "a�[2Jb���c��");
  EXPECT_EQ(shown("\xc2\x9b"
                  "31m"),
            "�31m");  // the one-character CSI of C1
  EXPECT_EQ(shown("a\x1b[2J", CharacterSet::ascii), "a?[2J");
}

TEST_F(GlyphTest, NothingTurnsTheLineAround) {
  EXPECT_EQ(shown("a\u202Eb\u2066c\u200Fd\u061Ce"), "a�b�c�d�e");
}

TEST_F(GlyphTest, NothingIsInvisible) {
  EXPECT_EQ(shown("a\u200Bb\u200Dc\uFEFFd\u00ADe\u2028f"), "a�b�c�d�e�f");
}

TEST_F(GlyphTest, BytesThatAreNoTextAreReplacedOneByOne) {
  EXPECT_EQ(shown("a\xff\xc3z\xe2\x82"), "a��z��");
  EXPECT_EQ(shown("\xed\xa0\x80"), "���");  // a surrogate
}

TEST_F(GlyphTest, WideCharactersTakeTwoColumns) {
  EXPECT_EQ(widthOf("\u4E2D\u56FDA", CharacterSet::utf8), 5);
  EXPECT_EQ(glyphsOf("\u4E2D", CharacterSet::utf8).front().columns, 2);
}

TEST_F(GlyphTest, MarksBelongToTheCharacterBeforeThem) {
  const auto glyphs = glyphsOf("e\u0301\u0302\u0303x", CharacterSet::utf8);
  ASSERT_EQ(glyphs.size(), 2U);
  EXPECT_EQ(textOf(glyphs[0]), "e\u0301\u0302");  // and no more than two
  EXPECT_EQ(widthOf("\u0301", CharacterSet::utf8), 1);
}

TEST_F(GlyphTest, AsciiHasSignsForOurOwn) {
  EXPECT_EQ(shown("\u221295 dBm \u2198 \u25CF \u2581\u2588", CharacterSet::ascii), "-95 dBm \\ * _#");
  std::setlocale(LC_CTYPE, "C");
  EXPECT_EQ(shown("\u25CF", CharacterSet::ascii), "*");
  EXPECT_EQ(shown("M\u00FCnchen \u4E2D", CharacterSet::ascii), "M?nchen ?");
}

}  // namespace
}  // namespace kelvasi::terminal
