// SPDX-License-Identifier: Apache-2.0
// The cockpit's face in lines.
#pragma once

#include <span>

#include "Cockpit/Snapshot.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

// Who serves and whether what is seen is true now. Two lines, and a third where something is the matter.
Lines headLines(const cockpit::Snapshot& face, int columns, const Look& look);
// A line for each level.
Lines levelLines(const cockpit::ServingCell& serving, int columns, const Look& look);
Lines pinLines(const cockpit::Snapshot& face, const Look& look);
Lines cellLines(const cockpit::Snapshot& face, int columns, const Look& look);
Lines carrierLines(const cockpit::Snapshot& face);
Lines alarmLines(const cockpit::Snapshot& face);
TextLine eventLine(const cockpit::EventLine& event);
Lines eventLines(std::span<const cockpit::EventLine> events, const std::string& why);

}  // namespace kelvasi::top
