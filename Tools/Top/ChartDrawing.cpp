// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/ChartDrawing.h"

#include <algorithm>
#include <cmath>

#include "Tools/Top/DotField.h"

namespace kelvasi::top {

namespace {

using namespace cockpit;

constexpr Style secondary{.role = Role::secondary};
constexpr int axis = 6;  // columns of the values' axis
constexpr int ends = 2;  // columns of the letters at the right

int roundedTo(double place, int steps) {
  return static_cast<int>(std::lround(place * (steps - 1)));
}

// Each point from its least to its most; what is beside each other is joined.
void drawLine(DotField& field, const ChartPicture& picture, std::size_t at) {
  const auto heightOf = [&](double value) {
    return field.height() - 1 - roundedTo(picture.heightOf(value), field.height());
  };
  const auto& points = picture.lines[at].points;
  for (std::size_t x = 0; x < points.size(); ++x) {
    if (points[x].count == 0) continue;
    int top = heightOf(points[x].maximum);
    int bottom = heightOf(points[x].minimum);
    if (x > 0 && points[x - 1].count > 0) {
      const int before = heightOf(points[x - 1].mean);
      top = std::min(top, before);
      bottom = std::max(bottom, before);
    }
    for (int y = std::max(top, 0); y <= std::min(bottom, field.height() - 1); ++y)
      field.set(static_cast<int>(x), y, at);
  }
}

// The serving cell's line last, so that it lies over the others.
void drawAll(DotField& field, const ChartPicture& picture, int columns) {
  for (const ChartMark& mark : picture.marks)
    field.rule(roundedTo(mark.place, columns), "\u250A",
               mark.kind == ChartMark::Kind::mark ? Role::accent : Role::line);
  for (const ChartCursor& cursor : picture.cursors)
    field.rule(roundedTo(cursor.place, columns), "\u2502", Role::accent);
  for (const bool isServing : {false, true})
    for (std::size_t at = 0; at < picture.lines.size(); ++at)
      if (picture.lines[at].isServing == isServing) drawLine(field, picture, at);
}

Lines legendOf(const ChartPicture& picture, std::size_t most) {
  Lines lines;
  for (std::size_t at = 0; at < std::min(picture.lines.size(), most); ++at) {
    const ChartLine& line = picture.lines[at];
    TextLine words;
    words.left = {{letterOf(at) + " ", {.role = roleOfLine(at), .isBold = true}},
                  {line.name, {.isBold = line.isServing}}};
    if (line.isServing) words.left.push_back({"  serving", secondary});
    words.right = {{line.newest}};
    lines.push_back(std::move(words));
  }
  return lines;
}

std::string labelOf(const ChartPicture& picture, int row, int rows, const Look& look) {
  for (const Tick& tick : picture.valueTicks)
    if (rows - 1 - roundedTo(tick.place, rows) == row) return padLeft(tick.text, axis - 1, look) + " ";
  return std::string(axis, ' ');
}

// The letters of the lines whose last point is in this row.
std::vector<Piece> endsOf(const ChartPicture& picture, int row, int rows) {
  for (std::size_t at = 0; at < picture.lines.size(); ++at) {
    const auto& points = picture.lines[at].points;
    if (points.empty() || points.back().count == 0) continue;
    if (rows - 1 - roundedTo(picture.heightOf(points.back().mean), rows) == row)
      return {{" " + letterOf(at), {.role = roleOfLine(at), .isBold = true}}};
  }
  return {};
}

TextLine timeLine(const ChartPicture& picture, int columns, const Look& look) {
  std::string times;
  for (const Tick& tick : picture.timeTicks) {
    const int begin = axis + roundedTo(tick.place, columns) - terminal::widthOf(tick.text, look.set) / 2;
    if (begin > terminal::widthOf(times, look.set)) times = padRight(times, begin, look) + tick.text;
  }
  return {.left = {{times, secondary}}};
}

}  // namespace

Lines drawChart(const MakePicture& make, int columns, int rows, const Look& look) {
  const int plot = columns - axis - ends;
  const bool isBraille = look.set == CharacterSet::utf8 && look.hasColours;
  if (plot < 4 || rows < 4) return {{.left = {{"No room for a chart", {.role = Role::stale}}}}};
  const ChartPicture picture = make(static_cast<std::size_t>(plot * (isBraille ? 2 : 1)));
  if (!picture.why.empty()) return {{.left = {{picture.why, {.role = Role::stale}}}}};
  Lines lines = legendOf(picture, static_cast<std::size_t>(rows / 3));
  const int high = rows - static_cast<int>(lines.size()) - 1;
  DotField field(plot, high, isBraille);
  drawAll(field, picture, plot);
  for (int row = 0; row < high; ++row) {
    TextLine line{.left = {{labelOf(picture, row, high, look), secondary}}};
    for (Piece& piece : field.row(row)) line.left.push_back(std::move(piece));
    for (Piece& piece : endsOf(picture, row, high)) line.left.push_back(std::move(piece));
    lines.push_back(std::move(line));
  }
  lines.push_back(timeLine(picture, plot, look));
  return lines;
}

}  // namespace kelvasi::top
