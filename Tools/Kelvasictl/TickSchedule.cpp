// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/TickSchedule.h"

namespace kelvasi {

std::optional<TickSchedule::Time> TickSchedule::tickBefore(Time arrival) {
  if (!last_) next_ = arrival + interval;
  if (last_ && arrival < *last_) next_ -= *last_ - arrival;
  last_ = arrival;
  if (arrival < next_) return std::nullopt;
  const Time tick = next_;
  next_ += interval * ((arrival - next_) / interval + 1);
  return tick;
}

}  // namespace kelvasi
