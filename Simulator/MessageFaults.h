// SPDX-License-Identifier: Apache-2.0
// Damages the stream of messages as the requested faults say.
#pragma once

#include <cstdint>

#include "Simulator/Faults.h"
#include "Simulator/Message.h"

namespace kelvasi::sim {

class MessageFaults {
 public:
  explicit MessageFaults(const Faults& faults);

  bool isIdle() const { return !prefixEvery_ && !shortEvery_ && !invalidTypeEvery_ && !otherIdEvery_; }
  // Changes messages, and adds some after them. Counts from the first message that it ever saw.
  void apply(Messages& messages);

 private:
  // Every how many messages; 0 is never.
  using Period = std::uint64_t;

  bool strikes(Period every) const { return every != 0 && count_ % every == 0; }
  void damage(Message& message) const;

  Period prefixEvery_;
  Period shortEvery_;
  Period invalidTypeEvery_;
  Period otherIdEvery_;
  std::uint64_t count_ = 0;
};

}  // namespace kelvasi::sim
