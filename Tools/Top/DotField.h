// SPDX-License-Identifier: Apache-2.0
// Dots in cells of characters: two beside and four above each other in Braille, or one letter a cell.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

class DotField {
 public:
  DotField(int columns, int rows, bool isBraille);

  int width() const { return columns_ * (isBraille_ ? 2 : 1); }
  int height() const { return rows_ * (isBraille_ ? 4 : 1); }
  // From the left and from the top; outside nothing happens. The last line in a cell gives it its colour.
  void set(int x, int y, std::size_t line);
  // A line from top to bottom behind everything.
  void rule(int column, const char* sign, Role role);
  std::vector<Piece> row(int row) const;

 private:
  struct Cell {
    unsigned dots = 0;
    std::optional<std::size_t> line;
    const char* behind = " ";
    Role behindRole = Role::line;
  };

  int columns_;
  int rows_;
  bool isBraille_;
  std::vector<Cell> cells_;
};

Role roleOfLine(std::size_t line);
// "a" for the first.
std::string letterOf(std::size_t line);

}  // namespace kelvasi::top
