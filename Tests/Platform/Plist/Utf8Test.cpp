// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/Utf8.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using namespace std::string_view_literals;

TEST(Utf8, ReadsCharactersOfEveryLength) {
  EXPECT_EQ(firstCharacter("a").code, U'a');
  EXPECT_EQ(firstCharacter("\xc3\xa9").code, U'\u00e9');
  EXPECT_EQ(firstCharacter("\xe6\xbc\xa2").code, U'\u6f22');
  EXPECT_EQ(firstCharacter("\xf0\x9f\x98\x80").code, U'\U0001F600');
  EXPECT_EQ(firstCharacter("\xf4\x8f\xbf\xbf").length, 4u);
}

TEST(Utf8, RefusesWhatIsNoCharacter) {
  for (const std::string_view text : {"\x80"sv, "\xff"sv, "\xc3"sv, "\xc3("sv, "\xe6\xbc"sv,
                                      "\xc1\xbf"sv,  // longer than needed
                                      "\xe0\x9f\xbf"sv, "\xf0\x8f\xbf\xbf"sv,
                                      "\xed\xa0\x80"sv,         // a surrogate
                                      "\xf4\x90\x80\x80"sv}) {  // beyond Unicode
    EXPECT_EQ(firstCharacter(text).code, std::nullopt) << text;
    EXPECT_EQ(firstCharacter(text).length, 1u);
  }
}

TEST(Utf8, CleanTextHasNoNul) {
  EXPECT_TRUE(isCleanUtf8(""));
  EXPECT_TRUE(isCleanUtf8("a\x01\xc3\xa9"));
  EXPECT_FALSE(isCleanUtf8("a\0b"sv));
  EXPECT_FALSE(isCleanUtf8("a\xc3"));
}

TEST(Utf8, XmlTextKeepsWhatXmlHolds) {
  EXPECT_EQ(asXmlText("a\t\r\n<&>\xc3\xa9\U0001F600"), "a\t\r\n<&>\xc3\xa9\U0001F600");
}

TEST(Utf8, XmlTextReplacesTheRest) {
  EXPECT_EQ(asXmlText("a\0b"sv), "a\uFFFDb");
  EXPECT_EQ(asXmlText("\x01\x1f\x7f"), "\uFFFD\uFFFD\x7f");
  EXPECT_EQ(asXmlText("\uFFFE\uFFFF"), "\uFFFD\uFFFD");
  EXPECT_EQ(asXmlText("\xe6\xbc(\xff"), "\uFFFD\uFFFD(\uFFFD");
}

}  // namespace
}  // namespace kelvasi
