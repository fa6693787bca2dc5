#include "LogGenerator/Row.h"

#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using namespace std::string_view_literals;

constexpr std::array layout{
    Field{.name = "signed", .byte = 13, .isSigned = true},
    Field{.name = "word", .byte = 14, .width = 32},
};
constexpr std::size_t signedByte = indexIn(layout, "signed");
constexpr std::size_t word = indexIn(layout, "word");
constexpr std::array texts{"Off"sv, "On"sv};

std::string shown(const Row& row, std::string_view payload) {
  const Bytes bytes = test::record(0x1234, payload);
  const auto rows = PlistDictionary::make();
  RowWriter writer(*rows);
  show(RecordView(bytes), layout, std::span(&row, 1), writer);
  return *rows->get(row.key).string();
}

TEST(Row, ShowsANumberWithItsUnit) {
  EXPECT_EQ(shown({.key = "k", .field = signedByte}, "80"), "-128");
  EXPECT_EQ(shown({.key = "k", .field = signedByte, .unit = " dB"}, "05"), "5 dB");
  EXPECT_EQ(shown({.key = "k", .field = signedByte, .unit = " dBm", .factor = 2, .offset = -140}, "01"),
            "-138 dBm");
}

TEST(Row, ShowsA32BitWordSignedUnlessSaidOtherwise) {
  EXPECT_EQ(shown({.key = "k", .field = word}, "00 FFFFFFFF"), "-1");
  EXPECT_EQ(shown({.key = "k", .field = word, .isUnsigned = true}, "00 FFFFFFFF"), "4294967295");
}

TEST(Row, ShowsTheTextOfAValueAndUnknownPastTheTexts) {
  const Row row{.key = "k", .field = word, .texts = texts};
  EXPECT_EQ(shown(row, "00 00000000"), "Off");
  EXPECT_EQ(shown(row, "00 01000000"), "On");
  EXPECT_EQ(shown(row, "00 02000000"), "Unknown");
  EXPECT_EQ(shown(row, "00 FFFFFFFF"), "Unknown");
  EXPECT_EQ(shown({.key = "k", .field = word, .texts = texts, .otherwise = "??"}, "00 02000000"), "??");
}

TEST(Row, AFlagShowsItsSecondTextForEveryValueButZero) {
  const Row row{.key = "k", .field = word, .texts = texts, .isFlag = true};
  EXPECT_EQ(shown(row, "00 00000000"), "Off");
  EXPECT_EQ(shown(row, "00 000000FF"), "On");
}

TEST(Row, ASpecialValueGoesBeforeEverythingElse) {
  const Row row{.key = "k", .field = word, .special = ValueText{64, "Not Present"}, .offset = -30};
  EXPECT_EQ(shown(row, "00 40000000"), "Not Present");
  EXPECT_EQ(shown(row, "00 41000000"), "35");
}

TEST(Row, ShowsAMeasurementInTheFormatOfItsScale) {
  const Row row{.key = "k", .field = word, .unit = " dBm", .scale = Scale{0.25, -140}};
  EXPECT_EQ(shown(row, "00 40010000"), "-60.00 dBm");
  EXPECT_EQ(shown(row, "00 31020000"), "0.25 dBm");
  EXPECT_EQ(shown({.key = "k", .field = signedByte, .unit = " dB", .scale = Scale{0.5, 0, "%f"}}, "F9"),
            "-3.500000 dB");
  EXPECT_EQ(shown(row, "00 FFFFFFFF"), "1073741683.75 dBm");
}

TEST(RowWriter, WritingAnewLeavesExactlyWhatWasWritten) {
  PlistDictionary rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  { RowWriter(rows, Rows::anew).text("b", "9"); }
  EXPECT_EQ(test::asText(std::make_shared<PlistDictionary>(rows)), "b=9\n");
}

TEST(RowWriter, WritingAnewTakesNoOrderFromBefore) {
  PlistDictionary rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  {
    RowWriter writer(rows, Rows::anew);
    writer.text("a", "1");
    writer.text("c", "4");
    writer.value("b", PlistArray::make());
    writer.text("d", "5");
  }
  EXPECT_EQ(test::asText(std::make_shared<PlistDictionary>(rows)), "a=1\nc=4\nb=\nd=5\n");
}

TEST(RowWriter, KeepingRowsOverwritesThemWhereTheyStand) {
  PlistDictionary rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  {
    RowWriter writer(rows);
    writer.number("c", 4294967295);
    writer.number("a", 7);
    writer.text("d", "new");
  }
  EXPECT_EQ(test::asText(std::make_shared<PlistDictionary>(rows)), "a=7\nb=2\nc=-1\nd=new\n");
}

}  // namespace
}  // namespace kelvasi
