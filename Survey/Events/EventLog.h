// SPDX-License-Identifier: Apache-2.0
// The newest events of a drive. Those that made way for newer ones are counted.
#pragma once

#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

#include "Survey/Events/Event.h"

namespace kelvasi::survey {

class EventLog {
 public:
  static constexpr std::size_t mostEvents = 4096;

  explicit EventLog(std::size_t most = mostEvents) : most_(most) { events_.reserve(most); }

  void add(Event event) {
    if (events_.size() < most_) {
      events_.push_back(std::move(event));
      return;
    }
    ++dropped_;
    if (most_ == 0) return;
    events_[oldest_] = std::move(event);
    oldest_ = (oldest_ + 1) % most_;
  }

  std::size_t size() const { return events_.size(); }
  // From the oldest, which is 0.
  const Event& at(std::size_t place) const { return events_[(oldest_ + place) % events_.size()]; }
  std::uint64_t dropped() const { return dropped_; }

 private:
  std::size_t most_;
  std::vector<Event> events_;
  std::size_t oldest_ = 0;
  std::uint64_t dropped_ = 0;
};

}  // namespace kelvasi::survey
