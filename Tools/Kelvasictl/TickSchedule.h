// SPDX-License-Identifier: Apache-2.0
// When the display ticks of a capture fall: every 2.0 s of its time, counted from its first message, where
// messages have arrived since the tick before.
#pragma once

#include <chrono>
#include <optional>

namespace kelvasi {

class TickSchedule {
 public:
  using Time = std::chrono::nanoseconds;  // since 1970, not negative
  static constexpr Time interval = std::chrono::seconds(2);

  // Given each message's arrival in turn, the time of the tick that falls between it and the message before.
  // A stamp that goes back counts as no time passing.
  std::optional<Time> tickBefore(Time arrival);

  // The time of the tick after the last message; nothing when there was none.
  std::optional<Time> lastTick() const { return last_; }

 private:
  std::optional<Time> last_;
  Time next_{0};
};

}  // namespace kelvasi
