// SPDX-License-Identifier: Apache-2.0
// The pilot sets that a handset keeps (3GPP2 C.S0005 for 1x, C.S0024 for EV-DO): active, candidate and
// neighbour pilots, moved between them by their strength, simplified.
#pragma once

#include <cstddef>
#include <span>
#include <vector>

namespace kelvasi::sim::c2k {

class PilotSets {
 public:
  static constexpr std::size_t largest = 6;
  static constexpr double addThreshold = -14;   // dB, T_ADD or PilotAdd
  static constexpr double dropThreshold = -16;  // dB, T_DROP or PilotDrop
  static constexpr double comparison = 2.5;     // dB, T_COMP or PilotCompare
  static constexpr double dropTime = 4;         // seconds, T_TDROP or PilotDropTimer

  explicit PilotSets(std::size_t cellCount) : belowFor_(cellCount), candidateFor_(cellCount) {}

  // No pilot at all; one pilot alone; of several active ones only the strongest.
  void clear();
  void acquire(std::size_t pilot);
  void endHandOff(std::span<const double> ratios);

  // With the Ec/Io of every cell, dB, for so many seconds: idle hand-off moves the only active pilot, soft
  // hand-off adds and drops pilots.
  void passIdle(std::span<const double> ratios, double seconds);
  void passConnected(std::span<const double> ratios, double seconds);

  // Places of the cells. The first active one is the reference.
  const std::vector<std::size_t>& active() const { return active_; }
  const std::vector<std::size_t>& candidates() const { return candidates_; }
  const std::vector<std::size_t>& neighbours() const { return neighbours_; }
  bool isActive(std::size_t pilot) const;

 private:
  void dropWeak();
  void findCandidates(std::span<const double> ratios, double seconds);
  void admit(std::size_t candidate, std::span<const double> ratios);
  void findNeighbours(std::span<const double> ratios);

  std::vector<std::size_t> active_;
  std::vector<std::size_t> candidates_;
  std::vector<std::size_t> neighbours_;
  std::vector<double> belowFor_;      // seconds, by cell
  std::vector<double> candidateFor_;  // seconds, by cell; 0 of what is no candidate
  double betterFor_ = 0;              // seconds
};

}  // namespace kelvasi::sim::c2k
