// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/PaintedViews.h"

#include <QFontMetricsF>
#include <QLinearGradient>
#include <algorithm>
#include <cmath>
#include <utility>

#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/TextLine.h"

namespace kelvasi {

namespace {

constexpr double fadeWidth = 40;
constexpr double dotsWidth = 16;  // of the part of a fade that has faded away

// The share of the room beside a text that is at its left.
double shareAtLeft(TextAlignment alignment) {
  switch (alignment) {
    case TextAlignment::centre:
      return 0.5;
    case TextAlignment::right:
      return 1;
    case TextAlignment::left:
      break;
  }
  return 0;
}

// The ground's colour, from `from`, solid beneath the dots, to nothing at `to`.
void paintFade(QPainter& painter, const QRectF& area, double from, double to) {
  QColor ground = painter.brush().color();
  QLinearGradient fade(from, 0, to, 0);
  fade.setColorAt(0, ground);
  fade.setColorAt((dotsWidth + 2) / fadeWidth, ground);
  ground.setAlpha(0);
  fade.setColorAt(1, ground);
  painter.fillRect(area, fade);
}

void paintDots(QPainter& painter, const QPointF& middle) {
  painter.save();
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setBrush(painter.pen().color());
  painter.setPen(Qt::NoPen);
  for (const double step : {-5.0, 0.0, 5.0}) painter.drawEllipse(middle + QPointF(step, 0), 1.5, 1.5);
  painter.restore();
}

}  // namespace

PaintedPart::~PaintedPart() {
  if (group_) std::erase(group_->parts_, this);
}

void PaintedPart::place(const Rect& frame) {
  if (frame_ == frame) return;
  frame_ = frame;
  changed();
}

void PaintedPart::changed() const {
  if (group_) group_->changed_();
}

PaintedGroup::~PaintedGroup() {
  for (PaintedPart* part : parts_) part->group_ = nullptr;
}

void PaintedGroup::add(View& view) {
  auto& part = dynamic_cast<PaintedPart&>(view);
  if (part.group_) std::erase(part.group_->parts_, &part);
  part.group_ = this;
  parts_.push_back(&part);
  changed_();
}

void PaintedGroup::paint(QPainter& painter) const {
  for (const PaintedPart* part : parts_) part->paint(painter);
}

void PaintedGroup::collectTexts(QStringList& texts) const {
  for (const PaintedPart* part : parts_) part->collectTexts(texts);
}

double PaintedGroup::right() const {
  double furthest = 0;
  for (const PaintedPart* part : parts_) furthest = std::max(furthest, part->frame_.x + part->frame_.width);
  return furthest;
}

QtScrollView* PaintedGroup::scrollView() const {
  for (PaintedPart* part : parts_) {
    if (QtScrollView* view = part->asScrollView()) return view;
  }
  return nullptr;
}

void QtLabel::setText(std::string_view text) {
  if (text_ == text) return;
  text_ = text;
  shown_ = qtText(text);
  changed();
}

void QtLabel::setFont(const Font& font) {
  if (font_ == font) return;
  font_ = font;
  changed();
}

void QtLabel::setAlignment(TextAlignment alignment) {
  alignment_ = alignment;
  changed();
}

void QtLabel::paint(QPainter& painter) const {
  if (shown_.isEmpty()) return;
  const QRectF area = qtRect(frame());
  const QFont font = qtFont(font_);
  const QFontMetricsF metrics(font);
  const QString text = isElided_ ? metrics.elidedText(shown_, Qt::ElideRight, area.width()) : shown_;
  const TextLine line(text, font);
  const double room = spreadTo(text);
  const double left = shareAtLeft(alignment_) * (area.width() - std::max(room, line.width()));
  const double baseline = area.center().y() + (metrics.ascent() - metrics.descent()) / 2;
  line.draw(painter, {area.left() + left, baseline}, room);
}

double QtLabel::spreadTo(const QString& text) const {
  if (font_.isBold || isElided_) return 0;
  QFont bold = qtFont(font_);
  bold.setBold(true);
  const double width = frame().width;
  return std::ceil(TextLine(text, bold).width()) == width ? width : 0;
}

void QtLabel::collectTexts(QStringList& texts) const {
  if (!shown_.isEmpty()) texts.append(shown_);
}

void QtScrollView::setFrame(const Rect& frame) {
  place(frame);
  scrollTo(offset_);
}

void QtScrollView::setContentSize(Size size) {
  contentSize_ = size;
  scrollTo(offset_);
}

double QtScrollView::furthestOffset() const {
  return std::max(0.0, contentSize_.width - frame().width);
}

void QtScrollView::scrollTo(double offset) {
  const double kept = std::clamp(offset, 0.0, furthestOffset());
  if (std::exchange(offset_, kept) != kept) changed();
}

void QtScrollView::paint(QPainter& painter) const {
  painter.save();
  painter.setClipRect(qtRect(frame()), Qt::IntersectClip);
  painter.translate(frame().x - offset_, frame().y);
  group_.paint(painter);
  painter.restore();
  if (offset_ > 0) paintHidden(painter, Qt::LeftEdge);
  if (furthestOffset() > 0 && group_.right() > offset_ + frame().width) paintHidden(painter, Qt::RightEdge);
}

// Dots at an edge say that there is more behind it.
void QtScrollView::paintHidden(QPainter& painter, Qt::Edge edge) const {
  const QRectF area = qtRect(frame());
  const bool isLeft = edge == Qt::LeftEdge;
  const double from = isLeft ? area.left() : area.right();
  const double inwards = isLeft ? 1 : -1;
  const QRectF strip(std::min(from, from + inwards * fadeWidth), area.top(), fadeWidth, area.height());
  paintFade(painter, strip, from, from + inwards * fadeWidth);
  paintDots(painter, {from + inwards * dotsWidth / 2, area.center().y()});
}

}  // namespace kelvasi
