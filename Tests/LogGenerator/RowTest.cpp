// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RowWriter.h"

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
  EXPECT_EQ(shown({.key = "k", .quantity = quantity::count, .field = signedByte}, "80"), "-128");
  EXPECT_EQ(shown({.key = "k", .quantity = quantity::count, .field = signedByte, .unit = " dB"}, "05"),
            "5 dB");
  EXPECT_EQ(shown({.key = "k",
                   .quantity = quantity::count,
                   .field = signedByte,
                   .unit = " dBm",
                   .factor = 2,
                   .offset = -140},
                  "01"),
            "-138 dBm");
}

TEST(Row, ShowsA32BitWordSignedUnlessSaidOtherwise) {
  EXPECT_EQ(shown({.key = "k", .quantity = quantity::count, .field = word}, "00 FFFFFFFF"), "-1");
  EXPECT_EQ(
      shown({.key = "k", .quantity = quantity::count, .field = word, .isUnsigned = true}, "00 FFFFFFFF"),
      "4294967295");
}

TEST(Row, ShowsTheTextOfAValueAndUnknownPastTheTexts) {
  const Row row{.key = "k", .quantity = quantity::count, .field = word, .texts = texts};
  EXPECT_EQ(shown(row, "00 00000000"), "Off");
  EXPECT_EQ(shown(row, "00 01000000"), "On");
  EXPECT_EQ(shown(row, "00 02000000"), "Unknown");
  EXPECT_EQ(shown(row, "00 FFFFFFFF"), "Unknown");
  EXPECT_EQ(shown({.key = "k", .quantity = quantity::count, .field = word, .texts = texts, .otherwise = "??"},
                  "00 02000000"),
            "??");
}

TEST(Row, AFlagShowsItsSecondTextForEveryValueButZero) {
  const Row row{.key = "k", .quantity = quantity::count, .field = word, .texts = texts, .isFlag = true};
  EXPECT_EQ(shown(row, "00 00000000"), "Off");
  EXPECT_EQ(shown(row, "00 000000FF"), "On");
}

TEST(Row, ASpecialValueGoesBeforeEverythingElse) {
  const Row row{.key = "k",
                .quantity = quantity::count,
                .field = word,
                .special = ValueText{64, "Not Present"},
                .offset = -30};
  EXPECT_EQ(shown(row, "00 40000000"), "Not Present");
  EXPECT_EQ(shown(row, "00 41000000"), "35");
}

TEST(Row, ShowsAMeasurementInTheFormatOfItsScale) {
  const Row row{
      .key = "k", .quantity = quantity::count, .field = word, .unit = " dBm", .scale = Scale{0.25, -140}};
  EXPECT_EQ(shown(row, "00 40010000"), "-60.00 dBm");
  EXPECT_EQ(shown(row, "00 31020000"), "0.25 dBm");
  EXPECT_EQ(shown({.key = "k",
                   .quantity = quantity::count,
                   .field = signedByte,
                   .unit = " dB",
                   .scale = Scale{0.5, 0, "%f"}},
                  "F9"),
            "-3.500000 dB");
  EXPECT_EQ(shown(row, "00 FFFFFFFF"), "1073741683.75 dBm");
}

constexpr Row rowA{.key = "a", .quantity = quantity::count};
constexpr Row rowB{.key = "b", .quantity = quantity::count};
constexpr Row rowC{.key = "c", .quantity = quantity::count};
constexpr Row rowD{.key = "d", .quantity = quantity::count};

TEST(RowWriter, WritingAnewLeavesExactlyWhatWasWritten) {
  PlistDictionary rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  { RowWriter(rows, {}, Rows::anew).write(rowB, 9); }
  EXPECT_EQ(test::asText(std::make_shared<PlistDictionary>(rows)), "b=9\n");
}

TEST(RowWriter, WritingAnewTakesNoOrderFromBefore) {
  PlistDictionary rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  {
    RowWriter writer(rows, {}, Rows::anew);
    writer.write(rowA, 1);
    writer.write(rowC, 4);
    writer.list("b");
    writer.write(rowD, 5);
  }
  EXPECT_EQ(test::asText(std::make_shared<PlistDictionary>(rows)), "a=1\nc=4\nb=\nd=5\n");
}

TEST(RowWriter, KeepingRowsOverwritesThemWhereTheyStand) {
  PlistDictionary rows{{"a", "1"}, {"b", "2"}, {"c", "3"}};
  {
    RowWriter writer(rows);
    writer.write(rowC, 4294967295);
    writer.write(rowA, 7);
    writer.write(rowD, 8);
    writer.remove("b");
  }
  EXPECT_EQ(test::asText(std::make_shared<PlistDictionary>(rows)), "a=7\nc=-1\nd=8\n");
}

TEST(RowWriter, GathersWhatItWritesAndRemoves) {
  const ReadingSection section{.name = "S", .path = "/S"};
  PlistDictionary rows{{"a", "1"}};
  Readings readings;
  {
    RowWriter writer(rows, {.readings = &readings, .section = &section});
    writer.write(rowB, 2);
    writer.remove("a");
    writer.remove("c");  // is not there
    writer.identify({RadioFamily::gsm, 62, 13});
  }
  ASSERT_EQ(readings.all().size(), 2u);
  EXPECT_EQ(pathOf(readings.all()[0]), "/S/b");
  EXPECT_EQ(textOf(readings.all()[0]), "2");
  EXPECT_EQ(textOf(readings.all()[0].cell), "gsm:62/13");
  EXPECT_EQ(pathOf(readings.all()[1]), "/S/a");
  EXPECT_EQ(readings.all()[1].kind, Reading::Kind::removal);
}

TEST(RowWriter, GathersAnEntryWithoutRowsAsAnEmptyGroup) {
  const ReadingSection section{.name = "S", .path = "/S"};
  PlistDictionary rows;
  Readings readings;
  { const RowWriter writer(rows, {.readings = &readings, .section = &section, .entry = 1}, Rows::anew); }
  ASSERT_EQ(readings.all().size(), 1u);
  EXPECT_EQ(pathOf(readings.all()[0]), "/S/1");
  EXPECT_EQ(textOf(readings.all()[0]), "{}");
}

}  // namespace
}  // namespace kelvasi
