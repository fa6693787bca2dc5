// SPDX-License-Identifier: Apache-2.0
// Where the daemon's messages come from: a scenario, a capture, a synthetic load.
#pragma once

#include <optional>

#include "Simulator/Message.h"

namespace kelvasi::sim {

class MessageSource {
 public:
  virtual ~MessageSource() = default;

  // When the next messages are due, never earlier than before; nothing once the source has ended.
  virtual std::optional<WorldTime> nextAt() const = 0;
  // Appends the messages due then and moves on. To be called only while nextAt() gives a time.
  virtual void take(Messages& messages) = 0;
  // Appends what an application that starts its stream now has to be told of the present state.
  virtual void greet(Messages&) {}
  // Begins anew, at time 0.
  virtual void rewind() = 0;
};

}  // namespace kelvasi::sim
