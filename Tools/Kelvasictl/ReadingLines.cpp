// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingLines.h"

#include <algorithm>
#include <charconv>
#include <nlohmann/json.hpp>

#include "Tools/Kelvasictl/LogCodeText.h"
#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {

namespace {

bool isPlain(char character) {
  return character >= ' ' && character <= '~' && character != '"' && character != '\\';
}

// Bytes that are not UTF-8 become U+FFFD, as in the JSON of a display.
std::string jsonString(std::string_view text) {
  return nlohmann::json(text).dump(-1, ' ', false, nlohmann::json::error_handler_t::replace);
}

void appendString(std::string& to, std::string_view text) {
  if (!std::ranges::all_of(text, isPlain)) {
    to += jsonString(text);
    return;
  }
  to += '"';
  to += text;
  to += '"';
}

void appendStringOrNull(std::string& to, std::string_view text) {
  if (text.empty()) {
    to += "null";
  } else {
    appendString(to, text);
  }
}

// The shortest that reads back as the same number.
void appendNumber(std::string& to, double number) {
  std::array<char, 32> digits;
  to.append(digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr);
}

}  // namespace

std::string ReadingLines::heading() const {
  if (format_ == Format::ndjson) return {};
  std::string line;
  for (const std::string_view column : readingColumns) (line += column) += ',';
  line.back() = '\r';
  return line + '\n';
}

void ReadingLines::startMessage(const Readings& message, std::string_view technology) {
  const std::string time = rfc3339(message.arrival());
  const std::string code = message.logCode() == 0 ? "" : logCodeText(message.logCode());
  beginning_.clear();
  if (format_ == Format::csv) {
    beginning_ = time + ',' + std::string(technology) + ',' + code + ',';
    return;
  }
  beginning_ = R"({"time":")" + time + R"(","technology":")" + std::string(technology) + R"(","code":)";
  appendStringOrNull(beginning_, code);
}

void ReadingLines::append(std::string& to, const Reading& reading, std::string_view path,
                          const std::optional<std::string>& text) const {
  to += beginning_;
  if (format_ == Format::csv) return appendCsv(to, reading, path, text);
  appendJson(to, reading, path, text);
}

void ReadingLines::appendJson(std::string& to, const Reading& reading, std::string_view path,
                              const std::optional<std::string>& text) const {
  const Quantity* const quantity = quantityOf(reading);
  to += R"(,"path":)";
  appendString(to, path);
  to += R"(,"section":)";
  appendStringOrNull(to, reading.section ? std::string_view(reading.section->name) : std::string_view());
  to += R"(,"row":)";
  appendStringOrNull(to, rowOf(reading));
  to += R"(,"cell":)";
  appendStringOrNull(to, textOf(reading.cell));
  to += R"(,"text":)";
  text ? appendString(to, *text) : static_cast<void>(to += "null");
  to += R"(,"value":)";
  if (const auto number = numberOf(reading)) {
    appendNumber(to, *number);
  } else {
    to += "null";
  }
  to += R"(,"unit":)";
  appendStringOrNull(to, quantity ? quantity->unit : std::string_view());
  to += R"(,"quantity":)";
  appendStringOrNull(to, quantity ? quantity->id : std::string_view());
  to += "}\n";
}

// An absent value and an empty text are both empty fields; a removal is told by its empty quantity.
void ReadingLines::appendCsv(std::string& to, const Reading& reading, std::string_view path,
                             const std::optional<std::string>& text) const {
  const Quantity* const quantity = quantityOf(reading);
  to += csvField(path) + ',';
  to += csvField(reading.section ? std::string_view(reading.section->name) : std::string_view()) + ',';
  to += csvField(rowOf(reading)) + ',';
  appendTo(to, reading.cell);
  to += ',' + csvField(text.value_or("")) + ',';
  if (const auto number = numberOf(reading)) appendNumber(to, *number);
  to += ',';
  if (quantity) (to += quantity->unit) += ',', to += quantity->id;
  if (!quantity) to += ',';
  to += "\r\n";
}

}  // namespace kelvasi
