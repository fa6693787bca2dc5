// SPDX-License-Identifier: Apache-2.0
// Which cell a number is about, the same from every kind of record that speaks of the cell.
#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

namespace kelvasi {

enum class RadioFamily : std::uint8_t { none, gsm, umts, utraTdd, lte, cdma, evdo };

constexpr std::string_view nameOf(RadioFamily family) {
  constexpr std::array<std::string_view, 7> names{"none", "gsm", "umts", "utra-tdd", "lte", "cdma", "evdo"};
  return names[static_cast<std::size_t>(family)];
}

// A channel and the code that tells cells of one channel apart:
//   gsm       ARFCN, BSIC                            cdma, evdo  channel, PN offset in 64 chips
//   umts      downlink UARFCN, scrambling code       lte         downlink E-ARFCN, physical cell identity
//   utra-tdd  UARFCN, cell parameter identity
struct CellIdentity {
  static constexpr std::int64_t unknown = -1;

  RadioFamily family = RadioFamily::none;  // none: no cell at all
  std::int64_t channel = unknown;
  std::int64_t code = unknown;

  constexpr explicit operator bool() const { return family != RadioFamily::none; }
  constexpr bool isWhole() const { return channel != unknown && code != unknown; }
  auto operator<=>(const CellIdentity&) const = default;
};

// Whether both can be the same cell: of one family, and equal in every part that both know.
constexpr bool canBeSame(const CellIdentity& one, const CellIdentity& other) {
  const auto agree = [](std::int64_t first, std::int64_t second) {
    return first == CellIdentity::unknown || second == CellIdentity::unknown || first == second;
  };
  return one.family == other.family && agree(one.channel, other.channel) && agree(one.code, other.code);
}

// "lte:3350/404", "gsm:62" without a code, "umts:?/362" without a channel; empty for no cell.
void appendTo(std::string& text, const CellIdentity& cell);
std::string textOf(const CellIdentity& cell);

}  // namespace kelvasi
