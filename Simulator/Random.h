// SPDX-License-Identifier: Apache-2.0
// Numbers that look random and are the same for the same seed on every machine.
#pragma once

#include <cstdint>

namespace kelvasi::sim {

// SplitMix64 (Steele, Lea and Flood, 2014). Small, and good enough for a simulated handset.
class Random {
 public:
  explicit Random(std::uint64_t seed) : state_(seed) {}

  std::uint64_t next();
  // From 0 up to, not including, 1.
  double fraction();
  double between(double low, double high) { return low + (high - low) * fraction(); }
  // From 0 to count - 1; count is at least 1.
  std::uint32_t below(std::uint32_t count);
  // Both included.
  int among(int low, int high) {
    return low + static_cast<int>(below(static_cast<std::uint32_t>(high - low) + 1));
  }
  bool happens(double probability) { return fraction() < probability; }
  // Normally distributed around 0 with deviation 1.
  double normal();
  // A generator of its own, for a part of the world that must not be upset by how much others draw.
  Random split() { return Random(next()); }

 private:
  std::uint64_t state_;
};

}  // namespace kelvasi::sim
