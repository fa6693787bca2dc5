// SPDX-License-Identifier: Apache-2.0
// Draws a chart's picture into a room: plot, axes and, below them, what its lines are.
#pragma once

#include "Cockpit/Chart/Chart.h"
#include "Tools/Kelvasi/Cockpit/Canvas.h"

namespace kelvasi {

// `now`: what the age of the newest values counts from.
class ChartPainting {
 public:
  ChartPainting(const cockpit::ChartPicture& picture, const QRectF& room, Arrival now);

  // Where the lines are.
  const QRectF& plot() const { return plot_; }
  void paint(const Canvas& canvas) const;

 private:
  double legendRow() const;
  double legendHeight() const;
  QString heading() const;
  void paintBands(const Canvas& canvas) const;
  void paintAxes(const Canvas& canvas) const;
  void paintMarks(const Canvas& canvas) const;
  void paintLine(const Canvas& canvas, std::size_t place) const;
  void paintCursors(const Canvas& canvas) const;
  void paintLegend(const Canvas& canvas) const;

  const cockpit::ChartPicture& picture_;
  QRectF room_;
  QRectF plot_;
  Arrival now_;
};

// A line's newest value, with its age where it is not of now; with cursors its values there and their
// difference.
std::string legendWords(const cockpit::ChartPicture& picture, std::size_t line, Arrival now);

}  // namespace kelvasi
