// SPDX-License-Identifier: Apache-2.0
// The last states of a live display, one a display tick, to go back to.
#pragma once

#include <cstdint>
#include <deque>

#include "Cockpit/Snapshot.h"
#include "Model/KelvasiModelNode.h"

namespace kelvasi {

struct KeptState {
  std::uint64_t number = 0;  // counted from 0 since the beginning
  Arrival time{0};
  NodeRef root;
  cockpit::Snapshot face;
};

class KeptStates {
 public:
  // Two minutes of ticks; a state of a full display is some 60 KB.
  static constexpr std::size_t most = 60;

  void keep(Arrival time, NodeRef root, cockpit::Snapshot face);
  bool isEmpty() const { return states_.empty(); }
  const KeptState& newest() const { return states_.back(); }
  const KeptState& oldest() const { return states_.front(); }
  // Null where it is not kept.
  const KeptState* find(std::uint64_t number) const;
  // The last one that is not after a moment, or the oldest. Null where there is none.
  const KeptState* at(Arrival moment) const;

 private:
  std::deque<KeptState> states_;
  std::uint64_t next_ = 0;
};

}  // namespace kelvasi
