// SPDX-License-Identifier: Apache-2.0
// The few shapes that the viewer draws itself. Each is centred in its rectangle, in points.
#pragma once

#include <QColor>
#include <QPainter>
#include <QRectF>

namespace kelvasi {

enum class Glyph { disclosure, back, checkmark };

void drawGlyph(QPainter& painter, Glyph glyph, const QRectF& in, const QColor& colour);

}  // namespace kelvasi
