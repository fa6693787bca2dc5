// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/RecordOutput.h"

#include <gtest/gtest.h>

#include <array>

#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {
namespace {

using namespace std::chrono_literals;
using Format = RecordOutput::Format;

constexpr std::array columns{
    Column{.key = "time", .width = 19, .isTime = true},
    Column{.key = "cell_id", .width = 8},
    Column{.key = "mean", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "roles", .width = 10},
    Column{.key = "hidden"},
};

Json oneRecord() {
  return {{"time", "2024-03-05T14:07:09.250000Z"},
          {"cell_id", "a \"b\", c"},
          {"mean", -95.26},
          {"roles", {"serving", "active"}},
          {"hidden", nullptr}};
}

std::string printed(Format format, std::initializer_list<Json> records) {
  std::string text;
  RecordOutput output(format, columns, [&](std::string_view more) { text += more; });
  output.begin();
  for (const Json& record : records) output.print(record);
  return text;
}

TEST(RecordOutput, ATableHasItsColumns) {
  EXPECT_EQ(printed(Format::table, {oneRecord(), Json::object()}),
            "time                 cell id     mean  roles\n"
            "2024-03-05 14:07:09  a \"b\", c   -95.3  serving active\n"
            "\n");
}

TEST(RecordOutput, ColumnsAreAsWideAsTheirRecords) {
  const std::array<Json, 2> records{oneRecord(), Json{{"cell_id", "Télé 1234"}, {"mean", -1234.56}}};
  const auto wide = fitted(columns, records);
  std::vector<std::size_t> widths;
  for (const Column& column : wide) widths.push_back(column.width);
  EXPECT_EQ(widths, (std::vector<std::size_t>{19, 9, 7, 14, 0}));
}

TEST(RecordOutput, ATableObeysNoTerminalCodes) {
  EXPECT_EQ(printed(Format::table, {Json{{"cell_id", "\x1b[2J\n"}}}).substr(45),
            "                     ?[2J?\n");
}

TEST(RecordOutput, ATableStandsStraightWithLettersOfSeveralBytes) {
  EXPECT_EQ(printed(Format::table, {Json{{"cell_id", "Télé"}, {"mean", 1.0}}}).substr(45),
            "                     Télé         1.0\n");
}

TEST(RecordOutput, NdjsonIsTheRecord) {
  EXPECT_EQ(printed(Format::ndjson, {oneRecord()}),
            R"({"time":"2024-03-05T14:07:09.250000Z","cell_id":"a \"b\", c","mean":-95.26,)"
            R"("roles":["serving","active"],"hidden":null})"
            "\n");
}

TEST(RecordOutput, CsvFollowsItsStandard) {
  EXPECT_EQ(printed(Format::csv, {oneRecord(), Json::object()}),
            "time,cell_id,mean,roles,hidden\r\n"
            "2024-03-05T14:07:09.250000Z,\"a \"\"b\"\", c\",-95.26,serving active,\r\n"
            ",,,,\r\n");
}

TEST(RecordOutput, TheHeadingStandsWithoutARecordToo) {
  EXPECT_EQ(printed(Format::csv, {}), "time,cell_id,mean,roles,hidden\r\n");
  EXPECT_EQ(printed(Format::table, {}), "time                 cell id     mean  roles\n");
  EXPECT_EQ(printed(Format::ndjson, {}), "");
}

TEST(RecordText, TimesHaveMicroseconds) {
  EXPECT_EQ(rfc3339(0ns), "1970-01-01T00:00:00.000000Z");
  EXPECT_EQ(rfc3339(1709647629250ms), "2024-03-05T14:07:09.250000Z");
  EXPECT_EQ(rfc3339(1709647629s + 999ns), "2024-03-05T14:07:09.000000Z");
  EXPECT_EQ(rfc3339(1709647629s + 1999ns), "2024-03-05T14:07:09.000001Z");
}

TEST(RecordText, FieldsOfCsvAreQuotedWhereTheyMustBe) {
  EXPECT_EQ(csvField("plain text"), "plain text");
  EXPECT_EQ(csvField(""), "");
  EXPECT_EQ(csvField("a,b"), "\"a,b\"");
  EXPECT_EQ(csvField("a\nb"), "\"a\nb\"");
  EXPECT_EQ(csvField("a\"b"), "\"a\"\"b\"");
}

}  // namespace
}  // namespace kelvasi
