// SPDX-License-Identifier: Apache-2.0
// When a message came in: the time stamp of its capture, or the clock at that moment.
#pragma once

#include <chrono>

#include "Plist/PlistValue.h"

namespace kelvasi {

using Arrival = std::chrono::nanoseconds;  // since 1 January 1970 UTC

// By a clock, which tells no more than microseconds.
inline Arrival arrivalAt(PlistDate date) {
  return std::chrono::round<std::chrono::microseconds>(std::chrono::duration<double>(date.secondsSince1970));
}

}  // namespace kelvasi
