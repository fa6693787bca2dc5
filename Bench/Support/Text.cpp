// SPDX-License-Identifier: Apache-2.0
#include "Bench/Support/Text.h"

#include <algorithm>
#include <array>
#include <cstdio>

namespace kelvasi::bench {

namespace {

struct Unit {
  double seconds;
  const char* name;
};
constexpr std::array units{Unit{1, " s "}, Unit{1e-3, " ms"}, Unit{1e-6, " us"}, Unit{1e-9, " ns"}};

}  // namespace

std::string fixed(double value, int decimals) {
  std::array<char, 64> text;
  std::snprintf(text.data(), text.size(), "%.*f", decimals, value);
  return text.data();
}

std::string grouped(double value) {
  const std::string digits = fixed(value, 0);
  std::string text;
  for (std::size_t place = 0; place < digits.size(); ++place) {
    if (place != 0 && (digits.size() - place) % 3 == 0) text += ',';
    text += digits[place];
  }
  return text;
}

std::string duration(double seconds) {
  const auto unit = std::ranges::find_if(units, [&](const Unit& at) { return seconds >= at.seconds; });
  const Unit& shown = unit == units.end() ? units.back() : *unit;
  return ratio(seconds / shown.seconds) + shown.name;
}

std::string ratio(double value) {
  int decimals = 2;
  for (double scaled = value; scaled > 0 && scaled < 1 && decimals < 9; scaled *= 10) ++decimals;
  for (double scaled = value; scaled >= 10 && decimals > 0; scaled /= 10) --decimals;
  return fixed(value, decimals);
}

std::string aligned(const std::vector<std::vector<std::string>>& lines) {
  std::vector<std::size_t> widths(lines.front().size());
  for (const auto& line : lines) {
    for (std::size_t column = 0; column < line.size(); ++column)
      widths[column] = std::max(widths[column], line[column].size());
  }
  std::string text;
  for (const auto& line : lines) {
    const std::size_t begin = text.size();
    for (std::size_t column = 0; column < line.size(); ++column) {
      const std::size_t blanks = widths[column] - line[column].size();
      text.append(column == 0 ? 0 : 2 + blanks, ' ')
          .append(line[column])
          .append(column == 0 ? blanks : 0, ' ');
    }
    text += '\n';
    if (&line == &lines.front()) text.append(text.size() - begin - 1, '-').append(1, '\n');
  }
  return text;
}

}  // namespace kelvasi::bench
