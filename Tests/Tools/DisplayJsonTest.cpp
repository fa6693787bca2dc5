// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/DisplayJson.h"

#include <gtest/gtest.h>

#include <limits>

#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

// Of a value inside an array, without the array.
std::string json(const PlistValue& value) {
  const std::string line = tickJson(0, value);
  const std::string start = R"({"time":0.0,"display":)";
  EXPECT_EQ(line.substr(0, start.size()), start);
  return line.substr(start.size(), line.size() - start.size() - 2);
}

TEST(DisplayJson, KeepsTheOrderOfKeys) {
  EXPECT_EQ(
      json(PlistDictionary::make({{"b", "1"}, {"a", PlistDictionary::make()}, {"_", PlistArray::make()}})),
      R"({"b":"1","a":{},"_":[]})");
}

TEST(DisplayJson, TellsIntegersFromReals) {
  EXPECT_EQ(json(PlistArray::make({1, -1, 1.0, 0.5, 1e20, std::numeric_limits<std::int64_t>::min()})),
            "[1,-1,1.0,0.5,1e+20,-9223372036854775808]");
  EXPECT_EQ(json(PlistArray::make({~std::uint64_t{0}})), "[18446744073709551615]");
}

TEST(DisplayJson, WritesRealsThatJsonCannotHoldAsTexts) {
  constexpr double infinity = std::numeric_limits<double>::infinity();
  EXPECT_EQ(json(PlistArray::make({std::numeric_limits<double>::quiet_NaN(), infinity, -infinity})),
            R"(["nan","inf","-inf"])");
}

TEST(DisplayJson, WritesBooleansAndTheAbsentValue) {
  EXPECT_EQ(json(PlistArray::make({true, false})), "[true,false]");
  EXPECT_EQ(json(PlistValue()), "null");
}

// Examples of RFC 4648, section 10.
TEST(DisplayJson, WritesDataInBase64) {
  const auto data = [](std::string_view text) { return json(Bytes(text.begin(), text.end())); };
  EXPECT_EQ(data(""), R"({"$data":""})");
  EXPECT_EQ(data("f"), R"({"$data":"Zg=="})");
  EXPECT_EQ(data("fo"), R"({"$data":"Zm8="})");
  EXPECT_EQ(data("foo"), R"({"$data":"Zm9v"})");
  EXPECT_EQ(data("foobar"), R"({"$data":"Zm9vYmFy"})");
  EXPECT_EQ(json(test::hex("FBEFFF")), R"({"$data":"++//"})");
}

TEST(DisplayJson, WritesDatesInUtcWithoutTheirFraction) {
  EXPECT_EQ(json(PlistDate{1709647629.75}), R"({"$date":"2024-03-05T14:07:09Z"})");
  EXPECT_EQ(json(PlistDate{-1}), R"({"$date":"1969-12-31T23:59:59Z"})");
}

TEST(DisplayJson, KeepsAbsurdDatesWithinTheCalendar) {
  EXPECT_EQ(json(PlistDate{1e300}), R"({"$date":"9999-12-31T23:59:59Z"})");
  EXPECT_EQ(json(PlistDate{-1e300}), R"({"$date":"0001-01-01T00:00:00Z"})");
  EXPECT_EQ(json(PlistDate{std::numeric_limits<double>::quiet_NaN()}), R"({"$date":"1970-01-01T00:00:00Z"})");
}

TEST(DisplayJson, EscapesTextsAndReplacesWhatIsNotUtf8) {
  EXPECT_EQ(json("\"\\\n\x01 caf\xC3\xA9"), R"("\"\\\n\u0001 café")");
  EXPECT_EQ(json("a\xFFz"), "\"a\xEF\xBF\xBDz\"");
  EXPECT_EQ(json(PlistDictionary::make({{"\xFF", "1"}})), "{\"\xEF\xBF\xBD\":\"1\"}");
}

TEST(DisplayJson, IsIndentedByOneBlankALevel) {
  EXPECT_EQ(displayJson(PlistDictionary::make({{"a", PlistArray::make({"b"})}})),
            "{\n \"a\": [\n  \"b\"\n ]\n}\n");
  EXPECT_EQ(displayJson(PlistValue()), "null\n");
}

TEST(DisplayJson, KeepsTheTimesMicroseconds) {
  EXPECT_EQ(tickJson(1709647629.123456, PlistValue()), "{\"time\":1709647629.123456,\"display\":null}\n");
}

}  // namespace
}  // namespace kelvasi
