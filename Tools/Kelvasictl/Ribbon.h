// SPDX-License-Identifier: Apache-2.0
// The key level of whichever cell served, over the whole of a drive.
#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include "Cockpit/Snapshot.h"
#include "Survey/Series/Spread.h"

namespace kelvasi {

class Ribbon {
 public:
  static constexpr std::size_t most = 4096;  // values; past them every second one goes

  // When it wants the next value.
  Arrival next() const { return next_; }
  // `upcoming`: of the message after this moment; nothing is wanted before it.
  void take(const cockpit::Snapshot& face, Arrival upcoming);
  // In equal stretches of the time.
  std::vector<survey::Spread> stretches(Arrival from, Arrival to, std::size_t count) const;
  const std::string& level() const { return level_; }  // "RSRP"; empty before there was one

 private:
  struct Value {
    Arrival time;
    float value;
  };

  std::vector<Value> values_;
  std::chrono::nanoseconds interval_ = std::chrono::seconds(2);
  Arrival next_ = Arrival::min();
  std::string level_;
};

}  // namespace kelvasi
