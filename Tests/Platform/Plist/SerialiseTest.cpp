// SPDX-License-Identifier: Apache-2.0
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Tests/Platform/Plist/PlistSamples.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using namespace std::string_view_literals;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::StartsWith;
using testing::textOf;

const LibplistSerialiser serialiser;

// Nothing is "nothing", so that failures show.
std::string xml(const PlistValue& value) {
  const auto bytes = serialiser.serialiseXml(value);
  return bytes ? textOf(*bytes) : "nothing";
}

PlistValue again(const PlistValue& value) {
  const auto read = serialiser.parse(*serialiser.serialiseXml(value));
  return read ? *read : PlistValue();
}

PlistValue inArrays(int levels, PlistValue value) {
  for (int level = 0; level < levels; ++level) value = PlistArray::make({value});
  return value;
}

TEST(Serialise, WritesAnXmlPropertyList) {
  const std::string text = xml(PlistDictionary::make({{"GetTechnology", "GetTechnology"}}));
  EXPECT_THAT(text, StartsWith("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<!DOCTYPE plist "));
  EXPECT_THAT(text, HasSubstr("<plist version=\"1.0\">\n<dict>\n"
                              "\t<key>GetTechnology</key>\n\t<string>GetTechnology</string>\n"
                              "</dict>\n</plist>\n"));
}

TEST(Serialise, WritesEveryKind) {
  EXPECT_THAT(xml(true), HasSubstr("<true/>"));
  EXPECT_THAT(xml(-5), HasSubstr("<integer>-5</integer>"));
  EXPECT_THAT(xml(1.5), HasSubstr("<real>1.5</real>"));
  EXPECT_THAT(xml(PlistDate{1709647629}), HasSubstr("<date>2024-03-05T14:07:09Z</date>"));
  EXPECT_THAT(xml(Bytes{0, 1, 255}), HasSubstr("AAH/"));
  EXPECT_THAT(xml(PlistArray::make()), HasSubstr("<array/>"));
}

// {"A": "x"}: a dictionary of one entry, its key, its value, and where each of them stands.
TEST(Serialise, WritesABinaryPropertyList) {
  const auto bytes = serialiser.serialiseBinary(PlistDictionary::make({{"A", "x"}}));
  EXPECT_EQ(*bytes, test::hex("62706C6973743030 D1 01 02 51 41 51 78 08 0B 0D"
                              "000000000000 01 01 0000000000000003 0000000000000000 000000000000000F"));
}

TEST(Serialise, NothingForWhatIsAbsentInTheBinaryFormatEither) {
  EXPECT_FALSE(serialiser.serialiseBinary(PlistArray::make({1, PlistValue()})));
  EXPECT_FALSE(serialiser.serialiseBinary(inArrays(129, 1)));
}

TEST(Serialise, EscapesTextsAndKeys) {
  EXPECT_THAT(xml("a<b>&c]]>"), HasSubstr("<string>a&lt;b&gt;&amp;c]]&gt;</string>"));
  EXPECT_THAT(xml(PlistDictionary::make({{"<&>", 1}})), HasSubstr("<key>&lt;&amp;&gt;</key>"));
  EXPECT_EQ(again("&lt; <![CDATA[x]]> <!-- --> &#65;"), PlistValue("&lt; <![CDATA[x]]> <!-- --> &#65;"));
}

TEST(Serialise, KeepsCarriageReturns) {
  EXPECT_THAT(xml("a\r\nb"), HasSubstr("<string>a&#13;\nb</string>"));
  EXPECT_EQ(again("a\r\nb\r"), PlistValue("a\r\nb\r"));
}

TEST(Serialise, ReplacesWhatXmlCannotHold) {
  EXPECT_EQ(again("a\0b\x01"sv), PlistValue("a\uFFFDb\uFFFD"));
  EXPECT_EQ(again("\xff\uFFFE"), PlistValue("\uFFFD\uFFFD"));
  EXPECT_EQ(again(PlistDictionary::make({{"k\x02", 1}})),
            PlistValue(PlistDictionary::make({{"k\uFFFD", 1}})));
}

TEST(Serialise, NothingForWhatIsAbsent) {
  EXPECT_EQ(xml(PlistValue()), "nothing");
  EXPECT_EQ(xml(PlistArray::make({1, PlistValue()})), "nothing");
  EXPECT_EQ(xml(PlistDictionary::make({{"a", PlistArray::make({PlistValue()})}})), "nothing");
}

TEST(Serialise, RealsToTheLastDigit) {
  for (const double real : {0.1, 1.0 / 3, -95.123456789012345, 1e22, 1e300, 5e-324, 4503599627370497.5,
                            std::numeric_limits<double>::max(), std::numeric_limits<double>::infinity(),
                            -std::numeric_limits<double>::infinity()}) {
    EXPECT_EQ(again(real), PlistValue(real)) << real;
  }
  EXPECT_TRUE(std::isnan(*again(std::nan("")).real()));
}

TEST(Serialise, MinusZeroLosesItsSign) {
  EXPECT_EQ(again(-0.0), PlistValue(0.0));
  EXPECT_FALSE(std::signbit(*again(-0.0).real()));
}

TEST(Serialise, IntegersFromEndToEnd) {
  for (const std::int64_t integer : {std::numeric_limits<std::int64_t>::min(), std::int64_t{-1},
                                     std::int64_t{0}, std::numeric_limits<std::int64_t>::max()}) {
    EXPECT_EQ(again(integer), PlistValue(integer));
  }
  for (const std::uint64_t integer : {std::uint64_t{1} << 63, ~std::uint64_t{0}}) {
    EXPECT_EQ(again(integer), PlistValue(integer));
  }
}

TEST(Serialise, DatesLoseTheirFractionDownwards) {
  EXPECT_EQ(again(PlistDate{1709647629.75}), PlistValue(PlistDate{1709647629}));
  EXPECT_EQ(again(PlistDate{978307199.5}), PlistValue(PlistDate{978307199}));
  EXPECT_EQ(again(PlistDate{-0.25}), PlistValue(PlistDate{-1}));
}

TEST(Serialise, DatesOfFourDigitYears) {
  EXPECT_THAT(xml(PlistDate{-30610224000}), HasSubstr("<date>1000-01-01T00:00:00Z</date>"));
  EXPECT_THAT(xml(PlistDate{253402300799.5}), HasSubstr("<date>9999-12-31T23:59:59Z</date>"));
  EXPECT_EQ(xml(PlistDate{-30610224000.5}), "nothing");
  EXPECT_EQ(xml(PlistDate{253402300800}), "nothing");
  EXPECT_EQ(xml(PlistDate{std::nan("")}), "nothing");
  EXPECT_EQ(xml(PlistDate{std::numeric_limits<double>::infinity()}), "nothing");
}

TEST(Serialise, DataOfAnySize) {
  EXPECT_EQ(again(Bytes{}), PlistValue(Bytes{}));
  Bytes large(5'000'000);
  for (std::size_t place = 0; place < large.size(); ++place)
    large[place] = static_cast<std::uint8_t>(place * 7);
  EXPECT_EQ(again(large), PlistValue(large));
  EXPECT_EQ(again(inArrays(100, large)), inArrays(100, large));
}

TEST(Serialise, NestingIsBounded) {
  EXPECT_EQ(again(inArrays(128, 1)), inArrays(128, 1));
  EXPECT_EQ(xml(inArrays(129, 1)), "nothing");
  EXPECT_EQ(xml(inArrays(128, PlistDictionary::make())), "nothing");
}

TEST(Serialise, AContainerThatContainsItselfIsRefused) {
  const auto array = PlistArray::make();
  array->append(array);
  EXPECT_EQ(xml(array), "nothing");
  array->removeAll();
}

TEST(Serialise, SharedContainersAreWrittenWhereverTheyStand) {
  const PlistValue shared = PlistArray::make({"x"});
  EXPECT_EQ(again(PlistArray::make({shared, shared})), PlistValue(PlistArray::make({shared, shared})));
}

TEST(Serialise, SharingCannotMultiplyWithoutBounds) {
  PlistValue value = "x";
  for (int level = 0; level < 40; ++level) value = PlistArray::make({value, value});
  EXPECT_EQ(xml(value), "nothing");
}

TEST(Serialise, ContentCannotExceedTheLibrarysLengths) {
  const PlistValue large = Bytes(std::size_t{64} << 20);
  EXPECT_EQ(xml(PlistArray::make({large, large, large, large, "x"})), "nothing");
}

}  // namespace
}  // namespace kelvasi
