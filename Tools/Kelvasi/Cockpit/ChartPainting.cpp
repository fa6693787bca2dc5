// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/ChartPainting.h"

#include <QPolygonF>
#include <algorithm>
#include <array>
#include <chrono>
#include <cmath>

#include "Cockpit/Words/Age.h"
#include "Platform/QtWidgets/Fonts.h"
#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

namespace {

using namespace cockpit;

constexpr double bandStrength = 0.06;
constexpr double spreadStrength = 0.18;
constexpr double bridgedTime = 6e9;  // nanoseconds between two values of one run
constexpr double mostLegend = 0.4;   // of the room
constexpr double nearMark = 6;       // points from a cursor
constexpr double strong = 2.5;       // the serving cell's line
constexpr double usual = 1.5;
constexpr std::size_t colourCount = 8;

const std::array<Qt::PenStyle, 2> styles{Qt::SolidLine, Qt::DashLine};

const QColor& colourOf(const Canvas& canvas, std::size_t place) {
  return canvas.colours.series[place % colourCount];
}

// Of the last column with a value, by its end.
std::optional<Age> newestAge(const ChartPicture& picture, const ChartLine& line, Arrival now) {
  const auto count = static_cast<std::ptrdiff_t>(line.points.size());
  for (std::ptrdiff_t at = count - 1; at >= 0; --at) {
    if (line.points[static_cast<std::size_t>(at)].count == 0) continue;
    const Arrival end = picture.from + (picture.to - picture.from) * (at + 1) / count;
    return ageOf(end, now);
  }
  return std::nullopt;
}

bool isOfNow(const std::optional<Age>& age) {
  return age && age->fade == Fade::none;
}

}  // namespace

std::string legendWords(const ChartPicture& picture, std::size_t line, Arrival now) {
  if (picture.cursors.empty()) {
    const ChartLine& shown = picture.lines[line];
    const auto age = newestAge(picture, shown, now);
    if (!age || isOfNow(age)) return shown.newest;
    return shown.newest + ", " + age->text + (age->fade == Fade::gone ? "" : " ago");
  }
  std::string words;
  for (const ChartCursor& cursor : picture.cursors)
    words += (words.empty() ? "" : "   ") + cursor.values[line].text;
  if (line < picture.differences.size()) words += "   " + picture.differences[line];
  return words;
}

ChartPainting::ChartPainting(const ChartPicture& picture, const QRectF& room, Arrival now)
    : picture_(picture), room_(room), now_(now) {
  const double axis = widthOf(QStringLiteral("\u2212188"), textSize::caption) + gap;
  const double below = lineHeight(textSize::caption) + gap;
  const double above = lineHeight(textSize::caption) + 4;
  plot_ = room.adjusted(pageMargin, above + gap, -pageMargin - axis, -below - legendHeight() - gap);
}

double ChartPainting::legendRow() const {
  return lineHeight(textSize::secondary) + 4;
}

double ChartPainting::legendHeight() const {
  const double all = static_cast<double>(picture_.lines.size()) * legendRow() + gap;
  return std::min(all, room_.height() * mostLegend);
}

void ChartPainting::paint(const Canvas& canvas) const {
  paintBands(canvas);
  paintAxes(canvas);
  paintMarks(canvas);
  canvas.painter().save();
  canvas.painter().setClipRect(plot_.adjusted(-2, -2, 2, 2));
  for (std::size_t place = 0; place < picture_.lines.size(); ++place) paintLine(canvas, place);
  canvas.painter().restore();
  paintCursors(canvas);
  paintLegend(canvas);
  const TextLook look{
      .size = textSize::secondary, .colour = &canvas.colours.secondary, .alignment = Qt::AlignCenter};
  if (!picture_.why.empty()) canvas.text(plot_, shown(picture_.why), look);
}

void ChartPainting::paintBands(const Canvas& canvas) const {
  for (const ChartBand& band : picture_.bands) {
    QColor colour = canvas.colours.of(band.verdict);
    colour.setAlphaF(static_cast<float>(bandStrength));
    canvas.painter().fillRect(QRectF(plot_.left(), plot_.bottom() - band.to * plot_.height(), plot_.width(),
                                     (band.to - band.from) * plot_.height()),
                              colour);
  }
}

// What the values are, or what the cursor is at.
QString ChartPainting::heading() const {
  for (const ChartCursor& cursor : picture_.cursors) {
    for (const ChartMark& mark : picture_.marks) {
      const bool isNear = std::abs(mark.place - cursor.place) * plot_.width() < nearMark;
      if (isNear && !mark.words.empty()) return shown(mark.words);
    }
  }
  if (!picture_.cursorTime.empty()) return shown("between the cursors: " + picture_.cursorTime);
  return shown(picture_.unit);
}

void ChartPainting::paintAxes(const Canvas& canvas) const {
  const double high = lineHeight(textSize::caption);
  const TextLook look{.size = textSize::caption, .colour = &canvas.colours.secondary};
  canvas.text({plot_.left(), plot_.top() - high - 4, room_.right() - pageMargin - plot_.left(), high},
              heading(), look);
  for (const Tick& tick : picture_.valueTicks) {
    const double y = plot_.bottom() - tick.place * plot_.height();
    canvas.rule({plot_.left(), y - 1, plot_.width(), 1});
    const double top = std::clamp(y - high / 2, plot_.top() - high / 2, plot_.bottom() - high / 2);
    canvas.text({plot_.right() + gap, top, room_.right() - plot_.right() - gap, high}, shown(tick.text),
                look);
  }
  for (const Tick& tick : picture_.timeTicks) {
    const QString text = shown(tick.text);
    const double wide = widthOf(text, textSize::caption);
    const double x =
        std::clamp(plot_.left() + tick.place * plot_.width() - wide / 2, plot_.left(), plot_.right() - wide);
    canvas.text({x, plot_.bottom() + 4, wide + 1, high}, text, look);
  }
}

// Cell changes as lines, other events dotted, a user's marks as flags.
void ChartPainting::paintMarks(const Canvas& canvas) const {
  QPainter& painter = canvas.painter();
  for (const ChartMark& mark : picture_.marks) {
    const double x = plot_.left() + mark.place * plot_.width();
    const bool isMark = mark.kind == ChartMark::Kind::mark;
    const QColor& colour = isMark ? canvas.colours.accent : canvas.colours.stale;
    const bool isEvent = mark.kind == ChartMark::Kind::event;
    painter.setPen(QPen(colour, 1, isEvent ? Qt::DotLine : Qt::SolidLine));
    painter.drawLine(QPointF(x, plot_.top()), QPointF(x, plot_.bottom()));
    if (!isMark) continue;
    painter.setBrush(colour);
    painter.drawPolygon(QPolygonF({{x, plot_.top()}, {x + 9, plot_.top() + 4}, {x, plot_.top() + 8}}));
  }
}

// The mean, with the least and the most of each column behind it.
void ChartPainting::paintLine(const Canvas& canvas, std::size_t place) const {
  const ChartLine& line = picture_.lines[place];
  if (line.points.empty()) return;
  const QColor& colour = colourOf(canvas, place);
  QColor weak = colour;
  weak.setAlphaF(static_cast<float>(spreadStrength));
  const auto columns = static_cast<double>(line.points.size());
  const double column = plot_.width() / columns;
  const auto y = [&](double value) { return plot_.bottom() - picture_.heightOf(value) * plot_.height(); };
  const double bridge =
      std::max(1.0, bridgedTime / static_cast<double>((picture_.to - picture_.from).count()) * columns);
  QPainter& painter = canvas.painter();
  QPolygonF run;
  std::vector<QLineF> spreads;
  const QPen pen(colour, line.isServing ? strong : usual, styles[place / colourCount % 2], Qt::RoundCap,
                 Qt::RoundJoin);
  const auto finish = [&] {
    painter.setPen(pen);
    if (run.size() == 1) painter.drawPoint(run.front());
    if (run.size() > 1) painter.drawPolyline(run);
    run.clear();
  };
  for (std::size_t at = 0; at < line.points.size(); ++at) {
    const survey::Spread& point = line.points[at];
    if (point.count == 0 || point.maximum <= point.minimum) continue;
    const double x = plot_.left() + (static_cast<double>(at) + 0.5) * column;
    spreads.emplace_back(x, y(point.minimum), x, y(point.maximum));
  }
  painter.setPen(QPen(weak, std::max(1.0, column), Qt::SolidLine, Qt::FlatCap));
  painter.drawLines(spreads.data(), static_cast<int>(spreads.size()));
  double last = -1e9;
  for (std::size_t at = 0; at < line.points.size(); ++at) {
    if (line.points[at].count == 0) continue;
    if (static_cast<double>(at) - last > bridge) finish();
    last = static_cast<double>(at);
    run.append({plot_.left() + (last + 0.5) * column, y(line.points[at].mean)});
  }
  finish();
}

void ChartPainting::paintCursors(const Canvas& canvas) const {
  double top = plot_.top();
  for (const ChartCursor& cursor : picture_.cursors) {
    const double x = plot_.left() + cursor.place * plot_.width();
    canvas.painter().setPen(QPen(canvas.colours.text, 1));
    canvas.painter().drawLine(QPointF(x, plot_.top()), QPointF(x, plot_.bottom()));
    const QString time = shown(cursor.timeText);
    const double wide = widthOf(time, textSize::caption, true) + 8;
    const QRectF label(std::clamp(x - wide / 2, plot_.left(), plot_.right() - wide), top, wide,
                       lineHeight(textSize::caption) + 2);
    top = label.bottom() + 2;
    canvas.fill(label, canvas.colours.surface, 4);
    canvas.text(label, time, {.size = textSize::caption, .isBold = true, .alignment = Qt::AlignCenter});
  }
}

void ChartPainting::paintLegend(const Canvas& canvas) const {
  double top = room_.bottom() - legendHeight();
  for (std::size_t place = 0; place < picture_.lines.size() && top + legendRow() <= room_.bottom() + 1;
       ++place, top += legendRow()) {
    const ChartLine& line = picture_.lines[place];
    const bool isNow = !picture_.cursors.empty() || isOfNow(newestAge(picture_, line, now_));
    const QRectF row(room_.left() + pageMargin, top, room_.width() - 2 * pageMargin, legendRow());
    canvas.painter().setPen(QPen(colourOf(canvas, place), line.isServing ? 4 : strong,
                                 styles[place / colourCount % 2], Qt::FlatCap));
    canvas.painter().drawLine(QPointF(row.left(), row.center().y()),
                              QPointF(row.left() + 16, row.center().y()));
    const QString value = shown(legendWords(picture_, place, now_));
    const double taken = widthOf(value, textSize::secondary);
    canvas.text(row.adjusted(24, 0, -taken - gap, 0), shown(line.name), {.size = textSize::secondary});
    canvas.text(row, value,
                {.size = textSize::secondary,
                 .colour = isNow ? &canvas.colours.text : &canvas.colours.secondary,
                 .alignment = Qt::AlignRight | Qt::AlignVCenter});
  }
}

}  // namespace kelvasi
