// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Random.h"

#include <cmath>
#include <numbers>

namespace kelvasi::sim {

std::uint64_t Random::next() {
  state_ += 0x9E3779B97F4A7C15;
  std::uint64_t mixed = state_;
  mixed = (mixed ^ (mixed >> 30)) * 0xBF58476D1CE4E5B9;
  mixed = (mixed ^ (mixed >> 27)) * 0x94D049BB133111EB;
  return mixed ^ (mixed >> 31);
}

double Random::fraction() {
  return static_cast<double>(next() >> 11) * 0x1p-53;
}

std::uint32_t Random::below(std::uint32_t count) {
  return static_cast<std::uint32_t>(((next() >> 32) * count) >> 32);
}

// Box and Muller's transform.
double Random::normal() {
  const double radius = std::sqrt(-2 * std::log(1 - fraction()));
  return radius * std::cos(2 * std::numbers::pi * fraction());
}

}  // namespace kelvasi::sim
