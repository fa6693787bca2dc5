// SPDX-License-Identifier: Apache-2.0
// The levels that matter: a large figure, its minute and its verdict.
#pragma once

#include <vector>

#include "Cockpit/Levels/Level.h"
#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

// How wide the widest of these figures with its unit is.
double figureColumn(const std::vector<cockpit::Level>& levels);

Block levelBlock(const cockpit::Level& level, double figureColumn, double width);

}  // namespace kelvasi
