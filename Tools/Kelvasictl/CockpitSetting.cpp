// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CockpitSetting.h"

#include <utility>

#include "Tools/OperatorFile.h"

namespace kelvasi {

// A hyphen is a terminal's minus: as wide, and a text that is copied stays a number.
cockpit::TextStyle textStyle(const Clock& clock) {
  cockpit::TextStyle style;
  style.eastOfUtc = [&clock](Arrival at) {
    return std::chrono::seconds(clock.localZone({std::chrono::duration<double>(at).count()}).secondsFromGmt);
  };
  return style;
}

cockpit::CockpitSetUp cockpitSetUp(cockpit::TextStyle style) {
  cockpit::CockpitSetUp setUp;
  setUp.style = std::move(style);
  setUp.operators = loadOperators().operators;
  return setUp;
}

}  // namespace kelvasi
