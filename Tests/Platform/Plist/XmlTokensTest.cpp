#include "Platform/Plist/XmlTokens.h"

#include <gtest/gtest.h>

#include <string>

namespace kelvasi {
namespace {

// One line for each token, down to the end or to what is malformed.
std::string tokensOf(std::string_view document) {
  constexpr const char* names[] = {"start",   "empty",       "end of", "text", "cdata",
                                   "comment", "instruction", "<!",     "end",  "malformed"};
  XmlTokens tokens(document);
  std::string lines;
  while (true) {
    const XmlToken token = tokens.next();
    lines += std::string(names[static_cast<int>(token.kind)]) + " " + std::string(token.text);
    if (!token.attributes.empty()) lines += " | " + std::string(token.attributes);
    lines += '\n';
    if (token.kind == XmlToken::Kind::end || token.kind == XmlToken::Kind::malformed) return lines;
  }
}

TEST(XmlTokens, TagsHaveNamesAndAttributes) {
  EXPECT_EQ(tokensOf("<plist version=\"1.0\" ><a\n/><true/></plist >"),
            "start plist | version=\"1.0\"\nempty a\nempty true\nend of plist\nend \n");
}

TEST(XmlTokens, TextsRunUpToTheNextMarkup) {
  EXPECT_EQ(tokensOf("x<k> a&amp;b </k>"), "text x\nstart k\ntext  a&amp;b \nend of k\nend \n");
}

TEST(XmlTokens, EnclosuresEndAtTheirOwnClosing) {
  EXPECT_EQ(tokensOf("<?xml a>b?><!DOCTYPE p \"x\"><!-- <a> --><![CDATA[ ]] </a> ]]>"),
            "instruction xml a>b\n<! DOCTYPE p \"x\"\ncomment  <a> \ncdata  ]] </a> \nend \n");
}

TEST(XmlTokens, WhatHasNoEndIsMalformed) {
  for (const char* document : {"<", "<a", "<a <b>", "<!-- ", "<!-->", "<![CDATA[ ]", "<?xml", "<!DOCTYPE"}) {
    EXPECT_EQ(tokensOf(document), "malformed \n") << document;
  }
}

TEST(XmlTokens, OddTagsHaveOddNames) {
  EXPECT_EQ(tokensOf("<>"), "start \nend \n");
  EXPECT_EQ(tokensOf("</>"), "end of \nend \n");
  EXPECT_EQ(tokensOf("</ a>"), "end of  a\nend \n");
  EXPECT_EQ(tokensOf("< a>"), "start  | a\nend \n");
}

}  // namespace
}  // namespace kelvasi
