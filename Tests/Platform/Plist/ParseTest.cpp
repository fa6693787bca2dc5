// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include <limits>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/BinaryDocument.h"
#include "Tests/Platform/Plist/PlistSamples.h"

namespace kelvasi {
namespace {

using namespace std::string_literals;
using namespace std::string_view_literals;
using testing::BinaryDocument;
using testing::bytesOf;
using testing::canonical;
using testing::inArrays;
using testing::xmlPlist;

std::optional<PlistValue> parse(std::span<const std::uint8_t> bytes) {
  return LibplistSerialiser().parse(bytes);
}

// The absent value when the document is refused.
PlistValue xml(std::string_view body) {
  const auto value = parse(bytesOf(xmlPlist(body)));
  return value ? *value : PlistValue();
}

PlistValue binary(const Bytes& object) {
  const auto value = parse(BinaryDocument().add(object).bytes());
  return value ? *value : PlistValue();
}

TEST(Parse, XmlScalars) {
  EXPECT_EQ(xml("<string>a &lt;&amp;&#233;&gt;</string>"), PlistValue("a <&é>"));
  EXPECT_EQ(xml("<string/>"), PlistValue(""));
  EXPECT_EQ(xml("<integer>-5</integer>"), PlistValue(-5));
  EXPECT_EQ(xml("<integer>0x10</integer>"), PlistValue(16));
  EXPECT_EQ(xml("<real>-95.25</real>"), PlistValue(-95.25));
  EXPECT_EQ(xml("<true/>"), PlistValue(true));
  EXPECT_EQ(xml("<false/>"), PlistValue(false));
  EXPECT_EQ(xml("<data>\n\tAAH/\n</data>"), PlistValue(Bytes{0, 1, 255}));
  EXPECT_EQ(xml("<data/>"), PlistValue(Bytes{}));
  EXPECT_EQ(xml("<date>2024-03-05T14:07:09Z</date>"), PlistValue(PlistDate{1709647629}));
}

TEST(Parse, DatesFarFromNow) {
  EXPECT_EQ(xml("<date>2100-01-01T00:00:00Z</date>"), PlistValue(PlistDate{4102444800}));
  EXPECT_EQ(xml("<date>1601-01-01T00:00:00Z</date>"), PlistValue(PlistDate{-11644473600}));
}

TEST(Parse, TextIsTakenAsItStands) {
  EXPECT_EQ(xml("<string>  a\n\tb  </string>"), PlistValue("  a\n\tb  "));
  EXPECT_EQ(xml("<string>a<!-- no -->b<![CDATA[<&]]></string>"), PlistValue("ab<&"));
  EXPECT_EQ(xml("<string>a\x01&#2;b</string>"), PlistValue("a\x01\x02"
                                                           "b"));
}

TEST(Parse, XmlContainersInStoredOrder) {
  EXPECT_EQ(canonical(xml("<dict><key>b</key><array><true/><string>x</string></array>"
                          "<key>a</key><dict/><key></key><array/></dict>")),
            "{s62=[true,s78,],s61={},s=[],}");
}

TEST(Parse, TheLastOfEqualKeysStandsAtThePlaceOfTheFirst) {
  EXPECT_EQ(canonical(xml("<dict><key>a</key><integer>1</integer><key>b</key><integer>2</integer>"
                          "<key>a</key><integer>3</integer></dict>")),
            "{s61=i3,s62=i2,}");
  const auto document = BinaryDocument().addDictionary({1, 2, 1, 3, 4, 5}).addText("a").addText("b");
  EXPECT_EQ(canonical(*parse(BinaryDocument(document).add({0x10, 1}).add({0x10, 2}).add({0x10, 3}).bytes())),
            "{s61=i3,s62=i2,}");
}

TEST(Parse, BinaryScalars) {
  EXPECT_EQ(binary({0x08}), PlistValue(false));
  EXPECT_EQ(binary({0x09}), PlistValue(true));
  EXPECT_EQ(binary({0x10, 0xff}), PlistValue(255));
  EXPECT_EQ(binary({0x11, 0x12, 0x34}), PlistValue(0x1234));
  EXPECT_EQ(binary({0x12, 0xff, 0xff, 0xff, 0xff}), PlistValue(4294967295));
  EXPECT_EQ(binary({0x13, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xfe}), PlistValue(-2));
  EXPECT_EQ(binary({0x22, 0x3f, 0xc0, 0, 0}), PlistValue(1.5));
  EXPECT_EQ(binary({0x23, 0xbf, 0xf8, 0, 0, 0, 0, 0, 0}), PlistValue(-1.5));
  EXPECT_EQ(binary({0x43, 0, 1, 255}), PlistValue(Bytes{0, 1, 255}));
  EXPECT_EQ(binary({0x40}), PlistValue(Bytes{}));
  EXPECT_EQ(binary({0x50}), PlistValue(""));
  EXPECT_EQ(binary({0x52, 'h', 'i'}), PlistValue("hi"));
  EXPECT_EQ(binary({0x63, 0x00, 0xe9, 0xd8, 0x3d, 0xde, 0x00}), PlistValue("é\U0001F600"));
}

TEST(Parse, BinaryDatesKeepTheirFraction) {
  EXPECT_EQ(binary({0x33, 0x3f, 0xf8, 0, 0, 0, 0, 0, 0}), PlistValue(PlistDate{978307201.5}));
  EXPECT_EQ(binary({0x33, 0xbf, 0xf8, 0, 0, 0, 0, 0, 0}), PlistValue(PlistDate{978307198.5}));
  EXPECT_EQ(binary({0x33, 0x42, 0x4d, 0x62, 0xd2, 0x3c, 0x7f, 0x80, 0}), PlistValue(PlistDate{253402300799}));
}

TEST(Parse, IntegersBeyondTheSignedOnesAreUnsigned) {
  constexpr std::uint64_t largest = std::numeric_limits<std::uint64_t>::max();
  constexpr std::uint64_t first = std::uint64_t{1} << 63;
  EXPECT_EQ(xml("<integer>18446744073709551615</integer>"), PlistValue(largest));
  EXPECT_EQ(xml("<integer>9223372036854775808</integer>"), PlistValue(first));
  EXPECT_EQ(xml("<integer>0xffffffffffffffff</integer>"), PlistValue(largest));
  EXPECT_EQ(binary({0x14, 0, 0, 0, 0, 0, 0, 0, 0, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff}),
            PlistValue(largest));
  EXPECT_EQ(binary({0x14, 0, 0, 0, 0, 0, 0, 0, 0, 0x80, 0, 0, 0, 0, 0, 0, 0}), PlistValue(first));
}

TEST(Parse, IntegersUpToThemAreSigned) {
  using Limits = std::numeric_limits<std::int64_t>;
  EXPECT_EQ(xml("<integer>-1</integer>"), PlistValue(-1));
  EXPECT_EQ(xml("<integer>9223372036854775807</integer>"), PlistValue(Limits::max()));
  EXPECT_EQ(xml("<integer>-9223372036854775808</integer>"), PlistValue(Limits::min()));
  EXPECT_EQ(binary({0x13, 0x80, 0, 0, 0, 0, 0, 0, 0}), PlistValue(Limits::min()));
  EXPECT_EQ(binary({0x13, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff}), PlistValue(-1));
  EXPECT_EQ(binary({0x14, 0, 0, 0, 0, 0, 0, 0, 0, 0x7f, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff}),
            PlistValue(Limits::max()));
}

TEST(Parse, PaddingBehindAnXmlDocumentIsForgiven) {
  const std::string document = xmlPlist("<true/>");
  for (const std::string_view padding : {"\0"sv, "\0\0\0"sv, " "sv, "\n\n"sv, "\r\n\t \0\n\0"sv}) {
    EXPECT_EQ(parse(bytesOf(document + std::string(padding))), PlistValue(true)) << padding.size();
  }
  EXPECT_EQ(parse(bytesOf(document + std::string(100'000, '\0'))), PlistValue(true));
}

TEST(Parse, PaddingBehindABinaryDocumentIsForgiven) {
  const Bytes document = BinaryDocument().addText("hi").bytes();
  for (const std::uint8_t padding : Bytes{'\0', ' ', '\n', '\r', '\t'}) {
    Bytes padded = document;
    for (int count = 1; count <= 40; ++count) {
      padded.push_back(padding);
      EXPECT_EQ(parse(padded), PlistValue("hi")) << count << " of " << unsigned{padding};
    }
  }
}

// Nine objects, the first of them the top one, and a table at byte 32: all of the trailer looks like padding,
// but for the sizes.
TEST(Parse, PaddingIsToldFromATrailerThatLooksLikeIt) {
  const std::string document = "bplist00\xa2\x01\x02\x09\x08"s + std::string(19, '\x09') +  // [true, false]
                               "\x08\x0b\x0c\x0d\x0e\x0f\x10\x11\x12"s +  // where objects are
                               "\0\0\0\0\0\0\x01\x01"s +                  // the sizes
                               "\0\0\0\0\0\0\0\x09\0\0\0\0\0\0\0\0\0\0\0\0\0\0\0\x20"s;
  for (const std::size_t count : {0u, 1u, 24u, 25u, 100'000u}) {
    const auto value = parse(bytesOf(document + std::string(count, '\0')));
    ASSERT_TRUE(value) << count;
    EXPECT_EQ(canonical(*value), "[true,false,]") << count;
  }
}

TEST(Parse, NothingElseBehindADocumentIsForgiven) {
  const std::string document = xmlPlist("<true/>");
  for (const std::string_view rest :
       {"x"sv, "\0x"sv, "\xff"sv, "\x01"sv, "\f"sv, "\v"sv, "<"sv, "\0<true/>"sv}) {
    EXPECT_EQ(parse(bytesOf(document + std::string(rest))), std::nullopt) << rest.size();
  }
  Bytes binary = BinaryDocument().addText("hi").bytes();
  binary.push_back('x');
  EXPECT_EQ(parse(binary), std::nullopt);
}

TEST(Parse, PaddingElsewhereIsNotForgiven) {
  EXPECT_EQ(parse(bytesOf("\0"s + xmlPlist("<true/>"))), std::nullopt);
  EXPECT_EQ(parse(bytesOf("<plist><true/>\0</plist>"s)), std::nullopt);
  EXPECT_EQ(parse(bytesOf("<plist><string>a\0</string></plist>"s)), std::nullopt);
  EXPECT_EQ(parse(bytesOf("<plist>\0\0"s)), std::nullopt);
  EXPECT_EQ(parse(bytesOf(std::string(1000, '\0'))), std::nullopt);
}

TEST(Parse, AnEmptyKeyMayBeAnEmptyTag) {
  EXPECT_EQ(canonical(xml("<dict><key/><true/><key>a</key><string>b</string></dict>")), "{s=true,s61=s62,}");
  EXPECT_EQ(canonical(xml("<array><dict><key /><dict><key\n/><string/></dict></dict></array>")),
            "[{s={s=s,},},]");
  EXPECT_EQ(canonical(xml("<dict><key/><true/><key></key><false/></dict>")), "{s=false,}");
}

TEST(Parse, WhatLooksLikeAnEmptyKeyInATextIsText) {
  EXPECT_EQ(xml("<string><![CDATA[<key/>]]></string>"), PlistValue("<key/>"));
  EXPECT_EQ(xml("<string>&lt;key/><!-- <key/> --></string>"), PlistValue("<key/>"));
  EXPECT_EQ(canonical(xml("<dict><key/><string><![CDATA[<key/>]]></string></dict>")), "{s=s3c6b65792f3e,}");
}

TEST(Parse, BinaryContainersShareTheirObjects) {
  EXPECT_EQ(
      canonical(*parse(
          BinaryDocument().addDictionary({1, 2, 3, 3}).addText("b").addText("a").addArray({1, 1}).bytes())),
      "{s62=[s62,s62,],s61=[s62,s62,],}");
}

TEST(Parse, ADictionaryWithAReservedKeyIsADictionary) {
  EXPECT_EQ(canonical(xml("<dict><key>CF$UID</key><integer>7</integer></dict>")), "{s434624554944=i7,}");
  EXPECT_EQ(canonical(xml("<dict><key>CF$UID</key><integer>-7</integer></dict>")), "{s434624554944=i-7,}");
  EXPECT_EQ(canonical(xml("<dict><key>CF$UID</key><string>7</string></dict>")), "{s434624554944=s37,}");
}

TEST(Parse, AByteOrderMarkIsSkipped) {
  EXPECT_EQ(parse(bytesOf("\xef\xbb\xbf" + xmlPlist("<true/>"))), PlistValue(true));
}

TEST(Parse, RefusesEverythingElse) {
  for (const std::string_view text : {"", "x", "<", "b", "\xef\xbb\xbf", "bplist00", "{\"a\":1}",
                                      "{ a = 1; }", "[1]", "(a)", "<?xml version=\"1.0\"?>", "\"text\""}) {
    EXPECT_EQ(parse(bytesOf(text)), std::nullopt) << text;
  }
}

TEST(Parse, RefusesEveryCutOfADocument) {
  const std::string document = xmlPlist("<dict><key>a</key><data>AAH/</data></dict>");
  ASSERT_TRUE(parse(bytesOf(document)));
  for (std::size_t size = 0; size + 1 < document.size(); ++size) {  // the last byte is a line feed
    EXPECT_EQ(parse(bytesOf(document.substr(0, size))), std::nullopt) << size;
  }
}

TEST(Parse, NestingIsBoundedInBothFormats) {
  EXPECT_TRUE(parse(bytesOf(xmlPlist(inArrays(128)))));
  EXPECT_FALSE(parse(bytesOf(xmlPlist(inArrays(129)))));
  EXPECT_FALSE(parse(bytesOf(xmlPlist(inArrays(200'000)))));
  EXPECT_FALSE(parse(BinaryDocument().addArray({0}).bytes()));
}

TEST(Parse, TakesManyEntriesAndElements) {
  std::string body;
  for (int number = 0; number < 10'000; ++number) {
    body += "<key>" + std::to_string(number) + "</key><integer>" + std::to_string(number) + "</integer>";
  }
  const PlistValue value = xml("<dict>" + body + "</dict>");
  ASSERT_EQ(value.dictionary()->size(), 10'000u);
  EXPECT_EQ(value.dictionary()->get("9999"), PlistValue(9999));
  EXPECT_EQ(std::next(value.dictionary()->begin(), 777)->first, "777");
}

}  // namespace
}  // namespace kelvasi
