// SPDX-License-Identifier: Apache-2.0
// A line of a screen, made of pieces from the left and from the right.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "Platform/Terminal/Grid.h"

namespace kelvasi::top {

using terminal::CharacterSet;
using terminal::Role;
using terminal::Style;

// What a terminal can show.
struct Look {
  CharacterSet set = CharacterSet::utf8;
  bool hasColours = true;
};

struct Piece {
  std::string text;
  Style style = {};
};

struct TextLine {
  std::vector<Piece> left = {};
  std::vector<Piece> right = {};  // at the right edge; what is left of it is cut where both do not fit
  bool isSelected = false;
};
using Lines = std::vector<TextLine>;

struct Area {
  int column = 0;
  int row = 0;
  int columns = 0;
  int rows = 0;

  bool contains(terminal::Place place) const {
    return place.column >= column && place.column < column + columns && place.row >= row &&
           place.row < row + rows;
  }
  bool operator==(const Area&) const = default;
};

// Lines past the area's rows are left out. A text that is cut ends with "…".
void drawLines(terminal::Grid& grid, const Area& area, const Lines& lines, const Look& look);

// "── Cells ──────────── 1-5 of 9 ──"
TextLine ruleLine(std::string_view title, std::string_view right, int columns, const Look& look,
                  bool hasFocus = false);

int widthOf(const std::vector<Piece>& pieces, const Look& look);
// With blanks before or behind it, in so many columns at least.
std::string padLeft(std::string text, int columns, const Look& look);
std::string padRight(std::string text, int columns, const Look& look);
// A text in lines of so many columns at most, broken at blanks where there are some.
std::vector<std::string> wrapped(std::string_view text, int columns, const Look& look);
// What is to be seen of a text from column `skip` on, in so many columns.
std::string windowOf(std::string_view text, int skip, int columns, const Look& look);

}  // namespace kelvasi::top
