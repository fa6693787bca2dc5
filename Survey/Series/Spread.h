// SPDX-License-Identifier: Apache-2.0
// What the values of one stretch of time come to.
#pragma once

#include <algorithm>
#include <cstdint>

namespace kelvasi::survey {

struct Spread {
  float minimum = 0;
  float maximum = 0;
  float mean = 0;
  std::uint32_t count = 0;  // 0: no value, and the rest says nothing

  static constexpr Spread of(float value) { return {value, value, value, 1}; }

  constexpr void add(const Spread& other) {
    if (other.count == 0) return;
    if (count == 0) {
      *this = other;
      return;
    }
    minimum = std::min(minimum, other.minimum);
    maximum = std::max(maximum, other.maximum);
    const double share = static_cast<double>(other.count) / (static_cast<double>(count) + other.count);
    mean = static_cast<float>(mean + (static_cast<double>(other.mean) - mean) * share);
    count = other.count > UINT32_MAX - count ? UINT32_MAX : count + other.count;
  }

  bool operator==(const Spread&) const = default;
};

}  // namespace kelvasi::survey
