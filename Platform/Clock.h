// SPDX-License-Identifier: Apache-2.0
// The wall clock and the local time zone.
#pragma once

#include "Plist/PlistValue.h"

namespace kelvasi {

struct ZoneState {
  int secondsFromGmt = 0;  // east of Greenwich is positive
  bool isDaylightSaving = false;
};

class Clock {
 public:
  virtual ~Clock() = default;
  virtual PlistDate now() const = 0;
  // The local time zone's state at a moment.
  virtual ZoneState localZone(PlistDate at) const = 0;
};

}  // namespace kelvasi
