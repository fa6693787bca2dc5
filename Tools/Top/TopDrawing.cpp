// SPDX-License-Identifier: Apache-2.0
// How Top draws.
#include <utility>

#include "Tools/Top/ChartDrawing.h"
#include "Tools/Top/FaceLines.h"
#include "Tools/Top/TimelineDrawing.h"
#include "Tools/Top/Top.h"

namespace kelvasi::top {

namespace {

using terminal::Grid;

constexpr std::size_t mostEvents = 1000;  // that are counted in the title
constexpr int highTimeline = 20;          // rows of a screen from which a timeline has three

int rowsOf(const Lines& lines) {
  return static_cast<int>(lines.size());
}

// What does not fit is counted in the title.
std::string moreWords(int count, int room) {
  return room > 0 && count > room ? std::to_string(room) + " of " + std::to_string(count) : "";
}

// What orders the first of them, and its unit.
std::string cellsTitle(const cockpit::Snapshot& face) {
  if (face.cells.empty()) return "Cells";
  const cockpit::Level& level = face.cells.front().level;
  return "Cells, " + std::string(level.name) + " in " + std::string(level.unit) + ", and dB to serving";
}

void drawDivider(Grid& grid, int column, int rows, const Look& look) {
  const auto bar = terminal::glyphsOf("\u2502", look.set).front();
  for (int row = 0; row < rows; ++row) grid.set({column, row}, bar, {.role = Role::line});
}

}  // namespace

Drawing Top::draw(terminal::Size size, const Look& look) {
  Drawing drawing{Grid(size), std::nullopt};
  const cockpit::Snapshot face = scene_.face();
  panes_.reload(scene_.root());
  if (pages_.empty()) {
    drawMain(drawing.grid, face, look);
  } else {
    drawPage(drawing, face, look);
  }
  drawTimeline(drawing.grid, look);
  drawFoot(drawing.grid, look);
  return drawing;
}

void Top::drawTitled(Grid& grid, const Area& area, const std::string& title, const Lines& lines,
                     const Look& look, std::string position) {
  if (area.rows <= 0) return;
  if (position.empty()) position = moreWords(rowsOf(lines), area.rows);
  drawLines(grid, {area.column, area.row - 1, area.columns, 1},
            {ruleLine(title, position, area.columns, look)}, look);
  drawLines(grid, area, lines, look);
}

void Top::drawMain(Grid& grid, const cockpit::Snapshot& face, const Look& look) {
  const terminal::Size size = grid.size();
  const Layout widths = layOut(size, {});  // columns do not depend on wishes
  const int columns = widths.head.columns;
  const Lines head = headLines(face, columns, look);
  const Lines alarms = alarmLines(face);
  const Lines levels = levelLines(face.serving, columns, look);
  const Lines second = face.second ? levelLines(*face.second, columns, look) : Lines{};
  const Lines pins = pinLines(face, look);
  const Lines cells = cellLines(face, columns, look);
  const Lines carriers = carrierLines(face);
  const auto newest = scene_.events(mostEvents);
  const Lines events = eventLines(newest, face.eventsWhy);
  layout_ = layOut(size, {.head = rowsOf(head),
                          .levels = rowsOf(levels),
                          .second = rowsOf(second),
                          .alarms = rowsOf(alarms),
                          .pins = rowsOf(pins),
                          .cells = rowsOf(cells),
                          .carriers = rowsOf(carriers),
                          .events = rowsOf(events),
                          .panes = static_cast<int>(panes_.rows().size()),
                          .timeline = scene_.timeline(0) ? (size.rows >= highTimeline ? 3 : 1) : 0});
  drawLines(grid, layout_.head, head, look);
  drawLines(grid, layout_.alarms, alarms, look);
  drawLines(grid, layout_.levels, levels, look);
  if (face.second) drawTitled(grid, layout_.second, face.second->title, second, look);
  drawTitled(grid, layout_.pins, "Pins", pins, look);
  drawTitled(grid, layout_.cells, cellsTitle(face), cells, look);
  drawTitled(grid, layout_.carriers, "Carriers", carriers, look);
  drawTitled(grid, layout_.events, "Events", events, look);
  const auto room = static_cast<std::size_t>(std::max(layout_.panes.rows, 0));
  panes_.scroll().fit(panes_.rows().size(), room);
  drawTitled(grid, layout_.panes, panes_.way(),
             panes_.lines(layout_.panes.columns, layout_.panes.rows, look, true), look,
             panes_.scroll().words(panes_.rows().size(), room));
  drawSide(grid, look);
}

void Top::drawSide(Grid& grid, const Look& look) {
  if (layout_.divider >= 0) drawDivider(grid, layout_.divider, layout_.body.rows, look);
  if (layout_.divider2 >= 0) drawDivider(grid, layout_.divider2, layout_.body.rows, look);
  if (layout_.chart.rows <= 0) return;
  const Arrival now = scene_.moment();
  const auto wanted = scene_.cockpit().chartLines(now);
  for (const auto& line : std::vector(chart_.lines())) chart_.remove(line);
  for (const auto& line : wanted) chart_.add(line);
  const auto make = [&](std::size_t points) { return scene_.cockpit().draw(chart_, now, points); };
  drawTitled(grid, layout_.chart, "Chart, 5 min",
             drawChart(make, layout_.chart.columns, layout_.chart.rows, look), look, "G larger");
}

// Below the first line of the head, which says who serves and whether it is true.
void Top::drawPage(Drawing& drawing, const cockpit::Snapshot& face, const Look& look) {
  const terminal::Size size = drawing.grid.size();
  layout_ = layOut(size, {.timeline = scene_.timeline(0) ? (size.rows >= highTimeline ? 3 : 1) : 0});
  Lines head = headLines(face, size.columns, look);
  head.resize(1);
  drawLines(drawing.grid, {0, 0, size.columns, 1}, head, look);
  pageArea_ = {0, 2, size.columns, std::max(layout_.body.rows - 2, 0)};
  Page& page = *pages_.back();
  const Lines lines = page.lines(pageArea_.columns, pageArea_.rows, look);
  drawLines(drawing.grid, {0, 1, size.columns, 1},
            {ruleLine(page.title(), page.position(), size.columns, look, true)}, look);
  drawLines(drawing.grid, pageArea_, lines, look);
  if (const auto cursor = page.cursor(look); cursor && pageArea_.rows > 0 && cursor->column < size.columns)
    drawing.cursor = terminal::Place{pageArea_.column + cursor->column, pageArea_.row + cursor->row};
}

void Top::drawTimeline(Grid& grid, const Look& look) {
  if (layout_.timeline.rows <= 0) return;
  const auto timeline = scene_.timeline(static_cast<std::size_t>(layout_.timeline.columns));
  if (!timeline) return;
  drawLines(grid, layout_.timeline,
            timelineLines(*timeline, layout_.timeline.columns, layout_.timeline.rows, style_, look), look);
}

// The longest list of keys that fits beside the words.
void Top::drawFoot(Grid& grid, const Look& look) {
  TextLine foot;
  foot.left = {message_.empty() ? Piece{scene_.status(), {.role = Role::secondary}}
                                : Piece{message_, {.role = Role::accent, .isBold = true}}};
  std::vector<std::string> choices{"q quit  / search  P pause  G chart  ? keys", "q quit  ? keys", "? keys"};
  if (!pages_.empty()) choices = {pages_.back()->keys(), "Esc back"};
  const int room = layout_.foot.columns - widthOf(foot.left, look) - 2;
  for (const std::string& keys : choices) {
    if (terminal::widthOf(keys, look.set) > room) continue;
    foot.right = {{keys, {.role = Role::secondary}}};
    break;
  }
  drawLines(grid, layout_.foot, {foot}, look);
}

}  // namespace kelvasi::top
