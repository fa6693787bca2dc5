// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/RecordOutput.h"

#include <unistd.h>

#include <algorithm>
#include <array>
#include <cstdio>

#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {

namespace {

constexpr std::size_t wholeSeconds = 19;  // of "2024-03-05T14:07:09.250000Z"

std::string jsonText(const Json& json) {
  return json.dump(-1, ' ', false, Json::error_handler_t::replace);
}

// Elements of a list side by side.
std::string plainText(const Json& value) {
  if (value.is_null()) return {};
  if (value.is_string()) return value.get<std::string>();
  if (!value.is_array()) return jsonText(value);
  std::string text;
  for (const Json& element : value) text += (text.empty() ? "" : " ") + plainText(element);
  return text;
}

std::string shown(const Column& column, const Json& value) {
  if (column.isTime && value.is_string()) {
    std::string text = value.get<std::string>().substr(0, wholeSeconds);
    std::ranges::replace(text, 'T', ' ');
    return text.substr(text.size() - std::min(text.size(), column.width));
  }
  if (!value.is_number_float()) {
    std::string text = plainText(value);
    // A terminal would obey them.
    std::ranges::replace_if(
        text, [](char each) { return static_cast<unsigned char>(each) < 0x20 || each == 0x7F; }, '?');
    return text;
  }
  std::array<char, 64> text;
  const int length = std::snprintf(text.data(), text.size(), "%.*f", column.decimals, value.get<double>());
  return {text.data(), static_cast<std::size_t>(std::clamp(length, 0, static_cast<int>(text.size()) - 1))};
}

// Characters, as far as each takes one place.
std::size_t widthOf(std::string_view text) {
  return static_cast<std::size_t>(
      std::ranges::count_if(text, [](char each) { return (each & 0xC0) != 0x80; }));
}

std::string padded(const Column& column, const std::string& text) {
  const std::size_t width = widthOf(text);
  const std::string blanks(width < column.width ? column.width - width : 0, ' ');
  return column.isNumber ? blanks + text : text + blanks;
}

void trimRight(std::string& line) {
  line.erase(line.find_last_not_of(' ') + 1);
}

}  // namespace

std::vector<Column> fitted(std::span<const Column> columns, std::span<const Json> records) {
  std::vector<Column> result(columns.begin(), columns.end());
  for (Column& column : result) {
    for (const Json& record : records) {
      const auto value = record.find(std::string(column.key));
      if (column.width == 0 || column.isTime || value == record.end()) continue;
      column.width = std::max(column.width, widthOf(shown(column, *value)));
    }
  }
  return result;
}

void RecordOutput::print(const Json& record) {
  if (format_ == Format::ndjson) return print_(jsonText(record) + "\n");
  if (format_ == Format::table) return print_(tableLine(record));
  std::string line;
  for (const Column& column : columns_) {
    const auto value = record.find(std::string(column.key));
    line += (line.empty() && &column == columns_.data() ? "" : ",");
    if (value != record.end()) line += csvField(plainText(*value));
  }
  print_(line + "\r\n");
}

void RecordOutput::begin() {
  if (format_ == Format::ndjson) return;
  std::string line;
  for (const Column& column : columns_) {
    if (format_ == Format::csv) {
      line += (&column == columns_.data() ? "" : ",") + csvField(column.key);
    } else if (column.width != 0) {
      std::string heading(column.key);
      std::ranges::replace(heading, '_', ' ');
      line += padded(column, heading) + "  ";
    }
  }
  trimRight(line);
  print_(line + (format_ == Format::csv ? "\r\n" : "\n"));
}

std::string RecordOutput::tableLine(const Json& record) const {
  std::string line;
  for (const Column& column : columns_) {
    if (column.width == 0) continue;
    const auto value = record.find(std::string(column.key));
    line += padded(column, value == record.end() ? "" : shown(column, *value)) + "  ";
  }
  trimRight(line);
  return line + "\n";
}

void FormatOption::addTo(OptionSet verb) {
  verb.add("--format", name, "table, ndjson or csv; otherwise a table on a terminal and NDJSON elsewhere")
      .type("FORMAT")
      .oneOf({"table", "ndjson", "csv"});
}

RecordOutput::Format FormatOption::format() const {
  using Format = RecordOutput::Format;
  if (name == "csv") return Format::csv;
  if (name == "table") return Format::table;
  if (name == "ndjson") return Format::ndjson;
  return ::isatty(STDOUT_FILENO) == 1 ? Format::table : Format::ndjson;
}

}  // namespace kelvasi
