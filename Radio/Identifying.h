// SPDX-License-Identifier: Apache-2.0
// Which quantities tell of whom a recording is, or where it was made. Docs/redaction.md says why.
#pragma once

#include <algorithm>
#include <array>

#include "Radio/Quantity.h"

namespace kelvasi {

enum class Identifies {
  nothing,
  place,       // a cell or an area that is nowhere else
  subscriber,  // or the device
};

// Codes and channels, which every network uses again and again, are no places; a network is none either.
constexpr Identifies whatIdentifies(const Quantity& quantity) {
  constexpr std::array places{&quantity::cellId,     &quantity::baseId,   &quantity::lac, &quantity::rac,
                              &quantity::tac,        &quantity::uraId,    &quantity::sid, &quantity::nid,
                              &quantity::packetZone, &quantity::colorCode};
  if (&quantity == &quantity::uati24) return Identifies::subscriber;
  return std::ranges::find(places, &quantity) == places.end() ? Identifies::nothing : Identifies::place;
}

}  // namespace kelvasi
