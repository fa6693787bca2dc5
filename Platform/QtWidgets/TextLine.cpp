// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/TextLine.h"

#include <algorithm>

namespace kelvasi {

namespace {

// Latin, Greek and Cyrillic: characters that stand side by side.
bool standsAlone(QChar character) {
  constexpr char16_t firstOfHebrew = 0x0590;
  return character.unicode() < firstOfHebrew;
}

bool isDigit(QChar character) {
  return character >= QLatin1Char('0') && character <= QLatin1Char('9');
}

double widestDigit(const QFontMetricsF& metrics) {
  double widest = 0;
  for (char digit = '0'; digit <= '9'; ++digit)
    widest = std::max(widest, metrics.horizontalAdvance(QLatin1Char(digit)));
  return widest;
}

}  // namespace

TextLine::TextLine(const QString& text, const QFont& font)
    : font_(font), mayBeSpread_(std::ranges::all_of(text, standsAlone)) {
  const QFontMetricsF metrics(font);
  if (!mayBeSpread_ || std::ranges::none_of(text, isDigit)) {
    append(text, 0, metrics.horizontalAdvance(text));
  } else {
    appendWithCells(text, metrics);
  }
}

void TextLine::appendWithCells(const QString& text, const QFontMetricsF& metrics) {
  const double cell = widestDigit(metrics);
  for (auto at = text.begin(); at != text.end();) {
    const auto end = isDigit(*at) ? at + 1 : std::find_if(at, text.end(), isDigit);
    const QString piece(at, end - at);
    const double advance = metrics.horizontalAdvance(piece);
    const bool isCell = isDigit(*at);
    append(piece, isCell ? (cell - advance) / 2 : 0, isCell ? cell : advance);
    at = end;
  }
}

void TextLine::append(const QString& text, double offset, double width) {
  pieces_.push_back({.text = text, .left = width_ + offset, .before = length_});
  length_ += text.size();
  width_ += width;
}

void TextLine::draw(QPainter& painter, const QPointF& start, double room) const {
  const bool isSpread = mayBeSpread_ && room > width_ && length_ > 1;
  const double spacing = isSpread ? (room - width_) / static_cast<double>(length_ - 1) : 0;
  QFont font = font_;
  if (isSpread) font.setLetterSpacing(QFont::AbsoluteSpacing, spacing);
  painter.setFont(font);
  for (const Piece& piece : pieces_) {
    const double left = piece.left + spacing * static_cast<double>(piece.before);
    painter.drawText(start + QPointF(left, 0), piece.text);
  }
}

}  // namespace kelvasi
