// SPDX-License-Identifier: Apache-2.0
#include "Platform/QtWidgets/PaintedViews.h"

#include <QFontMetricsF>
#include <QLinearGradient>
#include <algorithm>
#include <utility>

#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {

constexpr double fadeWidth = 28;

Qt::Alignment qtAlignment(TextAlignment alignment) {
  switch (alignment) {
    case TextAlignment::centre:
      return Qt::AlignHCenter;
    case TextAlignment::right:
      return Qt::AlignRight;
    case TextAlignment::left:
      break;
  }
  return Qt::AlignLeft | Qt::AlignAbsolute;
}

// From the ground's colour at `from` to nothing at `to`.
void paintFade(QPainter& painter, const QRectF& area, double from, double to) {
  QColor ground = painter.brush().color();
  QLinearGradient fade(from, 0, to, 0);
  fade.setColorAt(0, ground);
  ground.setAlpha(0);
  fade.setColorAt(1, ground);
  painter.fillRect(area, fade);
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
  if (isFontMade_ && font_ == font) return;
  font_ = font;
  qtFont_ = qtFont(font);
  isFontMade_ = true;
  changed();
}

void QtLabel::setAlignment(TextAlignment alignment) {
  alignment_ = alignment;
  changed();
}

void QtLabel::paint(QPainter& painter) const {
  if (shown_.isEmpty()) return;
  const QRectF area = qtRect(frame());
  painter.setFont(isFontMade_ ? qtFont_ : qtFont(font_));
  const QString text =
      isElided_ ? QFontMetricsF(painter.font()).elidedText(shown_, Qt::ElideRight, area.width()) : shown_;
  painter.drawText(
      area,
      static_cast<int>(qtAlignment(alignment_) | Qt::AlignVCenter) | Qt::TextSingleLine | Qt::TextDontClip,
      text);
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
  paintFades(painter);
}

// A fade at an edge says that there is more behind it.
void QtScrollView::paintFades(QPainter& painter) const {
  if (furthestOffset() <= 0) return;
  const QRectF area = qtRect(frame());
  if (offset_ > 0)
    paintFade(painter, {area.left(), area.top(), fadeWidth, area.height()}, area.left(),
              area.left() + fadeWidth);
  if (offset_ < furthestOffset())
    paintFade(painter, {area.right() - fadeWidth, area.top(), fadeWidth, area.height()}, area.right(),
              area.right() - fadeWidth);
}

}  // namespace kelvasi
