// Strengths of pilots as the records of fingers and of EV-DO hold them.
#pragma once

#include <algorithm>
#include <cmath>
#include <cstdint>

namespace kelvasi::sim::c2k {

// In 1/512 of the whole, 16 bits.
inline std::int64_t strengthOf(double dB) {
  return std::clamp<std::int64_t>(std::lround(512 * std::pow(10, dB / 10)), 0, 65535);
}

}  // namespace kelvasi::sim::c2k
