// SPDX-License-Identifier: Apache-2.0
// Something that happened in a drive.
#pragma once

#include <string>

#include "LogGenerator/Arrival.h"
#include "LogGenerator/LogCode.h"
#include "Radio/CellIdentity.h"
#include "Radio/Quantity.h"
#include "Survey/Events/EventKind.h"

namespace kelvasi::survey {

struct Event {
  Arrival time{0};
  EventKind kind = EventKind::cellChange;
  CellIdentity cell = {};              // the serving cell; of a change the new one
  const Quantity* quantity = nullptr;  // whose state changed, or who was rejected
  std::string from = {};               // cell, RAT or state; empty where there is none
  std::string to = {};                 // likewise; of an unknown record its code
  std::string reason = {};  // why, in words; of a reject the cause, of an unknown record what became of it

  // In words: "cell change lte:3350/404 to lte:3350/362"
  std::string text() const;
};

}  // namespace kelvasi::survey
