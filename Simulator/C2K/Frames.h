// SPDX-License-Identifier: Apache-2.0
// How the forward traffic channel of 1x is received: its frames of 20 ms, each whole or in error.
#pragma once

#include <span>
#include <vector>

#include "Simulator/C2K/PilotSets.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::c2k {

inline constexpr double frameSeconds = 0.02;

// dB: of all active pilots together, as a rake receiver adds them up.
double combinedRatio(const PilotSets& pilots, std::span<const double> ratios);

// How likely a frame is in error at this Ec/Io, dB: rare as long as the base station's power control can make
// up for it, certain in a deep fade.
double frameErrorProbability(double ratio);

// The frames of so many seconds, in order; true is an error.
std::vector<bool> receiveFrames(double ratio, double seconds, Random& random);

}  // namespace kelvasi::sim::c2k
