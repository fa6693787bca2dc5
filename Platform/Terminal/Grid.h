// SPDX-License-Identifier: Apache-2.0
// A screen of characters: what a front end draws, and what a terminal is to look like.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "Platform/Terminal/Glyph.h"

namespace kelvasi::terminal {

// What a colour is for; a theme says which one it is.
enum class Role : std::uint8_t {
  text,
  secondary,
  stale,
  line,
  accent,
  good,
  fair,
  poor,
  series0,  // of eight lines in a chart, in this order
  series1,
  series2,
  series3,
  series4,
  series5,
  series6,
  series7,
};
inline constexpr std::size_t roles = 16;

struct Style {
  Role role = Role::text;
  bool isBold = false;
  bool isReversed = false;

  bool operator==(const Style&) const = default;
};

struct Size {
  int columns = 0;
  int rows = 0;
  bool operator==(const Size&) const = default;
};

struct Place {
  int column = 0;
  int row = 0;
  bool operator==(const Place&) const = default;
};

struct Cell {
  Glyph glyph;
  Style style;
  bool isTail = false;  // the right half of the wide character before it

  bool operator==(const Cell&) const = default;
};

class Grid {
 public:
  // Blank. Never less than nothing.
  explicit Grid(Size size);

  Size size() const { return size_; }
  const Cell& at(Place place) const { return cells_[indexOf(place)]; }
  // Outside of the grid, and for half a wide character, nothing happens.
  void set(Place place, const Glyph& glyph, Style style);
  bool contains(Place place) const;

  // A row as text, its blanks at the end left out.
  std::string textOfRow(int row) const;
  bool operator==(const Grid&) const = default;

 private:
  friend bool rowsAreEqual(const Grid& one, const Grid& other, int row);
  std::size_t indexOf(Place place) const {
    return static_cast<std::size_t>(place.row) * static_cast<std::size_t>(size_.columns) +
           static_cast<std::size_t>(place.column);
  }
  void clearHalf(Place place);

  Size size_;
  std::vector<Cell> cells_;
};

// Of grids of one size.
bool rowsAreEqual(const Grid& one, const Grid& other, int row);

}  // namespace kelvasi::terminal
