// SPDX-License-Identifier: Apache-2.0
// Whose values a series holds.
#pragma once

#include <compare>
#include <cstdint>

#include "Radio/Quantity.h"

namespace kelvasi::survey {

struct SeriesKey {
  std::uint32_t cell = 0;  // the number of a SeenCell; 0 for values of no cell
  const Quantity* quantity = nullptr;

  auto operator<=>(const SeriesKey&) const = default;
};

}  // namespace kelvasi::survey
