// SPDX-License-Identifier: Apache-2.0
// Shapes that say by themselves what their colour says too.
#pragma once

#include <string>

#include "Cockpit/Levels/Level.h"
#include "Cockpit/Link/Link.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

Piece signOf(cockpit::Verdict verdict);
Piece signOf(cockpit::LinkState state);
// "↗", "↘"; nothing for what is steady or not known.
std::string arrowOf(cockpit::Trend trend);
Role roleOf(cockpit::Fade fade);

// The course of a value in so many columns, each one of eight blocks; a blank where there is no value.
// Columns are whole seconds of the clock, so that the course stands still between two of them. Its scale, 8
// units at least, is its own.
std::string courseOf(const cockpit::Line& line, int columns);

}  // namespace kelvasi::top
