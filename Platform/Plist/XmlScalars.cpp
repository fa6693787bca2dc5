// SPDX-License-Identifier: Apache-2.0
#include "Platform/Plist/XmlScalars.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <chrono>
#include <cstdint>
#include <cstdlib>

#include "Platform/Plist/PlainLocale.h"
#include "Platform/Plist/Utf8.h"

namespace kelvasi {

namespace {

bool isWhite(char character) {
  return character == ' ' || character == '\t' || character == '\r' || character == '\n';
}

bool isDigit(char character) {
  return character >= '0' && character <= '9';
}

template <typename Number>
std::optional<Number> wholeNumber(std::string_view text, int base) {
  Number number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number, base);
  if (text.empty() || error != std::errc() || end != text.data() + text.size()) return std::nullopt;
  return number;
}

bool takeSign(std::string_view& text) {
  const bool negative = text.starts_with('-');
  if (negative || text.starts_with('+')) text.remove_prefix(1);
  return negative;
}

std::size_t takeDigits(std::string_view& text) {
  const auto count = static_cast<std::size_t>(std::ranges::find_if_not(text, isDigit) - text.begin());
  text.remove_prefix(count);
  return count;
}

bool isExponent(std::string_view text) {
  if (text.empty()) return true;
  if (text.front() != 'e' && text.front() != 'E') return false;
  text.remove_prefix(1);
  takeSign(text);
  return takeDigits(text) != 0 && text.empty();
}

bool isReal(std::string_view text) {
  takeSign(text);
  constexpr std::array<std::string_view, 4> names{"nan", "inf", "infinity", "NaN"};
  if (std::ranges::find(names, text) != names.end()) return true;
  std::size_t digits = takeDigits(text);
  if (text.starts_with('.')) {
    text.remove_prefix(1);
    digits += takeDigits(text);
  }
  return digits != 0 && isExponent(text);
}

// The character that stands behind '&' and before ';'.
std::optional<char32_t> referred(std::string_view name) {
  struct Entity {
    std::string_view name;
    char32_t character;
  };
  constexpr std::array<Entity, 5> entities{
      {{"amp", U'&'}, {"lt", U'<'}, {"gt", U'>'}, {"quot", U'"'}, {"apos", U'\''}}};
  const auto entity = std::ranges::find(entities, name, &Entity::name);
  if (entity != entities.end()) return entity->character;
  if (!name.starts_with('#')) return std::nullopt;
  const bool hexadecimal = name.starts_with("#x");
  const auto code = wholeNumber<std::uint32_t>(name.substr(hexadecimal ? 2 : 1), hexadecimal ? 16 : 10);
  if (!code || *code == 0 || !isScalarValue(*code)) return std::nullopt;
  return static_cast<char32_t>(*code);
}

// Nothing for white space.
std::optional<unsigned> base64Digit(char character) {
  constexpr std::string_view digits = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  const std::size_t place = digits.find(character);
  if (place == std::string_view::npos) return std::nullopt;
  return static_cast<unsigned>(place);
}

}  // namespace

std::string_view trimmed(std::string_view text) {
  while (!text.empty() && isWhite(text.front())) text.remove_prefix(1);
  while (!text.empty() && isWhite(text.back())) text.remove_suffix(1);
  return text;
}

std::optional<PlistValue> xmlInteger(std::string_view text) {
  text = trimmed(text);
  const bool negative = takeSign(text);
  const bool hexadecimal = text.starts_with("0x") || text.starts_with("0X");
  if (hexadecimal) text.remove_prefix(2);
  if (!hexadecimal && text.size() > 1 && text.front() == '0') return std::nullopt;
  const auto magnitude =
      hexadecimal ? wholeNumber<std::uint64_t>(text, 16) : wholeNumber<std::uint64_t>(text, 10);
  if (!magnitude || (negative && *magnitude > std::uint64_t{1} << 63)) return std::nullopt;
  return negative ? PlistValue(static_cast<std::int64_t>(-*magnitude)) : PlistValue(*magnitude);
}

std::optional<PlistValue> xmlReal(std::string_view text) {
  text = trimmed(text);
  if (!isReal(text)) return std::nullopt;
  const PlainLocale locale;  // which writes the decimal point as a point
  return PlistValue(std::strtod(std::string(text).c_str(), nullptr));
}

std::optional<PlistValue> xmlDate(std::string_view text) {
  text = trimmed(text);
  std::string shape(text);
  std::ranges::replace_if(shape, isDigit, '0');
  if (shape != "0000-00-00T00:00:00Z") return std::nullopt;
  const auto number = [&](std::size_t at, std::size_t size) {
    return wholeNumber<unsigned>(text.substr(at, size), 10).value_or(0);
  };
  using namespace std::chrono;
  const year_month_day day{year(static_cast<int>(number(0, 4))), month(number(5, 2)),
                           std::chrono::day(number(8, 2))};
  const hours hour(number(11, 2));
  const minutes minute(number(14, 2));
  const seconds second(number(17, 2));
  if (!day.ok() || hour.count() > 23 || minute.count() > 59 || second.count() > 59) return std::nullopt;
  const auto moment = sys_days(day) + hour + minute + second;
  return PlistValue(PlistDate{static_cast<double>(moment.time_since_epoch().count())});
}

std::optional<PlistValue> xmlData(std::string_view text) {
  Bytes bytes;
  std::size_t characters = 0;
  std::size_t padding = 0;
  unsigned group = 0;
  for (const char character : text) {
    if (isWhite(character)) continue;
    const auto digit = base64Digit(character);
    if (character == '=' ? ++padding > 2 : !digit || padding != 0) return std::nullopt;
    group = group << 6 | digit.value_or(0);
    if (++characters % 4 != 0) continue;
    for (const unsigned shift : {16u, 8u, 0u}) bytes.push_back(static_cast<std::uint8_t>(group >> shift));
  }
  if (characters % 4 != 0) return std::nullopt;
  bytes.resize(bytes.size() - padding);
  return PlistValue(std::move(bytes));
}

bool appendXmlText(std::string& whole, std::string_view text) {
  while (true) {
    const std::size_t reference = text.find('&');
    whole += text.substr(0, reference);
    if (reference == std::string_view::npos) return true;
    const std::size_t end = text.find(';', reference);
    if (end == std::string_view::npos) return false;
    const auto character = referred(text.substr(reference + 1, end - reference - 1));
    if (!character) return false;
    appendUtf8(whole, *character);
    text.remove_prefix(end + 1);
  }
}

}  // namespace kelvasi
