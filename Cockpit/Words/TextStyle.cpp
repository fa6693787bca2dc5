// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Words/TextStyle.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

namespace kelvasi::cockpit {

namespace {

std::string digitsOf(double number, int decimals) {
  std::array<char, 352> digits;
  const auto end =
      std::to_chars(digits.data(), digits.data() + digits.size(), number, std::chars_format::fixed, decimals)
          .ptr;
  return {digits.data(), end};
}

bool isNothing(const std::string& digits) {
  return std::ranges::all_of(digits, [](char each) { return each == '0' || each == '.'; });
}

std::string twoDigits(std::int64_t number) {
  return (number < 10 ? "0" : "") + std::to_string(number);
}

struct Clocked {
  std::chrono::year_month_day day;
  std::int64_t seconds = 0;  // since midnight
};

Clocked clocked(Arrival time, const TextStyle& style) {
  const auto local = std::chrono::floor<std::chrono::seconds>(time) +
                     (style.eastOfUtc ? style.eastOfUtc(time) : std::chrono::seconds(0));
  const auto day = std::chrono::floor<std::chrono::days>(local);
  return {std::chrono::year_month_day(std::chrono::sys_days(day)), (local - day).count()};
}

}  // namespace

std::string numberText(double number, int decimals, const TextStyle& style) {
  const std::string digits = digitsOf(std::abs(number), decimals);
  return number < 0 && !isNothing(digits) ? style.minus + digits : digits;
}

std::string shortNumberText(double number, int most, const TextStyle& style) {
  std::string text = numberText(number, most, style);
  if (text.find('.') == std::string::npos) return text;
  text.erase(text.find_last_not_of('0') + 1);
  if (text.back() == '.') text.pop_back();
  return text;
}

std::string differenceText(double number, int decimals, const TextStyle& style) {
  const std::string text = numberText(number, decimals, style);
  return number > 0 && !isNothing(text) ? "+" + text : text;
}

std::string countText(std::uint64_t count) {
  std::string text = std::to_string(count);
  for (std::size_t place = text.size(); place > 3; place -= 3) text.insert(place - 3, 1, ',');
  return text;
}

std::string minuteText(Arrival time, const TextStyle& style) {
  const auto seconds = clocked(time, style).seconds;
  return twoDigits(seconds / 3600) + ":" + twoDigits(seconds / 60 % 60);
}

std::string clockText(Arrival time, const TextStyle& style) {
  return minuteText(time, style) + ":" + twoDigits(clocked(time, style).seconds % 60);
}

std::string dateText(Arrival time, const TextStyle& style) {
  const auto day = clocked(time, style).day;
  return std::to_string(static_cast<int>(day.year())) + "-" + twoDigits(static_cast<unsigned>(day.month())) +
         "-" + twoDigits(static_cast<unsigned>(day.day())) + " " + clockText(time, style);
}

}  // namespace kelvasi::cockpit
