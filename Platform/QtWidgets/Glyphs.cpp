// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/Glyphs.h"

#include <array>

namespace kelvasi {

namespace {

struct Stroke {
  std::array<QPointF, 3> points;  // from the centre
  double width;
};

Stroke strokeOf(Glyph glyph) {
  switch (glyph) {
    case Glyph::disclosure:
      return {{QPointF(-3, -5.5), QPointF(2.5, 0), QPointF(-3, 5.5)}, 2};
    case Glyph::back:
      return {{QPointF(4, -8.5), QPointF(-4.5, 0), QPointF(4, 8.5)}, 2.4};
    case Glyph::checkmark:
      return {{QPointF(-6, 0.5), QPointF(-1.8, 4.7), QPointF(6.3, -5)}, 2};
  }
  return {};
}

}  // namespace

void drawGlyph(QPainter& painter, Glyph glyph, const QRectF& in, const QColor& colour) {
  const Stroke stroke = strokeOf(glyph);
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  painter.translate(in.center());
  painter.setPen(QPen(colour, stroke.width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
  painter.drawPolyline(stroke.points.data(), static_cast<int>(stroke.points.size()));
  painter.restore();
}

}  // namespace kelvasi
