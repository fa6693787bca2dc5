// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/PilotSets.h"

#include <algorithm>
#include <iterator>

namespace kelvasi::sim::c2k {

namespace {

constexpr double idleMargin = 3;       // dB
constexpr double idleTime = 1;         // seconds
constexpr double directionTime = 0.4;  // seconds from the pilot's report to the hand-off direction
constexpr double weakestHeard = -22;   // dB

bool contains(const std::vector<std::size_t>& pilots, std::size_t pilot) {
  return std::ranges::find(pilots, pilot) != pilots.end();
}

}  // namespace

bool PilotSets::isActive(std::size_t pilot) const {
  return contains(active_, pilot);
}

void PilotSets::clear() {
  active_.clear();
  candidates_.clear();
  neighbours_.clear();
}

void PilotSets::acquire(std::size_t pilot) {
  clear();
  active_ = {pilot};
  std::ranges::fill(belowFor_, 0.0);
  std::ranges::fill(candidateFor_, 0.0);
  betterFor_ = 0;
}

void PilotSets::endHandOff(std::span<const double> ratios) {
  if (active_.empty()) return;
  acquire(*std::ranges::max_element(active_, {}, [&](std::size_t pilot) { return ratios[pilot]; }));
}

void PilotSets::passIdle(std::span<const double> ratios, double seconds) {
  if (active_.empty()) return;
  const auto best =
      static_cast<std::size_t>(std::distance(ratios.begin(), std::max_element(ratios.begin(), ratios.end())));
  betterFor_ = ratios[best] > ratios[active_.front()] + idleMargin ? betterFor_ + seconds : 0;
  if (betterFor_ >= idleTime) acquire(best);
  findNeighbours(ratios);
}

void PilotSets::passConnected(std::span<const double> ratios, double seconds) {
  if (active_.empty()) return;
  for (std::size_t pilot = 0; pilot < ratios.size(); ++pilot)
    belowFor_[pilot] = ratios[pilot] < dropThreshold ? belowFor_[pilot] + seconds : 0;
  dropWeak();
  findCandidates(ratios, seconds);
  const std::vector<std::size_t> waiting = candidates_;
  for (const std::size_t pilot : waiting) {
    if (candidateFor_[pilot] > directionTime) admit(pilot, ratios);
  }
  std::erase_if(candidates_, [this](std::size_t pilot) { return isActive(pilot); });
  findNeighbours(ratios);
}

// The last one stays: without it there would be no connection.
void PilotSets::dropWeak() {
  for (std::size_t place = active_.size(); place-- > 0 && active_.size() > 1;) {
    if (belowFor_[active_[place]] >= dropTime)
      active_.erase(active_.begin() + static_cast<std::ptrdiff_t>(place));
  }
}

void PilotSets::findCandidates(std::span<const double> ratios, double seconds) {
  candidates_.clear();
  for (std::size_t pilot = 0; pilot < ratios.size(); ++pilot) {
    const bool wasCandidate = candidateFor_[pilot] > 0;
    const bool isCandidate =
        !isActive(pilot) && (ratios[pilot] > addThreshold || (wasCandidate && belowFor_[pilot] < dropTime));
    candidateFor_[pilot] = isCandidate ? candidateFor_[pilot] + seconds : 0;
    if (isCandidate) candidates_.push_back(pilot);
  }
  std::ranges::sort(candidates_, std::ranges::greater(), [&](std::size_t pilot) { return ratios[pilot]; });
}

void PilotSets::admit(std::size_t candidate, std::span<const double> ratios) {
  if (ratios[candidate] <= addThreshold) return;
  if (active_.size() < largest) return active_.push_back(candidate);
  const auto weakest =
      std::ranges::min_element(active_, {}, [&](std::size_t pilot) { return ratios[pilot]; });
  if (ratios[candidate] > ratios[*weakest] + comparison) *weakest = candidate;
}

void PilotSets::findNeighbours(std::span<const double> ratios) {
  neighbours_.clear();
  for (std::size_t pilot = 0; pilot < ratios.size(); ++pilot) {
    if (ratios[pilot] > weakestHeard && !isActive(pilot) && !contains(candidates_, pilot))
      neighbours_.push_back(pilot);
  }
}

}  // namespace kelvasi::sim::c2k
