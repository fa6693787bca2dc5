// SPDX-License-Identifier: Apache-2.0
// What the cursors of a chart read.
#pragma once

#include <vector>

#include "Cockpit/Chart/Chart.h"
#include "Cockpit/Chart/LineSource.h"

namespace kelvasi::cockpit {

// `sources`: of the picture's lines.
void addCursors(ChartPicture& picture, const Chart& chart, const std::vector<LineSource>& sources,
                const TextStyle& style);

}  // namespace kelvasi::cockpit
