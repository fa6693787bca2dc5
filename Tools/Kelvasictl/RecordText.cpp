// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/RecordText.h"

#include <array>
#include <cstdio>

namespace kelvasi {

std::string rfc3339(std::chrono::nanoseconds sinceEpoch) {
  using namespace std::chrono;
  const sys_time<nanoseconds> time{sinceEpoch};
  const auto day = floor<days>(time);
  const year_month_day date(day);
  const hh_mm_ss clock(floor<microseconds>(time - day));
  std::array<char, 48> text;
  const int length = std::snprintf(
      text.data(), text.size(), "%04d-%02u-%02uT%02d:%02d:%02d.%06dZ", static_cast<int>(date.year()),
      static_cast<unsigned>(date.month()), static_cast<unsigned>(date.day()),
      static_cast<int>(clock.hours().count()), static_cast<int>(clock.minutes().count()),
      static_cast<int>(clock.seconds().count()), static_cast<int>(clock.subseconds().count()));
  return {text.data(), static_cast<std::size_t>(length)};
}

std::string csvField(std::string_view text) {
  if (text.find_first_of(",\"\r\n") == std::string_view::npos) return std::string(text);
  std::string field = "\"";
  for (const char each : text) {
    if (each == '"') field += '"';
    field += each;
  }
  return field + '"';
}

}  // namespace kelvasi
