// SPDX-License-Identifier: Apache-2.0
// What is drawn, as text.
#pragma once

#include <clocale>
#include <string>

#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

inline std::string asText(const terminal::Grid& grid) {
  std::string text;
  for (int row = 0; row < grid.size().rows; ++row) text += grid.textOfRow(row) + "\n";
  return text;
}

inline std::string asText(const Lines& lines, int columns, const Look& look = {}) {
  std::setlocale(LC_CTYPE, "C.UTF-8");
  terminal::Grid grid({columns, static_cast<int>(lines.size())});
  drawLines(grid, {0, 0, columns, grid.size().rows}, lines, look);
  return asText(grid);
}

}  // namespace kelvasi::top
