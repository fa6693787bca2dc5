// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Decode.h"

namespace kelvasi {

void Decode::take(const CapturedMessage& message) {
  if (const auto time = schedule_.tickBefore(message.arrival)) tick(*time);
  clock_.set(message.arrival);
  update(message);
}

void Decode::finish() {
  if (const auto time = schedule_.lastTick()) tick(*time);
}

void Decode::tick(TickSchedule::Time time) {
  clock_.set(time);
  display_ = generate();
  if (onTick_) onTick_(time, display_);
}

}  // namespace kelvasi
