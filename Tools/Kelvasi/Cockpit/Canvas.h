// SPDX-License-Identifier: Apache-2.0
// Draws what the cockpit is made of: texts on a grid of points, verdicts as shapes, short lines.
#pragma once

#include <QPainter>
#include <QRectF>
#include <QString>
#include <string_view>

#include "Cockpit/Levels/Line.h"
#include "Cockpit/Link/Link.h"
#include "Tools/Kelvasi/Cockpit/Colours.h"

namespace kelvasi {

// Points, before the text size.
namespace textSize {
inline constexpr double caption = 13;
inline constexpr double secondary = 15;
inline constexpr double text = 17;
inline constexpr double title = 22;
inline constexpr double figure = 34;
}  // namespace textSize

struct TextLook {
  double size = textSize::text;
  bool isBold = false;
  const QColor* colour = nullptr;  // the text's unless stated
  Qt::Alignment alignment = Qt::AlignLeft | Qt::AlignVCenter;
};

QString shown(std::string_view text);
// Points, with the text size.
double lineHeight(double size);
double widthOf(const QString& text, double size, bool isBold = false);
// How many lines a text takes in a width.
double heightOfWords(const QString& text, double size, double width, bool isBold = false);

class Canvas {
 public:
  Canvas(QPainter& painter, const CockpitColours& itsColours) : colours(itsColours), painter_(painter) {}

  // One line with equally wide digits, which ends in an ellipsis where it is too long.
  void text(const QRectF& area, const QString& text, const TextLook& look = {}) const;
  // As many lines as it takes.
  void words(const QRectF& area, const QString& text, const TextLook& look) const;
  void verdict(const QPointF& middle, cockpit::Verdict verdict) const;
  void link(const QPointF& middle, cockpit::LinkState state) const;
  // Its newest value at the right edge.
  void course(const QRectF& area, const cockpit::Line& line, const QColor& colour, double width) const;
  void rule(const QRectF& area) const;
  void fill(const QRectF& area, const QColor& colour, double radius = 0) const;
  QPainter& painter() const { return painter_; }

  const CockpitColours& colours;

 private:
  QPainter& painter_;
};

}  // namespace kelvasi
