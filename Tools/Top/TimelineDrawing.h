// SPDX-License-Identifier: Apache-2.0
// The timeline of a drive in lines of text.
#pragma once

#include "Cockpit/Words/TextStyle.h"
#include "Tools/Top/Scene.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

// In three rows the level, events with the moment, and times; in one the times alone.
Lines timelineLines(const Timeline& timeline, int columns, int rows, const cockpit::TextStyle& style,
                    const Look& look);
// The moment at a column.
Arrival momentAt(const Timeline& timeline, int column, int columns);

}  // namespace kelvasi::top
