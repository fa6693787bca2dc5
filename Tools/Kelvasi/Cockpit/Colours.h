// SPDX-License-Identifier: Apache-2.0
// The cockpit's colours by role, for light and dark. Texts reach a contrast of 4.5 to 1 on ground and
// surface, graphics one of 3 to 1; the colours of verdicts differ in lightness as in hue.
#pragma once

#include <QColor>
#include <QPalette>
#include <array>

#include "Cockpit/Levels/Thresholds.h"
#include "Cockpit/Words/Age.h"

namespace kelvasi {

struct CockpitColours {
  QColor ground;
  QColor surface;
  QColor line;
  QColor text;
  QColor secondary;
  QColor stale;
  QColor accent;
  QColor good;
  QColor fair;
  QColor poor;
  std::array<QColor, 8> series;  // of cells in a chart, in this order

  const QColor& of(cockpit::Verdict verdict) const;
  // Of a value of this age.
  const QColor& of(cockpit::Fade fade) const;
};

// The set that goes with a widget's palette.
const CockpitColours& coloursFor(const QPalette& palette);

}  // namespace kelvasi
