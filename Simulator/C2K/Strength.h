// SPDX-License-Identifier: Apache-2.0
// Strengths of pilots as the records of fingers and of EV-DO hold them.
#pragma once

#include <algorithm>
#include <cmath>
#include <cstdint>

namespace kelvasi::sim::c2k {

// A pilot is reported in half dB down from 0, in six bits (3GPP2 C.S0005, 2.7.2.3.2.5).
inline double reportedRatio(double dB) {
  return std::clamp(dB, -31.5, 0.0);
}

// In 1/512 of the whole, 16 bits. What is hardly heard is one of them, as none at all would be no pilot.
inline std::int64_t strengthOf(double dB) {
  return std::max(std::lround(512 * std::pow(10, reportedRatio(dB) / 10)), 1L);
}

}  // namespace kelvasi::sim::c2k
