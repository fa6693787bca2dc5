// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/Frames.h"

#include <cmath>

namespace kelvasi::sim::c2k {

namespace {
constexpr double targetErrorRate = 0.005;
constexpr double evenRatio = -15.5;  // dB at which every second frame is lost
constexpr double steepness = 1.6;    // per dB
}  // namespace

double combinedRatio(const PilotSets& pilots, std::span<const double> ratios) {
  double sum = 0;
  for (const std::size_t pilot : pilots.active()) sum += std::pow(10, ratios[pilot] / 10);
  return 10 * std::log10(sum);
}

double frameErrorProbability(double ratio) {
  return targetErrorRate + (1 - targetErrorRate) / (1 + std::exp(steepness * (ratio - evenRatio)));
}

std::vector<bool> receiveFrames(double ratio, double seconds, Random& random) {
  const double probability = frameErrorProbability(ratio);
  std::vector<bool> frames(static_cast<std::size_t>(std::lround(seconds / frameSeconds)));
  for (auto&& isError : frames) isError = random.happens(probability);
  return frames;
}

}  // namespace kelvasi::sim::c2k
