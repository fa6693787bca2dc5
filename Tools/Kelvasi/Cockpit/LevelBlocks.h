// SPDX-License-Identifier: Apache-2.0
// The levels that matter: a large figure, its minute and its verdict.
#pragma once

#include <optional>
#include <vector>

#include "Cockpit/Levels/Level.h"
#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

// How wide the widest of these figures with its unit is.
double figureColumn(const std::vector<cockpit::Level>& levels);

// The first of these levels that are reported, as many as have room beside each other, each above its minute.
// Nothing where there are none.
std::optional<Block> levelTiles(const std::vector<cockpit::Level>& levels, double width);

Block levelBlock(const cockpit::Level& level, double figureColumn, double width);

}  // namespace kelvasi
