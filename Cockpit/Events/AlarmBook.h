// SPDX-License-Identifier: Apache-2.0
// The alarms of each rule: how many, and the last one in words.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "Cockpit/Events/EventLine.h"
#include "Survey/Alarms/AlarmWatch.h"

namespace kelvasi::cockpit {

class AlarmBook {
 public:
  // Returns the rule's line as it is from now on.
  AlarmLine take(const survey::Alarm& alarm, const TextStyle& style);
  std::vector<AlarmLine> lines(const survey::AlarmWatch& watch) const;

 private:
  std::map<std::string, AlarmLine> last_;  // by the rule's text
};

// "RSRP -117 dBm, LTE 3350/404", "no RSRP for 30 s, LTE 3350/404", "cell change PCI 404 to 362".
std::string wordsOf(const survey::Alarm& alarm, const TextStyle& style);

}  // namespace kelvasi::cockpit
