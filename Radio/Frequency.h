// SPDX-License-Identifier: Apache-2.0
// A frequency, exact to the hertz, wide enough for every band there is.
#pragma once

#include <compare>
#include <cstdint>
#include <string>

namespace kelvasi {

struct Frequency {
  std::int64_t hertz = 0;

  constexpr double megahertz() const { return static_cast<double>(hertz) / 1e6; }

  friend constexpr Frequency operator+(Frequency one, Frequency other) { return {one.hertz + other.hertz}; }
  friend constexpr Frequency operator-(Frequency one, Frequency other) { return {one.hertz - other.hertz}; }
  friend constexpr Frequency operator*(Frequency one, std::int64_t times) { return {one.hertz * times}; }
  auto operator<=>(const Frequency&) const = default;
};

inline namespace frequency_literals {

constexpr Frequency operator""_MHz(unsigned long long megahertz) {
  return {static_cast<std::int64_t>(megahertz) * 1'000'000};
}
// To the nearest hertz.
constexpr Frequency operator""_MHz(long double megahertz) {
  return {static_cast<std::int64_t>(megahertz * 1e6L + 0.5L)};
}
constexpr Frequency operator""_kHz(unsigned long long kilohertz) {
  return {static_cast<std::int64_t>(kilohertz) * 1'000};
}
constexpr Frequency operator""_kHz(long double kilohertz) {
  return {static_cast<std::int64_t>(kilohertz * 1e3L + 0.5L)};
}

}  // namespace frequency_literals

// In MHz with as many decimals as it has and no unit: "2680", "1932.5", "914.9875".
void appendMegahertz(std::string& text, Frequency frequency);

}  // namespace kelvasi
