// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/XmlReader.h"

#include <gtest/gtest.h>

#include "Platform/Plist/PlistLimits.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

using testing::inArrays;
using testing::xmlPlist;

bool reads(std::string_view document) {
  return readXmlPlist(document).has_value();
}

std::string repeated(std::size_t count, const std::string& text) {
  std::string result;
  for (std::size_t place = 0; place < count; ++place) result += text;
  return result;
}

std::string entries(std::size_t count) {
  std::string result;
  for (std::size_t place = 0; place < count; ++place)
    result += "<key>" + std::to_string(place) + "</key><true/>";
  return result;
}

TEST(XmlReader, AcceptsEveryElement) {
  EXPECT_TRUE(reads(xmlPlist(
      "<dict><key>a</key><array><string>x</string><integer>1</integer><real>1.5</real><true/><false/></array>"
      "<key></key><dict/><key>d</key><data>QUJD</data><key>t</key><date>2024-03-05T14:07:09Z</date></"
      "dict>")));
}

TEST(XmlReader, AcceptsWhatMayStandBetweenElements) {
  EXPECT_TRUE(reads(
      "<?xml version='1.0'?> <!-- one --> <!DOCTYPE plist PUBLIC \"-//X//DTD PLIST 1.0//EN\" "
      "\"http://x/y.dtd\">\n"
      "<plist>\n<!-- two --><dict> <key>a<!-- three -->b</key> <string><![CDATA[<&]]>c</string></dict>\n"
      "</plist>\n<!-- four -->\n"));
}

TEST(XmlReader, RefusesWhatIsNoPlistDocument) {
  for (const char* document :
       {"", " ", "x", "<", "<plist", "<plist>", "<plist/>", "<plist></plist>", "<html></html>", "<true/>",
        "{\"a\": 1}", "( a, b )", "<plist><true/></plist>x", "<plist><true/></plist><true/>",
        "<plist><true/><true/></plist>", "<plist><true/>", "<plist evil=\"1\"><true/></plist>"}) {
    EXPECT_FALSE(reads(document)) << document;
  }
}

TEST(XmlReader, RefusesElementsOutOfPlace) {
  for (const char* body : {"<unknown/>",
                           "<key>a</key>",
                           "<array><key>a</key></array>",
                           "<dict><string>a</string></dict>",
                           "<dict><key>a</key></dict>",
                           "<dict><key>a</key><key>b</key></dict>",
                           "<dict><key/></dict>",
                           "<key/>",
                           "<dict><key a=\"b\"/><true/></dict>",
                           "<array></dict>",
                           "<array><true/></array></array>",
                           "<array>text</array>",
                           "<string><true/></string>",
                           "<integer>1<!-- c --></integer>",
                           "<integer><![CDATA[1]]></integer>",
                           "<true>x</true>",
                           "<integer/>",
                           "<true a=\"b\"/>",
                           "<?pi?><true/>",
                           "<array><![CDATA[]]></array>",
                           "<array><?pi?></array>"}) {
    EXPECT_FALSE(reads(xmlPlist(body))) << body;
  }
}

TEST(XmlReader, RefusesDeclarationsOfItsOwn) {
  const std::string body = "<plist><string>a</string></plist>";
  EXPECT_TRUE(reads("<!DOCTYPE plist>" + body));
  for (const char* doctype :
       {"<!DOCTYPE plist [<!ENTITY a \"b\">]>", "<!DOCTYPE plist []>", "<!ENTITY a \"b\">",
        "<!doctype plist>", "<!DOCTYPE plist \"a>", "<!DOCTYPE plist SYSTEM \"a>b\">", "<!ELEMENT a>"}) {
    EXPECT_FALSE(reads(doctype + body)) << doctype;
  }
  EXPECT_FALSE(reads("<plist><string>&a;</string></plist>"));
}

TEST(XmlReader, RefusesOtherEncodings) {
  const std::string body = "<plist><true/></plist>";
  EXPECT_TRUE(reads("<?xml version=\"1.0\" encoding=\"utf-8\"?>" + body));
  EXPECT_FALSE(reads("<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?>" + body));
  EXPECT_FALSE(reads("<?xml version=\"1.0?>" + body));
  EXPECT_FALSE(reads(xmlPlist("<string>\xe9</string>")));
  EXPECT_FALSE(reads(xmlPlist(std::string("<string>a\0b</string>", 20))));
}

TEST(XmlReader, RefusesCommentsReadersDifferOn) {
  for (const char* comment : {"<!-- a -- b -->", "<!-->-->", "<!--->-->", "<!-- a --->", "<!-->"}) {
    EXPECT_FALSE(reads(std::string(comment) + "<plist><true/></plist>")) << comment;
  }
}

TEST(XmlReader, ContainersNestAsDeepAsAllowed) {
  EXPECT_TRUE(reads(xmlPlist(inArrays(128, "<true/>"))));
  EXPECT_FALSE(reads(xmlPlist(inArrays(129))));
  EXPECT_FALSE(reads(xmlPlist(inArrays(128, "<dict/>"))));
  EXPECT_FALSE(reads(xmlPlist(inArrays(200'000))));
  EXPECT_FALSE(reads("<plist>" + repeated(200'000, "<dict><key>a</key>")));
}

TEST(XmlReader, BoundsTheNumberOfValues) {
  const std::size_t elements = plistLimits::values - 1;  // and the array itself
  EXPECT_TRUE(reads(xmlPlist("<array>" + repeated(elements, "<true/>") + "</array>")));
  EXPECT_FALSE(reads(xmlPlist("<array>" + repeated(elements + 1, "<true/>") + "</array>")));
}

TEST(XmlReader, CountsKeysToo) {
  const std::string dictionary = "<dict>" + entries(9'999) + "</dict>";  // 1 + 2 * 9,999 values
  EXPECT_TRUE(reads(xmlPlist("<array>" + repeated(50, dictionary) + "</array>")));
  EXPECT_FALSE(reads(xmlPlist("<array>" + repeated(51, dictionary) + "</array>")));
}

TEST(XmlReader, BoundsTheEntriesOfADictionary) {
  EXPECT_TRUE(reads(xmlPlist("<dict>" + entries(plistLimits::dictionaryEntries) + "</dict>")));
  EXPECT_FALSE(reads(xmlPlist("<dict>" + entries(plistLimits::dictionaryEntries + 1) + "</dict>")));
}

TEST(XmlReader, BoundsTheSize) {
  const std::string frame = xmlPlist("<string></string>");
  const std::string text(plistLimits::documentBytes - frame.size(), 'x');
  EXPECT_TRUE(reads(xmlPlist("<string>" + text + "</string>")));
  EXPECT_FALSE(reads(xmlPlist("<string>" + text + "x</string>")));
}

}  // namespace
}  // namespace kelvasi
