// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/DotField.h"

#include <algorithm>
#include <array>

#include "Platform/Plist/Utf8.h"

namespace kelvasi::top {

namespace {

// By row, then column (Unicode, block 2800).
constexpr std::array<std::array<unsigned, 2>, 4> bits{
    {{0x01, 0x08}, {0x02, 0x10}, {0x04, 0x20}, {0x40, 0x80}}};
constexpr char32_t braille = 0x2800;

}  // namespace

DotField::DotField(int columns, int rows, bool isBraille)
    : columns_(std::max(columns, 0)),
      rows_(std::max(rows, 0)),
      isBraille_(isBraille),
      cells_(static_cast<std::size_t>(columns_) * static_cast<std::size_t>(rows_)) {}

void DotField::set(int x, int y, std::size_t line) {
  if (x < 0 || y < 0 || x >= width() || y >= height()) return;
  const int column = isBraille_ ? x / 2 : x;
  const int row = isBraille_ ? y / 4 : y;
  Cell& cell = cells_[static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_) +
                      static_cast<std::size_t>(column)];
  cell.dots |= isBraille_ ? bits[static_cast<std::size_t>(y % 4)][static_cast<std::size_t>(x % 2)] : 1;
  cell.line = line;
}

void DotField::rule(int column, const char* sign, Role role) {
  for (int row = 0; row < rows_ && column >= 0 && column < columns_; ++row) {
    Cell& cell = cells_[static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_) +
                        static_cast<std::size_t>(column)];
    cell.behind = sign;
    cell.behindRole = role;
  }
}

std::vector<Piece> DotField::row(int row) const {
  std::vector<Piece> pieces;
  for (int column = 0; column < columns_; ++column) {
    const Cell& cell = cells_[static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_) +
                              static_cast<std::size_t>(column)];
    Piece piece{cell.behind, {.role = cell.behindRole}};
    if (cell.line) {
      piece.style.role = roleOfLine(*cell.line);
      piece.text = isBraille_ ? "" : letterOf(*cell.line);
      if (isBraille_) appendUtf8(piece.text, braille + cell.dots);
    }
    if (!pieces.empty() && pieces.back().style == piece.style) {
      pieces.back().text += piece.text;
    } else {
      pieces.push_back(std::move(piece));
    }
  }
  return pieces;
}

Role roleOfLine(std::size_t line) {
  return static_cast<Role>(static_cast<std::size_t>(Role::series0) + line % 8);
}

std::string letterOf(std::size_t line) {
  return {static_cast<char>('a' + line % 26)};
}

}  // namespace kelvasi::top
