#include "Platform/Plist/XmlScalars.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <chrono>
#include <cstdint>
#include <optional>
#include <string>

#include "Platform/Plist/XmlTokens.h"

namespace kelvasi {

namespace {

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

bool isReference(std::string_view name) {
  constexpr std::array<std::string_view, 5> entities{"amp", "lt", "gt", "quot", "apos"};
  if (std::ranges::find(entities, name) != entities.end()) return true;
  if (!name.starts_with('#')) return false;
  const bool hexadecimal = name.starts_with("#x");
  const auto code = wholeNumber<std::uint32_t>(name.substr(hexadecimal ? 2 : 1), hexadecimal ? 16 : 10);
  return code && *code != 0 && *code <= 0x10ffff && (*code < 0xd800 || *code > 0xdfff);
}

}  // namespace

bool isXmlInteger(std::string_view text) {
  text = trimmed(text);
  const bool negative = takeSign(text);
  const bool hexadecimal = text.starts_with("0x") || text.starts_with("0X");
  if (hexadecimal) text.remove_prefix(2);
  if (!hexadecimal && text.size() > 1 && text.front() == '0') return false;
  const auto magnitude = wholeNumber<std::uint64_t>(text, hexadecimal ? 16 : 10);
  return magnitude && (!negative || *magnitude <= std::uint64_t{1} << 63);
}

bool isXmlReal(std::string_view text) {
  text = trimmed(text);
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

bool isXmlDate(std::string_view text) {
  text = trimmed(text);
  std::string shape(text);
  std::ranges::replace_if(shape, isDigit, '0');
  if (shape != "0000-00-00T00:00:00Z") return false;
  const auto number = [&](std::size_t at, std::size_t size) {
    return wholeNumber<unsigned>(text.substr(at, size), 10).value_or(0);
  };
  using namespace std::chrono;
  const year_month_day day{year(static_cast<int>(number(0, 4))), month(number(5, 2)),
                           std::chrono::day(number(8, 2))};
  return day.ok() && number(11, 2) < 24 && number(14, 2) < 60 && number(17, 2) < 60;
}

bool isXmlData(std::string_view text) {
  std::size_t characters = 0;
  std::size_t padding = 0;
  for (const char character : text) {
    if (std::string_view(" \t\r\n").find(character) != std::string_view::npos) continue;
    const bool isLetter = (character >= 'A' && character <= 'Z') || (character >= 'a' && character <= 'z');
    const bool isCode = isLetter || isDigit(character) || character == '+' || character == '/';
    if (character == '=' ? ++padding > 2 : !isCode || padding != 0) return false;
    ++characters;
  }
  return characters % 4 == 0;
}

bool isXmlString(std::string_view text) {
  for (std::size_t at = text.find('&'); at != std::string_view::npos; at = text.find('&', at + 1)) {
    const std::size_t end = text.find(';', at);
    if (end == std::string_view::npos || !isReference(text.substr(at + 1, end - at - 1))) return false;
  }
  return true;
}

}  // namespace kelvasi
