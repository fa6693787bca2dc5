// SPDX-License-Identifier: Apache-2.0
// A change of the serving cell, for which a reason has to last.
#pragma once

#include <cstddef>
#include <optional>

namespace kelvasi::sim {

struct CellChange {
  std::optional<std::size_t> to;  // nothing: service is given up
  double patience = 0;            // seconds for which the reason has to last
};

class CellChangeTimer {
 public:
  // Whether the change is due that is wanted now, `seconds` after the last time. The time runs on when
  // another cell has become the better one meanwhile: the reason is that there is one.
  bool pass(const std::optional<CellChange>& wanted, double seconds) {
    const bool isSameReason = wanted && pending_ && wanted->to.has_value() == pending_->to.has_value();
    for_ = isSameReason ? for_ + seconds : 0;
    pending_ = wanted;
    if (!wanted || for_ < wanted->patience) return false;
    pending_.reset();
    return true;
  }

  // Wanted, and not yet due.
  const std::optional<CellChange>& pending() const { return pending_; }

 private:
  std::optional<CellChange> pending_;
  double for_ = 0;  // seconds
};

}  // namespace kelvasi::sim
