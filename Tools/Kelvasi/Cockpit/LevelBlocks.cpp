// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/LevelBlocks.h"

#include <algorithm>

#include "Platform/QtWidgets/Fonts.h"

namespace kelvasi {

namespace {

using namespace cockpit;
using namespace textSize;

constexpr double leastCourse = 64;   // points that a line is wide at least beside its figure
constexpr double courseHeight = 30;  // below its figure
constexpr double strong = 2.5;       // of the serving cell's line

double figureWidth(const Level& level) {
  return widthOf(shown(level.text), figure, true) + 6 + widthOf(shown(level.unit), secondary);
}

double verdictColumn() {
  return widthOf(QStringLiteral("very poor"), secondary) + 20 * textScale();
}

QString captionOf(const Level& level) {
  QString words = shown(level.name);
  if (level.age.fade != Fade::none) words += QStringLiteral(" \u00B7 ") + shown(level.age.text);
  if (!wordOf(level.trend).empty() && level.trend != Trend::steady && level.age.fade == Fade::none)
    words += QStringLiteral(" \u00B7 ") + shown(wordOf(level.trend));
  return words;
}

Block missingBlock(const Level& level) {
  Block block;
  block.height = lineHeight(secondary) + 10;
  const QString name = shown(level.name);
  block.spoken = name + QStringLiteral(", not reported");
  block.name = name;
  block.value = shown(level.text);
  block.paint = [name, words = shown(level.text)](const Canvas& canvas, const QRectF& area) {
    const QRectF row = area.adjusted(pageMargin, 0, -pageMargin, 0);
    canvas.text(row, name, {.size = secondary, .colour = &canvas.colours.secondary});
    canvas.text(
        row, words,
        {.size = secondary, .colour = &canvas.colours.stale, .alignment = Qt::AlignRight | Qt::AlignVCenter});
  };
  return block;
}

void paintVerdict(const Canvas& canvas, const QRectF& area, const Level& level) {
  const QString word = shown(level.verdictWord);
  canvas.verdict({area.left() + 8 * textScale(), area.center().y()}, level.verdict);
  canvas.text(area.adjusted(20 * textScale(), 0, 0, 0), word, {.size = secondary});
}

void paintFigure(const Canvas& canvas, const QRectF& area, const Level& level) {
  const QColor& colour = canvas.colours.of(level.age.fade);
  const double number = widthOf(shown(level.text), figure, true);
  const double left = area.left();
  canvas.text({left, area.top(), number, area.height()}, shown(level.text),
              {.size = figure, .isBold = true, .colour = &colour});
  const QRectF unit(left + number + 6, area.top(), area.right() - left - number - 6 + 1,
                    area.height() - lineHeight(figure) * 0.1);
  canvas.text(
      unit, shown(level.unit),
      {.size = secondary, .colour = &canvas.colours.secondary, .alignment = Qt::AlignLeft | Qt::AlignBottom});
}

constexpr double tileCourse = 30;

// Name and verdict, the figure, and its minute below them.
void paintTile(const Canvas& canvas, const QRectF& area, const Level& level) {
  const double captionHigh = lineHeight(caption);
  const QString name = captionOf(level);
  canvas.text({area.left(), area.top(), area.width(), captionHigh}, name,
              {.size = caption, .colour = &canvas.colours.secondary});
  const double verdictLeft = area.left() + widthOf(name, caption) + gap;
  if (level.verdict != Verdict::none) {
    canvas.verdict({verdictLeft + 6 * textScale(), area.top() + captionHigh / 2}, level.verdict);
    canvas.text({verdictLeft + 16 * textScale(), area.top(), area.right() - verdictLeft, captionHigh},
                shown(level.verdictWord), {.size = caption});
  }
  const QRectF figureArea(area.left(), area.top() + captionHigh, area.width(), lineHeight(figure));
  paintFigure(canvas, figureArea, level);
  const QColor& colour = level.age.fade == Fade::none ? canvas.colours.accent : canvas.colours.stale;
  canvas.course({area.left(), figureArea.bottom(), area.width(), tileCourse - 6}, level.line, colour, strong);
}

}  // namespace

std::optional<Block> levelTiles(const std::vector<Level>& levels, double width) {
  constexpr std::size_t most = 3;
  constexpr double between = 24;
  const double inner = width - 2 * pageMargin;
  std::vector<Level> chosen;
  double least = 0;
  for (const Level& level : levels) {
    if (!level.isReported() || chosen.size() == most) continue;
    const double verdict =
        level.verdict == Verdict::none ? 0 : 24 * textScale() + widthOf(shown(level.verdictWord), caption);
    const double wide = std::max(figureWidth(level), widthOf(captionOf(level), caption) + verdict);
    const double widest = std::max(least, wide);
    const auto count = static_cast<double>(chosen.size() + 1);
    if (!chosen.empty() && count * widest + (count - 1) * between > inner) break;
    least = widest;
    chosen.push_back(level);
  }
  if (chosen.empty()) return std::nullopt;
  Block block;
  block.height = lineHeight(caption) + lineHeight(figure) + tileCourse + 10;
  for (const Level& level : chosen) block.spoken += levelBlock(level, 0, width).spoken + QStringLiteral(". ");
  block.paint = [=](const Canvas& canvas, const QRectF& area) {
    const auto count = static_cast<double>(chosen.size());
    const double wide = (inner - (count - 1) * between) / count;
    double left = area.left() + pageMargin;
    for (const Level& level : chosen) {
      paintTile(canvas, {left, area.top() + 4, wide, area.height() - 8}, level);
      left += wide + between;
    }
  };
  return block;
}

double figureColumn(const std::vector<Level>& levels) {
  double widest = 0;
  for (const Level& level : levels)
    if (level.isReported()) widest = std::max(widest, figureWidth(level));
  return widest;
}

Block levelBlock(const Level& level, double figureColumn, double width) {
  if (!level.isReported()) return missingBlock(level);
  const double beside = width - 2 * pageMargin - figureColumn - verdictColumn() - 2 * 12;
  const bool isStacked = beside < leastCourse;
  const bool isNarrow = beside < -12;  // no room for the verdict either
  const double captionHeight = lineHeight(isNarrow ? secondary : caption);
  const double figureHeight = lineHeight(figure);
  Block block;
  block.height = captionHeight + figureHeight + 8 + (isStacked ? courseHeight + 4 : 0);
  block.spoken = shown(level.name) + QStringLiteral(", ") + shown(level.text) + QStringLiteral(" ") +
                 shown(level.unit) + QStringLiteral(", ") + shown(level.verdictWord) + QStringLiteral(", ") +
                 shown(level.age.text);
  block.name = shown(level.name);
  block.value = shown(level.text) + QStringLiteral(" ") + shown(level.unit);
  for (const QString& part :
       {shown(level.verdictWord), level.age.fade == Fade::none ? QString() : shown(level.age.text)})
    if (!part.isEmpty()) block.value += QStringLiteral(", ") + part;
  block.paint = [=](const Canvas& canvas, const QRectF& area) {
    const QRectF row = area.adjusted(pageMargin, 4, -pageMargin, -4);
    canvas.text({row.left(), row.top(), row.width(), captionHeight}, captionOf(level),
                {.size = caption, .colour = &canvas.colours.secondary});
    const QRectF figureArea(row.left(), row.top() + captionHeight, figureColumn, figureHeight);
    paintFigure(canvas, figureArea, level);
    const QRectF verdictArea(row.right() - verdictColumn(), isNarrow ? row.top() : figureArea.top(),
                             verdictColumn(), isNarrow ? captionHeight : figureHeight);
    paintVerdict(canvas, verdictArea, level);
    const QColor& colour = level.age.fade == Fade::none ? canvas.colours.accent : canvas.colours.stale;
    const QRectF course =
        isStacked ? QRectF(row.left(), figureArea.bottom() + 2, row.width(), courseHeight)
                  : QRectF(figureArea.right() + 12, figureArea.top() + 4, beside, figureHeight - 8);
    canvas.course(course.adjusted(0, 3, 0, -3), level.line, colour, strong);
  };
  return block;
}

}  // namespace kelvasi
