// SPDX-License-Identifier: Apache-2.0
#include "Report/Moments.h"

#include <array>
#include <chrono>
#include <cmath>
#include <cstdio>

namespace kelvasi::report {

namespace {

template <typename... Numbers>
std::string formatted(const char* format, Numbers... numbers) {
  std::array<char, 64> text;
  std::snprintf(text.data(), text.size(), format, numbers...);
  return text.data();
}

std::int64_t whole(double seconds) {
  return static_cast<std::int64_t>(std::floor(seconds));
}

}  // namespace

std::string timeOfDay(double secondsSince1970) {
  const std::int64_t second = ((whole(secondsSince1970) % 86400) + 86400) % 86400;
  return formatted("%02d:%02d:%02d", static_cast<int>(second / 3600), static_cast<int>(second / 60 % 60),
                   static_cast<int>(second % 60));
}

std::string dateAndTime(double secondsSince1970) {
  using namespace std::chrono;
  const year_month_day date(floor<days>(sys_seconds(seconds(whole(secondsSince1970)))));
  return formatted("%04d-%02u-%02u ", static_cast<int>(date.year()), static_cast<unsigned>(date.month()),
                   static_cast<unsigned>(date.day())) +
         timeOfDay(secondsSince1970);
}

std::string duration(double seconds) {
  const std::int64_t all = whole(seconds + 0.5);
  if (all < 60) return formatted("%d s", static_cast<int>(all));
  const int hours = static_cast<int>(all / 3600);
  const int minutes = static_cast<int>(all / 60 % 60);
  const int left = static_cast<int>(all % 60);
  if (hours == 0) return formatted("%d min %02d s", minutes, left);
  return formatted("%d h %02d min %02d s", hours, minutes, left);
}

}  // namespace kelvasi::report
