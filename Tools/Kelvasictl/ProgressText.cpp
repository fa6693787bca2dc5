// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ProgressText.h"

#include <algorithm>
#include <cmath>
#include <cstdio>

namespace kelvasi {

namespace {

std::string grouped(std::uint64_t number) {
  std::string text = std::to_string(number);
  for (std::size_t place = text.size(); place > 3;) text.insert(place -= 3, 1, ',');
  return text;
}

std::string megabytes(std::uint64_t bytes) {
  const std::uint64_t tenths = bytes / 100'000;
  return grouped(tenths / 10) + "." + std::to_string(tenths % 10);
}

std::string twoDigits(std::uint64_t number) {
  std::string text = std::to_string(number);
  if (text.size() < 2) text.insert(0, 1, '0');
  return text;
}

std::string duration(double seconds) {
  const auto whole = static_cast<std::uint64_t>(std::clamp(std::ceil(seconds), 0.0, 1e9));
  const std::uint64_t hours = whole / 3600;
  const std::uint64_t minutes = whole / 60 % 60;
  const std::string begin =
      hours > 0 ? std::to_string(hours) + ":" + twoDigits(minutes) : std::to_string(minutes);
  return begin + ":" + twoDigits(whole % 60);
}

std::string bar(double part) {
  constexpr std::size_t width = 10;
  const auto done = static_cast<std::size_t>(part * width);
  return "[" + std::string(done, '#') + std::string(width - done, ' ') + "] " +
         std::to_string(static_cast<int>(part * 100)) + " %";
}

}  // namespace

std::string progressText(const ProgressFigures& figures, std::size_t columns) {
  const bool isPartKnown = figures.bytesInAll && *figures.bytesInAll > 0;
  const auto all = static_cast<double>(figures.bytesInAll.value_or(0));
  const auto done = static_cast<double>(figures.bytes);
  const double part = isPartKnown ? std::min(done / all, 1.0) : 0;
  std::string text = isPartKnown ? bar(part) + ", " : "";
  if (part > 0) text += duration(figures.seconds * (1 - part) / part) + " left, ";
  text += grouped(figures.messages) + " messages, " + megabytes(figures.bytes);
  if (isPartKnown) text += " of " + megabytes(*figures.bytesInAll);
  text += " MB";
  if (figures.seconds > 0) {
    const double rate = static_cast<double>(figures.messages) / figures.seconds;
    text += ", " + grouped(static_cast<std::uint64_t>(rate)) + "/s";
  }
  return text.substr(0, columns);
}

}  // namespace kelvasi
