// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/KeptStates.h"

#include <algorithm>
#include <utility>

namespace kelvasi {

void KeptStates::keep(Arrival time, NodeRef root, cockpit::Snapshot face) {
  states_.push_back({next_++, time, std::move(root), std::move(face)});
  if (states_.size() > most) states_.pop_front();
}

const KeptState* KeptStates::find(std::uint64_t number) const {
  if (isEmpty() || number < oldest().number || number > newest().number) return nullptr;
  return &states_[static_cast<std::size_t>(number - oldest().number)];
}

const KeptState* KeptStates::at(Arrival moment) const {
  if (isEmpty()) return nullptr;
  const auto later =
      std::ranges::find_if(states_, [moment](const KeptState& state) { return state.time > moment; });
  return later == states_.begin() ? &states_.front() : &*std::prev(later);
}

}  // namespace kelvasi
