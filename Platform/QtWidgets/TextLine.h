// SPDX-License-Identifier: Apache-2.0
// One line of text, measured and drawn with digits that are all equally wide, so that a number that changes
// in place moves nothing beside it. Scripts whose characters join or run from the right are left as they are.
#pragma once

#include <QFont>
#include <QFontMetricsF>
#include <QPainter>
#include <QString>
#include <vector>

namespace kelvasi {

class TextLine {
 public:
  TextLine(const QString& text, const QFont& font);

  // Points.
  double width() const { return width_; }
  // Along the baseline at `start`, in the painter's pen. A text that may be spread and is narrower than
  // `room` fills it.
  void draw(QPainter& painter, const QPointF& start, double room = 0) const;

 private:
  // Characters that are drawn at once: a digit, or what stands between digits.
  struct Piece {
    QString text;
    double left;
    qsizetype before;  // characters of the line
  };

  void appendWithCells(const QString& text, const QFontMetricsF& metrics);
  void append(const QString& text, double offset, double width);

  QFont font_;
  std::vector<Piece> pieces_;
  qsizetype length_ = 0;
  double width_ = 0;
  bool mayBeSpread_;
};

}  // namespace kelvasi
