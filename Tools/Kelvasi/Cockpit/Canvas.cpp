// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/Canvas.h"

#include <QFontMetricsF>
#include <QPolygonF>
#include <algorithm>
#include <cmath>

#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/TextLine.h"

namespace kelvasi {

namespace {

constexpr double shapeSize = 5.5;     // points, from the middle
constexpr double bridgedSeconds = 6;  // between two values of one run
constexpr double leastSpan = 10;      // dB that a line is high at least
constexpr int wrapped = Qt::TextWordWrap | Qt::AlignLeft | Qt::AlignTop;

QFont fontOf(double size, bool isBold) {
  return qtFont(isBold ? Font::boldSystem(size) : Font::system(size));
}

QPolygonF regular(int corners, double first) {
  QPolygonF shape;
  for (int corner = 0; corner < corners; ++corner) {
    const double angle = (first + 360.0 * corner / corners) * M_PI / 180;
    shape.append({std::cos(angle), std::sin(angle)});
  }
  return shape;
}

// Of a circle with a radius of 1; empty for the circle itself.
QPolygonF shapeOf(cockpit::Verdict verdict) {
  switch (verdict) {
    case cockpit::Verdict::excellent:
      return regular(4, 0);
    case cockpit::Verdict::fair:
      return regular(3, -90);
    case cockpit::Verdict::poor:
      return regular(4, 45);
    case cockpit::Verdict::veryPoor:
      return regular(3, 90);
    case cockpit::Verdict::good:
    case cockpit::Verdict::none:
      break;
  }
  return {};
}

struct Span {
  double least;
  double most;
};

Span spanOf(const cockpit::Line& line) {
  double least = 1e9;
  double most = -1e9;
  for (const survey::Spread& point : line.points) {
    if (point.count == 0) continue;
    least = std::min<double>(least, point.minimum);
    most = std::max<double>(most, point.maximum);
  }
  const double more = std::max(0.0, leastSpan - (most - least)) / 2;
  return {least - more, most + more};
}

}  // namespace

QString shown(std::string_view text) {
  return qtText(text);
}

double lineHeight(double size) {
  return std::ceil(size * textScale() * 1.3);
}

double widthOf(const QString& text, double size, bool isBold) {
  return std::ceil(TextLine(text, fontOf(size, isBold)).width());
}

double heightOfWords(const QString& text, double size, double width, bool isBold) {
  return std::ceil(
      QFontMetricsF(fontOf(size, isBold)).boundingRect({0, 0, width, 1e4}, wrapped, text).height());
}

void Canvas::text(const QRectF& area, const QString& text, const TextLook& look) const {
  const QFont font = fontOf(look.size, look.isBold);
  const QFontMetricsF metrics(font);
  TextLine line(text, font);
  if (line.width() > area.width() + 0.5)
    line = TextLine(metrics.elidedText(text, Qt::ElideRight, area.width() - 1), font);
  double left = area.left();
  if (look.alignment.testFlag(Qt::AlignRight)) left = area.right() - line.width();
  if (look.alignment.testFlag(Qt::AlignHCenter)) left = area.center().x() - line.width() / 2;
  double baseline = area.center().y() + (metrics.ascent() - metrics.descent()) / 2;
  if (look.alignment.testFlag(Qt::AlignBottom)) baseline = area.bottom() - metrics.descent();
  painter_.setPen(look.colour ? *look.colour : colours.text);
  line.draw(painter_, {left, baseline});
}

void Canvas::words(const QRectF& area, const QString& text, const TextLook& look) const {
  painter_.setPen(look.colour ? *look.colour : colours.text);
  painter_.setFont(fontOf(look.size, look.isBold));
  painter_.drawText(area, wrapped, text);
}

void Canvas::verdict(const QPointF& middle, cockpit::Verdict verdict) const {
  if (verdict == cockpit::Verdict::none) return;
  painter_.setPen(Qt::NoPen);
  painter_.setBrush(colours.of(verdict));
  const double size = shapeSize * textScale();
  const QPolygonF shape = shapeOf(verdict);
  if (shape.isEmpty()) return painter_.drawEllipse(middle, size, size);
  const bool isTriangle = shape.size() == 3;
  QTransform place;
  place.translate(middle.x(), middle.y()).scale(size * 1.2, size * 1.2);
  if (isTriangle) place.translate(0, verdict == cockpit::Verdict::fair ? 0.2 : -0.2);
  painter_.drawPolygon(place.map(shape));
}

// Full while live, half while late, an empty ring for what is not of now.
void Canvas::link(const QPointF& middle, cockpit::LinkState state) const {
  const double size = shapeSize * textScale();
  const bool isLive = state == cockpit::LinkState::live;
  const bool isLate = state == cockpit::LinkState::late;
  const bool isKept = state == cockpit::LinkState::held || state == cockpit::LinkState::file;
  const QColor& colour = isLive   ? colours.good
                         : isLate ? colours.fair
                         : isKept ? colours.accent
                                  : colours.poor;
  const QRectF round(middle - QPointF(size, size), QSizeF(2 * size, 2 * size));
  painter_.setPen(QPen(colour, 2));
  painter_.setBrush(isLive ? QBrush(colour) : QBrush(Qt::NoBrush));
  if (isKept) return painter_.drawRect(round);
  painter_.drawEllipse(round);
  painter_.setBrush(colour);
  constexpr int halfTurn = 180 * 16;
  if (isLate) painter_.drawPie(round, -90 * 16, halfTurn);
}

void Canvas::course(const QRectF& area, const cockpit::Line& line, const QColor& colour, double width) const {
  if (line.isEmpty() || area.width() < 8) return;
  const Span span = spanOf(line);
  const double step = area.width() / static_cast<double>(line.points.size());
  const auto heightAt = [&](double value) {
    return area.bottom() - (value - span.least) / (span.most - span.least) * area.height();
  };
  QPolygonF run;
  painter_.setPen(QPen(colour, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
  painter_.setBrush(Qt::NoBrush);
  const auto finish = [&] {
    if (run.size() == 1) painter_.drawPoint(run.front());
    if (run.size() > 1) painter_.drawPolyline(run);
    run.clear();
  };
  const auto bridged =
      static_cast<std::size_t>(bridgedSeconds * 1e9 / static_cast<double>((line.to - line.from).count()) *
                               static_cast<double>(line.points.size()));
  std::size_t last = 0;
  for (std::size_t at = 0; at < line.points.size(); ++at) {
    if (line.points[at].count == 0) continue;
    if (at - last > std::max<std::size_t>(1, bridged)) finish();
    last = at;
    run.append({area.left() + step * (static_cast<double>(at) + 0.5), heightAt(line.points[at].mean)});
  }
  finish();
}

void Canvas::rule(const QRectF& area) const {
  const double thickness = 1 / painter_.device()->devicePixelRatioF();
  painter_.fillRect(QRectF(area.left(), area.bottom() - thickness, area.width(), thickness), colours.line);
}

void Canvas::fill(const QRectF& area, const QColor& colour, double radius) const {
  painter_.setPen(Qt::NoPen);
  painter_.setBrush(colour);
  painter_.drawRoundedRect(area, radius, radius);
}

}  // namespace kelvasi
