// SPDX-License-Identifier: Apache-2.0
// A part of a page: as wide as the page, as high as it says.
#pragma once

#include <QString>
#include <functional>
#include <string>
#include <vector>

#include "Tools/Kelvasi/Cockpit/Canvas.h"

namespace kelvasi {

inline constexpr double pageMargin = 16;
inline constexpr double gap = 8;
inline constexpr double leastRow = 44;  // points: what can be touched

struct Block {
  double height = 0;
  std::function<void(const Canvas& canvas, const QRectF& area)> paint;
  std::function<void()> action = {};  // a tap's, and Enter's; empty where there is none
  std::function<void()> more = {};    // of a hold, a right click and Space
  QString spoken = {};                // all of it in words
  // The same for readers that tell a name from its value; without a name what is spoken is the name.
  QString name = {};
  QString value = {};
  bool isHeading = false;
};

using Blocks = std::vector<Block>;

}  // namespace kelvasi
