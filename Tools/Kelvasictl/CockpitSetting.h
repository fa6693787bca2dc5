// SPDX-License-Identifier: Apache-2.0
// How a terminal's cockpit is set up.
#pragma once

#include "Cockpit/Cockpit.h"
#include "Platform/Clock.h"

namespace kelvasi {

// With the clock's local time, and a hyphen for a minus.
cockpit::TextStyle textStyle(const Clock& clock);
// With the user's names of operators.
cockpit::CockpitSetUp cockpitSetUp(cockpit::TextStyle style);

}  // namespace kelvasi
