// SPDX-License-Identifier: Apache-2.0
// The system's clock and the user's time zone (TZ, else the machine's).
#pragma once

#include "Platform/Clock.h"

namespace kelvasi {

class PosixClock : public Clock {
 public:
  PlistDate now() const override;
  // Sees a change of the zone at once. A moment no calendar reaches is taken to be at GMT.
  ZoneState localZone(PlistDate at) const override;
};

}  // namespace kelvasi
