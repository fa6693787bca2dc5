// SPDX-License-Identifier: Apache-2.0
// A chart in lines of text: dots of Braille patterns, or letters where those cannot be shown.
#pragma once

#include <functional>

#include "Cockpit/Chart/Chart.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

// Makes the picture of a chart with so many points beside each other.
using MakePicture = std::function<cockpit::ChartPicture(std::size_t points)>;

// In so many columns and rows: a legend with the newest values, then the plot, then the times. Each line has
// a letter, which stands in the legend and at the line's end.
Lines drawChart(const MakePicture& make, int columns, int rows, const Look& look);

}  // namespace kelvasi::top
