// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Reading.h"

#include <array>
#include <charconv>
#include <cmath>

#include "LogGenerator/Row.h"
#include "Plist/Encoding.h"

namespace kelvasi {

namespace {

void appendIndex(std::string& to, std::int32_t index) {
  if (index == Reading::notInList) return;
  std::array<char, 16> digits;
  to += '/';
  to.append(digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), index).ptr);
}

const Quantity& quantityOf(const PlistValue& value) {
  if (value.array()) return quantity::list;
  if (value.dictionary()) return quantity::group;
  if (value.integer()) return quantity::integer;
  if (value.real()) return quantity::real;
  if (value.boolean()) return quantity::boolean;
  if (value.data()) return quantity::data;
  return value.date() ? quantity::date : quantity::text;
}

std::optional<double> numberOf(const PlistValue& value) {
  if (const auto* integer = value.integer()) return static_cast<double>(*integer);
  if (const auto* real = value.real(); real && std::isfinite(*real)) return *real;
  return std::nullopt;
}

// The shortest that reads back as the same number, with a point or an exponent where it is finite.
std::string realText(double number) {
  if (std::isnan(number)) return "nan";
  std::array<char, 32> digits;
  const std::string text(digits.data(),
                         std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr);
  const bool isWhole = std::isfinite(number) && text.find_first_of(".e") == std::string::npos;
  return isWhole ? text + ".0" : text;
}

std::string textOf(const PlistValue& value) {
  if (const auto* text = value.string()) return *text;
  if (value.array()) return "[]";
  if (value.dictionary()) return "{}";
  if (const auto* integer = value.integer()) return std::to_string(*integer);
  if (const auto* real = value.real()) return realText(*real);
  if (const auto* flag = value.boolean()) return *flag ? "true" : "false";
  if (const auto* bytes = value.data()) return base64(*bytes);
  const auto* date = value.date();
  return date ? iso8601(*date) : std::string();
}

}  // namespace

const Quantity* quantityOf(const Reading& reading) {
  if (reading.row) return &reading.row->quantity.get();
  return reading.value ? &quantityOf(*reading.value) : nullptr;
}

std::optional<double> numberOf(const Reading& reading) {
  if (reading.row) return numberOf(*reading.row, reading.raw);
  return reading.value ? numberOf(*reading.value) : std::nullopt;
}

std::optional<std::string> textOf(const Reading& reading) {
  if (reading.value) return textOf(*reading.value);
  if (reading.row) return textOf(*reading.row, reading.raw);
  return std::nullopt;
}

std::string_view rowOf(const Reading& reading) {
  const bool isKey = reading.keyKind == Reading::Key::row && !reading.key.empty();
  return isKey ? reading.key : reading.list;
}

void appendPathStep(std::string& to, std::string_view step) {
  to += '/';
  for (const char character : step) {
    if (character == '~') {
      to += "~0";
    } else if (character == '/') {
      to += "~1";
    } else {
      to += character;
    }
  }
}

void appendPath(std::string& to, const Reading& reading) {
  if (!reading.section) return;
  to += reading.section->path;
  appendIndex(to, reading.entry);
  if (reading.keyKind == Reading::Key::path) {
    to += reading.key;
    return;
  }
  if (!reading.list.empty()) appendPathStep(to, reading.list);
  appendIndex(to, reading.element);
  if (!reading.key.empty()) appendPathStep(to, reading.key);
}

std::string pathOf(const Reading& reading) {
  std::string path;
  appendPath(path, reading);
  return path;
}

}  // namespace kelvasi
