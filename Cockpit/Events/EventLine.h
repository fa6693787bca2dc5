// SPDX-License-Identifier: Apache-2.0
// What happened, when, and marks that a user set.
#pragma once

#include <cstdint>
#include <string>

#include "Cockpit/Words/TextStyle.h"
#include "LogGenerator/Arrival.h"
#include "Radio/CellIdentity.h"
#include "Survey/Events/Event.h"

namespace kelvasi::cockpit {

struct EventLine {
  std::uint64_t number = 0;  // counted from 0 since the beginning
  Arrival time{0};           // its moment
  std::string timeText;      // "21:57:02"
  std::string words;         // "cell change PCI 404 to PCI 362"
  survey::EventKind kind = survey::EventKind::cellChange;
  CellIdentity cell;
};

// In the field's words, cells by the names that people use: "cell change PCI 404 to 362".
std::string wordsOf(const survey::Event& event);
EventLine eventLineOf(const survey::Event& event, std::uint64_t number, const TextStyle& style);

struct MarkLine {
  std::uint64_t number = 0;
  Arrival time{0};
  std::string timeText;
  std::string note;  // empty until one follows
};

struct AlarmLine {
  std::size_t rule = 0;     // its place among the rules
  std::string ruleText;     // "rsrp < -115 for 10s"
  bool isRaised = false;    // it holds now
  std::uint64_t given = 0;  // alarms so far
  std::string words;        // of the last one: "RSRP -117 dBm, LTE 3350/404"; empty before the first
  std::string timeText;     // when it was given
  Arrival time{0};
};

}  // namespace kelvasi::cockpit
