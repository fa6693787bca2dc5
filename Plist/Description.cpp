// SPDX-License-Identifier: Apache-2.0
#include "Plist/Description.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <cmath>
#include <cstdio>

namespace kelvasi {

namespace {

std::string number(double value) {
  std::array<char, 40> text{};
  std::snprintf(text.data(), text.size(), "%.15g", value);
  return text.data();
}

// A date beyond the calendar's reach is taken for the calendar's end.
std::chrono::sys_seconds wholeSecond(PlistDate date) {
  using namespace std::chrono;
  constexpr sys_seconds first = sys_days(year::min() / January / 1);
  constexpr sys_seconds last = sys_days(year::max() / December / 31);
  const double whole = std::floor(date.secondsSince1970);
  if (!(whole > static_cast<double>(first.time_since_epoch().count()))) return first;
  if (whole > static_cast<double>(last.time_since_epoch().count())) return last;
  return sys_seconds{seconds(static_cast<std::int64_t>(whole))};
}

std::string hexadecimal(const Bytes& bytes) {
  std::string text = "<";
  for (std::size_t at = 0; at < bytes.size(); ++at) {
    std::array<char, 4> digits{};
    std::snprintf(digits.data(), digits.size(), "%02x", bytes[at]);
    if (at != 0 && at % 4 == 0) text += ' ';
    text += digits.data();
  }
  return text + ">";
}

bool isPlain(char character) {
  return (character >= '0' && character <= '9') || (character >= 'a' && character <= 'z') ||
         (character >= 'A' && character <= 'Z') || character == '_';
}

std::string quoted(const std::string& text) {
  if (!text.empty() && std::ranges::all_of(text, isPlain)) return text;
  std::string result = "\"";
  for (const char character : text) {
    if (character == '"' || character == '\\') result += '\\';
    result += character;
  }
  return result + "\"";
}

std::string inside(const PlistValue& value, int level);

std::string indentation(int level) {
  return std::string(static_cast<std::size_t>(level) * 4, ' ');
}

std::string container(const PlistDictionary& entries, int level) {
  std::string text = "{\n";
  for (const auto& [key, value] : entries) {
    text += indentation(level + 1) + quoted(key) + " = " + inside(value, level + 1) + ";\n";
  }
  return text + indentation(level) + "}";
}

std::string container(const PlistArray& elements, int level) {
  std::string text = "(\n";
  for (std::size_t place = 0; place < elements.size(); ++place) {
    text += indentation(level + 1) + inside(elements.at(place), level + 1);
    text += place + 1 < elements.size() ? ",\n" : "\n";
  }
  return text + indentation(level) + ")";
}

std::string inside(const PlistValue& value, int level) {
  if (const auto* entries = value.dictionary()) return container(*entries, level);
  if (const auto* elements = value.array()) return container(*elements, level);
  if (const auto* text = value.string()) return quoted(*text);
  if (const auto* date = value.date()) return quoted(description(*date));
  return description(value);
}

}  // namespace

std::string description(PlistDate date) {
  using namespace std::chrono;
  const sys_seconds moment = wholeSecond(date);
  const sys_days day = floor<days>(moment);
  const year_month_day calendar{day};
  const hh_mm_ss time{moment - day};
  std::array<char, 64> text{};
  std::snprintf(text.data(), text.size(), "%04d-%02u-%02u %02d:%02d:%02d +0000",
                static_cast<int>(calendar.year()), static_cast<unsigned>(calendar.month()),
                static_cast<unsigned>(calendar.day()), static_cast<int>(time.hours().count()),
                static_cast<int>(time.minutes().count()), static_cast<int>(time.seconds().count()));
  return text.data();
}

std::string description(const PlistValue& value) {
  if (const auto* text = value.string()) return *text;
  if (const auto* integer = value.integer()) return std::to_string(*integer);
  if (const auto* integer = value.unsignedInteger()) return std::to_string(*integer);
  if (const auto* real = value.real()) return number(*real);
  if (const auto* flag = value.boolean()) return *flag ? "1" : "0";
  if (const auto* date = value.date()) return description(*date);
  if (const auto* bytes = value.data()) return hexadecimal(*bytes);
  if (value.dictionary() || value.array()) return inside(value, 0);
  return "(null)";
}

}  // namespace kelvasi
