// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/ChartPage.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPolygonF>
#include <QWheelEvent>
#include <algorithm>
#include <array>
#include <cmath>

#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {

using namespace cockpit;

constexpr double nearer = 0.7;  // of the window, for each step of + and the wheel
constexpr double step = 0.25;   // of the window, for each arrow
constexpr double bandStrength = 0.06;
constexpr double spreadStrength = 0.18;
constexpr double tapRange = 8;  // points

const std::array<Qt::PenStyle, 2> styles{Qt::SolidLine, Qt::DashLine};

}  // namespace

ChartPage::ChartPage(QWidget* parent, Cockpit& cockpit, std::function<Arrival()> now,
                     std::vector<ChartLineKey> lines)
    : CockpitPage(tr("Chart"), parent),
      cockpit_(cockpit),
      now_(std::move(now)),
      followsServing_(lines.empty()) {
  setFocusPolicy(Qt::StrongFocus);
  setAccessibleName(title());
  for (const ChartLineKey& line : lines) chart_.add(line);
}

void ChartPage::refresh() {
  if (!isVisible()) return;
  take();
  setAccessibleDescription(texts().join(QStringLiteral(". ")));
  update();
}

void ChartPage::take() {
  if (followsServing_) {
    for (const ChartLineKey& line : std::vector(chart_.lines())) chart_.remove(line);
    for (const ChartLineKey& line : cockpit_.chartLines(now_())) chart_.add(line);
  }
  picture_ = cockpit_.draw(chart_, now_(), static_cast<std::size_t>(std::max(2.0, plot().width() / 2)));
}

QStringList ChartPage::texts() const {
  QStringList texts;
  for (const ChartLine& line : picture_.lines) texts.append(shown(line.name + ", " + line.newest));
  for (const ChartCursor& cursor : picture_.cursors) {
    std::string words = cursor.timeText;
    for (const CursorValue& value : cursor.values) words += ", " + value.text;
    texts.append(shown(words));
  }
  if (!picture_.why.empty()) texts.append(shown(picture_.why));
  return texts;
}

double ChartPage::legendHeight() const {
  return static_cast<double>(picture_.lines.size()) * (lineHeight(textSize::secondary) + 4) + gap;
}

QRectF ChartPage::plot() const {
  const double axis = widthOf(QStringLiteral("\u2212188"), textSize::caption) + gap;
  const double below = lineHeight(textSize::caption) + gap;
  const double legend = std::min(legendHeight(), height() * 0.4);
  return QRectF(rect()).adjusted(pageMargin, gap, -pageMargin - axis, -below - legend - gap);
}

double ChartPage::placeOf(const QPointF& position) const {
  return std::clamp((position.x() - plot().left()) / plot().width(), 0.0, 1.0);
}

void ChartPage::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  const Canvas canvas(painter, coloursFor(palette()));
  painter.fillRect(rect(), canvas.colours.ground);
  const QRectF area = plot();
  drawBehind(canvas, area);
  painter.save();
  painter.setClipRect(area.adjusted(-2, -2, 2, 2));
  for (std::size_t place = 0; place < picture_.lines.size(); ++place) drawLine(canvas, area, place);
  painter.restore();
  drawCursors(canvas, area);
  drawLegend(canvas);
  if (!picture_.why.empty())
    canvas.text(
        area, shown(picture_.why),
        {.size = textSize::secondary, .colour = &canvas.colours.secondary, .alignment = Qt::AlignCenter});
}

void ChartPage::drawBehind(const Canvas& canvas, const QRectF& area) const {
  for (const ChartBand& band : picture_.bands) {
    QColor colour = canvas.colours.of(band.verdict);
    colour.setAlphaF(static_cast<float>(bandStrength));
    canvas.painter().fillRect(QRectF(area.left(), area.bottom() - band.to * area.height(), area.width(),
                                     (band.to - band.from) * area.height()),
                              colour);
  }
  const double high = lineHeight(textSize::caption);
  const TextLook look{.size = textSize::caption, .colour = &canvas.colours.secondary};
  for (const Tick& tick : picture_.valueTicks) {
    const double y = area.bottom() - tick.place * area.height();
    canvas.rule({area.left(), y - 1, area.width(), 1});
    canvas.text({area.right() + gap, y - high / 2, width() - area.right() - gap, high}, shown(tick.text),
                look);
  }
  for (const Tick& tick : picture_.timeTicks) {
    const QString text = shown(tick.text);
    const double wide = widthOf(text, textSize::caption);
    const double x =
        std::clamp(area.left() + tick.place * area.width() - wide / 2, area.left(), area.right() - wide);
    canvas.text({x, area.bottom() + 4, wide + 1, high}, text, look);
  }
  for (const ChartMark& mark : picture_.marks) {
    const double x = area.left() + mark.place * area.width();
    const bool isMark = mark.kind == ChartMark::Kind::mark;
    canvas.painter().setPen(QPen(isMark ? canvas.colours.accent : canvas.colours.stale, 1,
                                 mark.kind == ChartMark::Kind::event ? Qt::DotLine : Qt::SolidLine));
    canvas.painter().drawLine(QPointF(x, area.top()), QPointF(x, area.bottom()));
  }
}

// The mean, with the least and the most of each column behind it.
void ChartPage::drawLine(const Canvas& canvas, const QRectF& area, std::size_t place) const {
  const ChartLine& line = picture_.lines[place];
  if (line.points.empty()) return;
  const QColor colour = canvas.colours.series[place % canvas.colours.series.size()];
  QColor weak = colour;
  weak.setAlphaF(static_cast<float>(spreadStrength));
  const double column = area.width() / static_cast<double>(line.points.size());
  const auto y = [&](double value) { return area.bottom() - picture_.heightOf(value) * area.height(); };
  QPainter& painter = canvas.painter();
  QPolygonF run;
  const auto finish = [&] {
    painter.setPen(
        QPen(colour, line.isServing ? 2.5 : 1.5, styles[place / 8 % 2], Qt::RoundCap, Qt::RoundJoin));
    if (run.size() == 1) painter.drawPoint(run.front());
    if (run.size() > 1) painter.drawPolyline(run);
    run.clear();
  };
  // A value that comes every second or two is no gap in a minute's chart.
  const double bridge = std::max(1.0, 6e9 / static_cast<double>((picture_.to - picture_.from).count()) *
                                          static_cast<double>(line.points.size()));
  double last = -1e9;
  for (std::size_t at = 0; at < line.points.size(); ++at) {
    const survey::Spread& point = line.points[at];
    if (point.count == 0) continue;
    if (static_cast<double>(at) - last > bridge) finish();
    last = static_cast<double>(at);
    const double x = area.left() + (last + 0.5) * column;
    if (point.maximum > point.minimum) {
      painter.setPen(QPen(weak, std::max(1.0, column)));
      painter.drawLine(QPointF(x, y(point.minimum)), QPointF(x, y(point.maximum)));
    }
    run.append({x, y(point.mean)});
  }
  finish();
}

void ChartPage::drawCursors(const Canvas& canvas, const QRectF& area) const {
  for (const ChartCursor& cursor : picture_.cursors) {
    const double x = area.left() + cursor.place * area.width();
    canvas.painter().setPen(QPen(canvas.colours.text, 1));
    canvas.painter().drawLine(QPointF(x, area.top()), QPointF(x, area.bottom()));
    const QString time = shown(cursor.timeText);
    const double wide = widthOf(time, textSize::caption, true) + 8;
    const QRectF label(std::clamp(x - wide / 2, area.left(), area.right() - wide), area.top(), wide,
                       lineHeight(textSize::caption) + 2);
    canvas.fill(label, canvas.colours.surface, 4);
    canvas.text(label, time, {.size = textSize::caption, .isBold = true, .alignment = Qt::AlignCenter});
  }
}

// Each line's name with its newest value or, with cursors, its values there and their difference.
void ChartPage::drawLegend(const Canvas& canvas) const {
  const double high = lineHeight(textSize::secondary) + 4;
  double top = height() - std::min(legendHeight(), height() * 0.4);
  for (std::size_t place = 0; place < picture_.lines.size(); ++place, top += high) {
    const ChartLine& line = picture_.lines[place];
    std::string words = line.newest;
    if (!picture_.cursors.empty()) words.clear();
    for (const ChartCursor& cursor : picture_.cursors)
      words += (words.empty() ? "" : "  ") + cursor.values[place].text;
    if (place < picture_.differences.size()) words += "  " + picture_.differences[place];
    const QRectF row(pageMargin, top, width() - 2 * pageMargin, high);
    canvas.painter().setPen(
        QPen(canvas.colours.series[place % canvas.colours.series.size()], line.isServing ? 4 : 2.5));
    canvas.painter().drawLine(QPointF(row.left(), row.center().y()),
                              QPointF(row.left() + 16, row.center().y()));
    const QString value = shown(words);
    const double taken = widthOf(value, textSize::secondary);
    canvas.text(row.adjusted(24, 0, -taken - gap, 0), shown(line.name), {.size = textSize::secondary});
    canvas.text(row, value, {.size = textSize::secondary, .alignment = Qt::AlignRight | Qt::AlignVCenter});
  }
}

bool ChartPage::takeKey(const QKeyEvent& event) {
  switch (event.key()) {
    case Qt::Key_Plus:
    case Qt::Key_Equal:
      chart_.zoom(nearer, chart_.follows() ? 1 : 0.5, now_());
      break;
    case Qt::Key_Minus:
      chart_.zoom(1 / nearer, chart_.follows() ? 1 : 0.5, now_());
      break;
    case Qt::Key_Left:
      chart_.pan(-step, now_());
      break;
    case Qt::Key_Right:
      chart_.pan(step, now_());
      break;
    case Qt::Key_Home:
      chart_.follow();
      chart_.setCursor(0, std::nullopt);
      chart_.setCursor(1, std::nullopt);
      break;
    default:
      return false;
  }
  refresh();
  return true;
}

void ChartPage::keyPressEvent(QKeyEvent* event) {
  if (!takeKey(*event)) event->ignore();
}

void ChartPage::wheelEvent(QWheelEvent* event) {
  const QPoint turn = event->angleDelta();
  if (std::abs(turn.x()) > std::abs(turn.y())) {
    chart_.pan(-turn.x() / 120.0 * step / 2, now_());
  } else {
    chart_.zoom(std::pow(nearer, turn.y() / 120.0), placeOf(event->position()), now_());
  }
  refresh();
}

void ChartPage::mousePressEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton) return event->ignore();
  pressed_ = event->position();
  isDragged_ = false;
}

void ChartPage::mouseMoveEvent(QMouseEvent* event) {
  if (!pressed_) return;
  const double way = event->position().x() - pressed_->x();
  if (!isDragged_ && std::abs(way) < tapRange) return;
  isDragged_ = true;
  chart_.pan(-way / plot().width(), now_());
  pressed_ = event->position();
  refresh();
}

void ChartPage::mouseReleaseEvent(QMouseEvent* event) {
  const bool isTap = pressed_ && !isDragged_;
  pressed_.reset();
  if (!isTap) return;
  const std::size_t which = event->modifiers().testFlag(Qt::ShiftModifier) ? 1 : 0;
  chart_.setCursor(which, chart_.timeAt(placeOf(event->position()), now_()));
  refresh();
}

}  // namespace kelvasi
