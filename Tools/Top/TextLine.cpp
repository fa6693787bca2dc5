// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/TextLine.h"

#include <algorithm>

namespace kelvasi::top {

namespace {

using terminal::Glyph;
using terminal::Grid;
using terminal::Place;

struct StyledGlyph {
  Glyph glyph;
  Style style;
};

std::vector<StyledGlyph> glyphsOf(const std::vector<Piece>& pieces, const Look& look) {
  std::vector<StyledGlyph> glyphs;
  for (const Piece& piece : pieces)
    for (const Glyph& glyph : terminal::glyphsOf(piece.text, look.set))
      glyphs.push_back({glyph, piece.style});
  return glyphs;
}

int columnsOf(const std::vector<StyledGlyph>& glyphs) {
  int columns = 0;
  for (const StyledGlyph& each : glyphs) columns += each.glyph.columns;
  return columns;
}

// To so many columns, the last one then a sign that something is left out.
void cut(std::vector<StyledGlyph>& glyphs, int room, const Look& look) {
  if (columnsOf(glyphs) <= room) return;
  const Style style = glyphs.front().style;
  while (!glyphs.empty() && columnsOf(glyphs) > std::max(room - 1, 0)) glyphs.pop_back();
  if (room > 0) glyphs.push_back({terminal::glyphsOf("\u2026", look.set).front(), style});
}

void put(Grid& grid, Place place, const std::vector<StyledGlyph>& glyphs, bool isSelected) {
  for (const StyledGlyph& each : glyphs) {
    Style style = each.style;
    if (isSelected) style = {.isBold = style.isBold, .isReversed = true};
    grid.set(place, each.glyph, style);
    place.column += each.glyph.columns;
  }
}

void drawLine(Grid& grid, const Area& area, const TextLine& line, const Look& look) {
  const Style blank{.isReversed = line.isSelected};
  for (int column = 0; column < area.columns; ++column) grid.set({area.column + column, area.row}, {}, blank);
  auto right = glyphsOf(line.right, look);
  cut(right, area.columns, look);
  auto left = glyphsOf(line.left, look);
  const int room = area.columns - columnsOf(right) - (right.empty() ? 0 : 1);
  cut(left, std::max(room, 0), look);
  put(grid, {area.column, area.row}, left, line.isSelected);
  put(grid, {area.column + area.columns - columnsOf(right), area.row}, right, line.isSelected);
}

std::string repeated(std::string_view text, int times) {
  std::string all;
  for (int time = 0; time < times; ++time) all += text;
  return all;
}

}  // namespace

void drawLines(Grid& grid, const Area& area, const Lines& lines, const Look& look) {
  for (int row = 0; row < area.rows && static_cast<std::size_t>(row) < lines.size(); ++row)
    drawLine(grid, {area.column, area.row + row, area.columns, 1}, lines[static_cast<std::size_t>(row)],
             look);
}

TextLine ruleLine(std::string_view title, std::string_view right, int columns, const Look& look,
                  bool hasFocus) {
  constexpr Style line{.role = Role::line};
  const Style words{.role = hasFocus ? Role::accent : Role::secondary, .isBold = hasFocus};
  TextLine rule;
  rule.left = {{"\u2500\u2500 ", line}, {std::string(title), words}, {" ", line}};
  if (!right.empty()) rule.right = {{std::string(right), words}, {" \u2500\u2500", line}};
  const int used = widthOf(rule.left, look) + widthOf(rule.right, look) + (right.empty() ? 0 : 1);
  rule.left.push_back({repeated("\u2500", std::max(columns - used, 0)), line});
  return rule;
}

int widthOf(const std::vector<Piece>& pieces, const Look& look) {
  int columns = 0;
  for (const Piece& piece : pieces) columns += terminal::widthOf(piece.text, look.set);
  return columns;
}

std::string padLeft(std::string text, int columns, const Look& look) {
  return repeated(" ", columns - terminal::widthOf(text, look.set)) + text;
}

std::string padRight(std::string text, int columns, const Look& look) {
  const int width = terminal::widthOf(text, look.set);
  return std::move(text) + repeated(" ", columns - width);
}

std::vector<std::string> wrapped(std::string_view text, int columns, const Look& look) {
  std::vector<std::string> lines(1);
  int used = 0;
  std::size_t blank = std::string::npos;  // where the last one is in the line
  for (const Glyph& glyph : terminal::glyphsOf(text, look.set)) {
    if (used + glyph.columns > std::max(columns, 2)) {
      std::string rest;
      if (blank != std::string::npos) {
        rest = lines.back().substr(blank + 1);
        lines.back().erase(blank);
      }
      used = terminal::widthOf(rest, look.set);
      lines.push_back(std::move(rest));
      blank = std::string::npos;
    }
    if (glyph.points[0] == U' ') blank = lines.back().size();
    lines.back() += terminal::textOf(glyph);
    used += glyph.columns;
  }
  return lines;
}

std::string windowOf(std::string_view text, int skip, int columns, const Look& look) {
  std::string shown;
  int column = 0;
  for (const Glyph& glyph : terminal::glyphsOf(text, look.set)) {
    if (column >= skip && column + glyph.columns <= skip + columns) shown += terminal::textOf(glyph);
    column += glyph.columns;
  }
  return shown;
}

}  // namespace kelvasi::top
