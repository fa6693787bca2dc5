// SPDX-License-Identifier: Apache-2.0
// The order of cells on a screen. Rows change places only when one is 2 dB better than the one above it, or
// better at all for 4 s; never while they are held.
#pragma once

#include <chrono>
#include <cstdint>
#include <map>
#include <utility>
#include <vector>

#include "LogGenerator/Arrival.h"

namespace kelvasi::cockpit {

class CellOrder {
 public:
  static constexpr double margin = 2;  // dB
  static constexpr std::chrono::seconds patience{4};

  struct Candidate {
    std::uint32_t number = 0;
    int group = 0;     // the lower stands above, whatever the levels
    double level = 0;  // the higher stands above
  };

  // While held, rows neither move nor leave; new ones come at the end.
  void hold(bool isHeld) { isHeld_ = isHeld; }
  bool isHeld() const { return isHeld_; }

  // The numbers in their order. While held also those that are no candidate any more.
  const std::vector<std::uint32_t>& arrange(const std::vector<Candidate>& candidates, Arrival now);

 private:
  using Pair = std::pair<std::uint32_t, std::uint32_t>;  // the upper, the lower

  void enter(const Candidate& candidate, const std::vector<Candidate>& candidates);
  bool changesPlaces(const Candidate& upper, const Candidate& lower, Arrival now);

  bool isHeld_ = false;
  std::vector<std::uint32_t> order_;
  std::map<Pair, Arrival> betterSince_;  // the lower than the upper
};

}  // namespace kelvasi::cockpit
