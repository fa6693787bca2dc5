// SPDX-License-Identifier: Apache-2.0
#include "Tests/Platform/Plist/PlistSamples.h"

#include <array>
#include <bit>
#include <cmath>
#include <cstdio>
#include <limits>

namespace kelvasi::testing {

namespace {

std::string hexadecimal(std::span<const std::uint8_t> bytes) {
  std::string text;
  for (const std::uint8_t byte : bytes) {
    std::array<char, 3> digits{};
    std::snprintf(digits.data(), digits.size(), "%02x", byte);
    text += digits.data();
  }
  return text;
}

std::string bits(double number) {
  std::array<char, 17> digits{};
  std::snprintf(digits.data(), digits.size(), "%016llx",
                static_cast<unsigned long long>(std::bit_cast<std::uint64_t>(number)));
  return std::isnan(number) ? "nan" : digits.data();
}

}  // namespace

std::int64_t PlistSamples::number(std::int64_t least, std::int64_t most) {
  return std::uniform_int_distribution<std::int64_t>(least, most)(random_);
}

std::string PlistSamples::text() {
  constexpr std::array<std::string_view, 20> pieces{
      "a",  "Serving Cell", "&",     "<", ">",  "\"",         "'",      "]]>",  " ",     "\n",
      "\t", "\r",           "&amp;", "é", "漢", "\U0001F600", "\uFFFD", "<!--", "&#13;", "\u2028"};
  std::string result;
  for (std::int64_t count = number(0, 6); count > 0; --count) {
    result += pieces[static_cast<std::size_t>(number(0, pieces.size() - 1))];
  }
  return result;
}

Bytes PlistSamples::bytes() {
  Bytes result(static_cast<std::size_t>(number(0, 4) == 0 ? number(0, 400) : number(0, 4)));
  for (std::uint8_t& byte : result) byte = static_cast<std::uint8_t>(number(0, 255));
  return result;
}

double PlistSamples::real() {
  constexpr double infinity = std::numeric_limits<double>::infinity();
  constexpr std::array special{0.0, 0.1, -95.5, 1e22, 5e-324, infinity, -infinity};
  const std::int64_t choice = number(0, 2 * special.size());
  if (choice < static_cast<std::int64_t>(special.size())) return special[static_cast<std::size_t>(choice)];
  const double any = std::bit_cast<double>(random_());
  return std::isnan(any) || any == 0 ? 1.5 : any;
}

PlistValue PlistSamples::array(int levels) {
  const auto result = PlistArray::make();
  for (std::int64_t count = number(0, 5); count > 0; --count) result->append(value(levels - 1));
  return result;
}

PlistValue PlistSamples::dictionary(int levels) {
  const auto result = PlistDictionary::make();
  for (std::int64_t count = number(0, 5); count > 0; --count) result->set(text(), value(levels - 1));
  return result;
}

PlistValue PlistSamples::integer() {
  constexpr std::int64_t farAway = std::numeric_limits<std::int64_t>::max();
  switch (number(0, 3)) {
    case 0:
      return number(-farAway - 1, farAway);
    case 1:
      return static_cast<std::uint64_t>(number(0, farAway)) + static_cast<std::uint64_t>(farAway);
    default:
      return number(-300, 300);
  }
}

PlistValue PlistSamples::value(int levels) {
  switch (number(levels > 0 ? 0 : 4, 10)) {
    case 0:
    case 1:
      return array(levels);
    case 2:
    case 3:
      return dictionary(levels);
    case 4:
      return bytes();
    case 5:
      return real();
    case 6:
      return number(0, 1) == 1;
    case 7:
      return PlistDate{static_cast<double>(number(-30'610'224'000, 253'402'300'799))};
    case 8:
      return integer();
    default:
      return text();
  }
}

std::string canonical(const PlistValue& value) {
  if (const auto* text = value.string()) return "s" + hexadecimal(bytesOf(*text));
  if (const auto* integer = value.integer()) return "i" + std::to_string(*integer);
  if (const auto* integer = value.unsignedInteger()) return "i" + std::to_string(*integer);
  if (const auto* real = value.real()) return "r" + bits(*real);
  if (const auto* flag = value.boolean()) return *flag ? "true" : "false";
  if (const auto* date = value.date()) return "t" + bits(date->secondsSince1970);
  if (const auto* bytes = value.data()) return "d" + hexadecimal(*bytes);
  std::string text;
  if (const auto* elements = value.array()) {
    for (const PlistValue& element : *elements) text += canonical(element) + ",";
    return "[" + text + "]";
  }
  if (const auto* entries = value.dictionary()) {
    for (const auto& [key, entry] : *entries) text += canonical(key) + "=" + canonical(entry) + ",";
    return "{" + text + "}";
  }
  return "absent";
}

std::span<const std::uint8_t> bytesOf(std::string_view text) {
  return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

std::string textOf(std::span<const std::uint8_t> bytes) {
  return {bytes.begin(), bytes.end()};
}

std::string xmlPlist(std::string_view body) {
  return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">" + std::string(body) +
         "</plist>\n";
}

std::string inArrays(int levels, std::string_view body) {
  std::string text;
  for (int level = 0; level < levels; ++level) text += "<array>";
  text += body;
  for (int level = 0; level < levels; ++level) text += "</array>";
  return text;
}

}  // namespace kelvasi::testing
