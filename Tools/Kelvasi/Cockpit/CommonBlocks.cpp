// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/CommonBlocks.h"

#include <algorithm>

#include "Platform/QtWidgets/Fonts.h"
#include "Platform/QtWidgets/Glyphs.h"

namespace kelvasi {

namespace {

using namespace textSize;

constexpr Qt::Alignment atRight = Qt::AlignRight | Qt::AlignVCenter;

QRectF inside(const QRectF& area) {
  return area.adjusted(pageMargin, 4, -pageMargin, -4);
}

}  // namespace

Block rowBlock(const RowWords& words, double width) {
  const QString name = shown(words.name);
  const QString below = shown(words.below);
  const QString value = shown(words.value);
  const QString valueBelow = shown(words.valueBelow);
  const double inner = width - 2 * pageMargin;
  const bool isStacked = !value.isEmpty() && widthOf(name, text) + 12 + widthOf(value, text) > inner;
  const bool hasSecond = !below.isEmpty() || !valueBelow.isEmpty();
  const double valueHeight = isStacked ? heightOfWords(value, text, inner) + 2 : 0;
  Block block;
  block.height =
      std::max(leastRow, lineHeight(text) + valueHeight + (hasSecond ? lineHeight(caption) : 0) + 8);
  block.spoken = name + QStringLiteral(", ") + value + QStringLiteral(", ") + below;
  block.name = below.isEmpty() ? name : name + QStringLiteral(", ") + below;
  block.value = valueBelow.isEmpty() ? value : value + QStringLiteral(", ") + valueBelow;
  block.paint = [=, fade = words.fade](const Canvas& canvas, const QRectF& area) {
    const QRectF row = inside(area);
    const double high = lineHeight(text) + valueHeight + (hasSecond ? lineHeight(caption) : 0);
    const double top = row.center().y() - high / 2;
    const QColor& colour = canvas.colours.of(fade);
    const QRectF first(row.left(), top, row.width(), lineHeight(text));
    const double taken = isStacked || value.isEmpty() ? 0 : widthOf(value, text) + 12;
    canvas.text(first.adjusted(0, 0, -taken, 0), name, {.size = text});
    if (isStacked) {
      canvas.words({row.left(), first.bottom() + 2, row.width(), valueHeight}, value,
                   {.size = text, .colour = &colour});
    } else {
      canvas.text(first, value, {.size = text, .colour = &colour, .alignment = atRight});
    }
    const QRectF second(row.left(), first.bottom() + valueHeight, row.width(), lineHeight(caption));
    const double takenBelow = valueBelow.isEmpty() ? 0 : widthOf(valueBelow, caption) + 12;
    canvas.text(second.adjusted(0, 0, -takenBelow, 0), below,
                {.size = caption, .colour = &canvas.colours.secondary});
    canvas.text(second, valueBelow,
                {.size = caption, .colour = &canvas.colours.secondary, .alignment = atRight});
    canvas.rule(area.adjusted(pageMargin, 0, 0, 0));
  };
  return block;
}

Block captionBlock(const std::string& words, double, const std::string& atEnd) {
  Block block;
  block.height = lineHeight(caption) + 20;
  block.spoken = shown(words);
  block.isHeading = true;
  block.paint = [words = shown(words), end = shown(atEnd)](const Canvas& canvas, const QRectF& area) {
    canvas.text(area.adjusted(pageMargin, 14, -pageMargin, -4), end,
                {.size = caption, .colour = &canvas.colours.secondary, .alignment = atRight});
    canvas.text(area.adjusted(pageMargin, 14, -pageMargin, -4), words,
                {.size = caption, .isBold = true, .colour = &canvas.colours.secondary});
    canvas.rule(area.adjusted(pageMargin, 0, 0, 0));
  };
  return block;
}

Block emptyBlock(const std::string& words, double width) {
  Block block = wordsBlock(words, width);
  block.height = std::max(leastRow, block.height);
  return block;
}

Block wordsBlock(const std::string& words, double width) {
  const QString all = shown(words);
  Block block;
  block.height = heightOfWords(all, secondary, width - 2 * pageMargin) + 20;
  block.spoken = all;
  block.paint = [all](const Canvas& canvas, const QRectF& area) {
    canvas.words(area.adjusted(pageMargin, 10, -pageMargin, -10), all,
                 {.size = secondary, .colour = &canvas.colours.secondary});
  };
  return block;
}

Block linkBlock(const std::string& words, double) {
  Block block;
  block.height = std::max(leastRow, lineHeight(secondary) + 12);
  block.spoken = shown(words);
  block.paint = [words = shown(words)](const Canvas& canvas, const QRectF& area) {
    const QRectF row = inside(area);
    canvas.text(row.adjusted(0, 0, -20, 0), words, {.size = secondary, .colour = &canvas.colours.accent});
    drawGlyph(canvas.painter(), Glyph::disclosure, QRectF(row.right() - 12, row.top(), 12, row.height()),
              canvas.colours.stale);
  };
  return block;
}

Block bannerBlock(const std::string& words, double width) {
  const QString all = shown(words);
  Block block;
  block.height = std::max(leastRow, heightOfWords(all, text, width - 2 * pageMargin - 28) + 16);
  block.spoken = QStringLiteral("Alarm, ") + all;
  block.paint = [all](const Canvas& canvas, const QRectF& area) {
    canvas.fill(area, canvas.colours.surface);
    canvas.fill({area.left(), area.top(), 4, area.height()}, canvas.colours.poor);
    canvas.verdict({area.left() + pageMargin + 6, area.center().y()}, cockpit::Verdict::veryPoor);
    const double high = heightOfWords(all, text, area.width() - 2 * pageMargin - 28);
    canvas.words({area.left() + pageMargin + 24, area.center().y() - high / 2,
                  area.width() - 2 * pageMargin - 24, high},
                 all, {.size = text});
  };
  return block;
}

Block eventBlock(const cockpit::EventLine& event, double width) {
  const QString time = shown(event.timeText);
  const QString words = shown(event.words);
  const double column = widthOf(time, secondary) + 12;
  const double room = width - 2 * pageMargin - column;
  const bool isStacked = room < 140 * textScale();
  const double wordsWidth = isStacked ? width - 2 * pageMargin : room;
  const double high = heightOfWords(words, secondary, wordsWidth);
  Block block;
  block.height = std::max(leastRow, high + (isStacked ? lineHeight(secondary) : 0) + 16);
  block.spoken = time + QStringLiteral(", ") + words;
  block.paint = [=](const Canvas& canvas, const QRectF& area) {
    const QRectF row = inside(area);
    const double whole = high + (isStacked ? lineHeight(secondary) : 0);
    const double top = row.center().y() - whole / 2;
    canvas.text({row.left(), top, column, lineHeight(secondary)}, time,
                {.size = secondary, .colour = &canvas.colours.secondary});
    const QRectF below(row.left(), top + lineHeight(secondary), wordsWidth, high + 2);
    canvas.words(isStacked ? below : QRectF(row.left() + column, top, wordsWidth, high + 2), words,
                 {.size = secondary});
    canvas.rule(area.adjusted(pageMargin, 0, 0, 0));
  };
  return block;
}

}  // namespace kelvasi
