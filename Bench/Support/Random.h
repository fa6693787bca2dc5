// SPDX-License-Identifier: Apache-2.0
// Numbers that are the same in every run.
#pragma once

#include <cstdint>
#include <random>

namespace kelvasi::bench {

class Random {
 public:
  explicit Random(std::uint32_t seed = 1) : engine_(seed) {}

  // From 0 to limit - 1.
  std::uint64_t below(std::uint64_t limit) { return engine_() % limit; }

 private:
  std::mt19937_64 engine_;
};

}  // namespace kelvasi::bench
