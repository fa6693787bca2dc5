// SPDX-License-Identifier: Apache-2.0
// What the cockpit shows at one moment, ready to be drawn: values and words, no points, fonts or colours.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "Cockpit/Cells/CellLine.h"
#include "Cockpit/Events/EventLine.h"
#include "Cockpit/Link/Link.h"
#include "Cockpit/Rows/Pins.h"
#include "Cockpit/Serving/ServingCell.h"
#include "Plist/PlistValue.h"

namespace kelvasi::cockpit {

struct Snapshot {
  Arrival time{0};
  Link link;
  ServingCell serving;
  std::optional<ServingCell> second;  // the other air interface's, in CDMA
  std::vector<CellLine> cells;        // the best first
  std::string cellsWhy;               // where there are none: "No neighbours reported yet"
  std::vector<CarrierLine> carriers;  // the serving one first
  std::vector<EventLine> events;      // the last three, the newest first
  std::string eventsWhy;              // "Nothing has happened yet"
  std::uint64_t eventCount = 0;
  std::vector<PinLine> pins;
  std::vector<AlarmLine> alarms;  // one a rule
  std::vector<MarkLine> marks;    // the newest first
};

// As keys and values, for scripts.
PlistValue plistOf(const Snapshot& snapshot);

}  // namespace kelvasi::cockpit
