// SPDX-License-Identifier: Apache-2.0
// Watches for how long one and the same cell is better than the serving one before it takes over.
#pragma once

#include <cstddef>

namespace kelvasi::sim::test {

class RivalWatch {
 public:
  static constexpr std::size_t nobody = ~std::size_t{0};

  // One step: the cell that serves, and the one that is better by more than the margin.
  void see(std::size_t serving, std::size_t rival) {
    if (rival_ != nobody && serving == rival_) ++takeovers_;
    steps_ = rival != nobody && rival == rival_ && serving == serving_ ? steps_ + 1 : 0;
    serving_ = serving;
    rival_ = rival;
  }

  // For which the rival has been the same already.
  int steps() const { return steps_; }
  int takeovers() const { return takeovers_; }

 private:
  std::size_t serving_ = nobody;
  std::size_t rival_ = nobody;
  int steps_ = 0;
  int takeovers_ = 0;
};

}  // namespace kelvasi::sim::test
