// SPDX-License-Identifier: Apache-2.0
// Synthetic load: a scenario's messages, made once and repeated at a steady rate.
#pragma once

#include <cstddef>

#include "Simulator/Scenario.h"

namespace kelvasi::sim {

class LoadSource : public MessageSource {
 public:
  // `rate` is in messages per second of the world, more than 0.
  LoadSource(std::unique_ptr<Scenario> scenario, double rate);

  std::optional<WorldTime> nextAt() const override { return WorldTime(slice_ + 1) * sliceLength; }
  void take(Messages& messages) override;
  void rewind() override;

 private:
  static constexpr int sliceLength = 5000;  // µs

  double rate_;
  Messages repertoire_;
  std::int64_t slice_ = 0;
  std::uint64_t given_ = 0;
};

}  // namespace kelvasi::sim
