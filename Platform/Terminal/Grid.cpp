// SPDX-License-Identifier: Apache-2.0
#include "Platform/Terminal/Grid.h"

#include <algorithm>

namespace kelvasi::terminal {

Grid::Grid(Size size)
    : size_{std::max(size.columns, 0), std::max(size.rows, 0)},
      cells_(static_cast<std::size_t>(size_.columns) * static_cast<std::size_t>(size_.rows)) {}

bool Grid::contains(Place place) const {
  return place.column >= 0 && place.column < size_.columns && place.row >= 0 && place.row < size_.rows;
}

// What is written over half of a wide character takes the other half too.
void Grid::clearHalf(Place place) {
  const Place next{place.column + 1, place.row};
  if (at(place).isTail) cells_[indexOf({place.column - 1, place.row})].glyph = {};
  if (contains(next) && at(next).isTail) cells_[indexOf(next)] = {.glyph = {}, .style = at(next).style};
}

void Grid::set(Place place, const Glyph& glyph, Style style) {
  const Place last{place.column + glyph.columns - 1, place.row};
  if (!contains(place) || !contains(last)) return;
  clearHalf(place);
  cells_[indexOf(place)] = {.glyph = glyph, .style = style};
  if (last == place) return;
  clearHalf(last);
  cells_[indexOf(last)] = {.glyph = {}, .style = style, .isTail = true};
}

bool rowsAreEqual(const Grid& one, const Grid& other, int row) {
  const auto begin = static_cast<std::ptrdiff_t>(one.indexOf({0, row}));
  const auto end = begin + one.size_.columns;
  return std::equal(one.cells_.begin() + begin, one.cells_.begin() + end, other.cells_.begin() + begin);
}

std::string Grid::textOfRow(int row) const {
  std::string text;
  for (int column = 0; column < size_.columns; ++column) {
    const Cell& cell = at({column, row});
    if (!cell.isTail) text += textOf(cell.glyph);
  }
  text.erase(text.find_last_not_of(' ') + 1);
  return text;
}

}  // namespace kelvasi::terminal
