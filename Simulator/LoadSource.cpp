// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LoadSource.h"

namespace kelvasi::sim {

namespace {
constexpr std::size_t repertoireSize = 5000;
}

LoadSource::LoadSource(std::unique_ptr<Scenario> scenario, double rate) : rate_(rate) {
  scenario->greet(repertoire_);
  while (repertoire_.size() < repertoireSize) scenario->step(repertoire_);
}

void LoadSource::take(Messages& messages) {
  ++slice_;
  const double seconds = static_cast<double>(slice_) * sliceLength / 1e6;
  const auto due = static_cast<std::uint64_t>(seconds * rate_);
  for (; given_ < due; ++given_) messages.push_back(repertoire_[given_ % repertoire_.size()]);
}

void LoadSource::rewind() {
  slice_ = 0;
  given_ = 0;
}

}  // namespace kelvasi::sim
