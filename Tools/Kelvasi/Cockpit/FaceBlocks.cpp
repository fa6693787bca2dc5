// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/FaceBlocks.h"

#include <algorithm>
#include <cmath>

#include "Platform/QtWidgets/Fonts.h"
#include "Tools/Kelvasi/Cockpit/CommonBlocks.h"
#include "Tools/Kelvasi/Cockpit/LevelBlocks.h"

namespace kelvasi {

namespace {

using namespace cockpit;
using namespace textSize;

constexpr Qt::Alignment atRight = Qt::AlignRight | Qt::AlignVCenter;

// "B7 2680 MHz  PCI 362" with its parts kept whole where lines break.
QString partsOf(const std::string& words) {
  QStringList parts = shown(words).split(QStringLiteral("  "), Qt::SkipEmptyParts);
  for (QString& part : parts) part.replace(QLatin1Char(' '), QChar(QChar::Nbsp));
  return parts.join(QStringLiteral(" \u00B7 "));
}

// Title with the link at the right, and below them who, where and what is the matter.
Block headBlock(const ServingCell& serving, const Link& link, double width) {
  const bool isLive = link.state == LinkState::live;
  const QString title = serving.isKnown ? shown(serving.title) : shown(link.technology);
  const QString subtitle = serving.isKnown ? partsOf(serving.subtitle) : shown(serving.why);
  const QString sentence = isLive ? QString() : shown(link.sentence);
  const double inner = width - 2 * pageMargin;
  const double high = subtitle.isEmpty() ? 0 : heightOfWords(subtitle, secondary, inner);
  const double higher = sentence.isEmpty() ? 0 : heightOfWords(sentence, secondary, inner) + 4;
  const QString state = shown(link.state == LinkState::nothingYet ? std::string() : link.shortly);
  const double stateWidth = state.isEmpty() ? 0 : widthOf(state, secondary, true) + 18 * textScale();
  const bool isWrapped = widthOf(title, textSize::title, true) + gap + stateWidth > inner;
  const double titleHeight = isWrapped ? heightOfWords(title, textSize::title, inner, true) : 0;
  const double stateHeight = std::max(lineHeight(textSize::title), leastRow - 10);
  const double top = isWrapped ? titleHeight + (stateWidth > 0 ? lineHeight(secondary) + 4 : 0) : stateHeight;
  Block block;
  block.height = top + high + higher + 10;
  block.spoken = title + QStringLiteral(", ") + shown(link.words) + QStringLiteral(", ") + subtitle;
  block.name = title + QStringLiteral(", ") + subtitle;
  block.value = shown(link.shortly);
  block.isHeading = true;
  block.paint = [=, linkState = link.state](const Canvas& canvas, const QRectF& area) {
    const QRectF head(area.left() + pageMargin, area.top() + 4, inner, top);
    const TextLook look{.size = textSize::title, .isBold = true};
    if (isWrapped) {
      canvas.words(head, title, look);
    } else {
      canvas.text(head.adjusted(0, 0, -stateWidth - gap, 0), title, look);
    }
    if (stateWidth > 0) {
      const QRectF chip(isWrapped ? head.left() : head.right() - stateWidth, head.top() + titleHeight,
                        stateWidth, top - titleHeight);
      canvas.link({chip.left() + 7 * textScale(), chip.center().y()}, linkState);
      canvas.text(chip, state,
                  {.size = secondary, .isBold = true, .alignment = Qt::AlignRight | Qt::AlignVCenter});
    }
    const QRectF below(head.left(), head.bottom(), inner, high);
    canvas.words(below, subtitle, {.size = secondary, .colour = &canvas.colours.secondary});
    if (higher > 0)
      canvas.words({head.left(), below.bottom() + 4, inner, higher}, sentence,
                   {.size = secondary, .colour = &canvas.colours.text});
  };
  return block;
}

QString channelOf(const CellLine& cell) {
  return shown(cell.channel + (cell.bands.empty() ? "" : " \u00B7 " + cell.bands));
}

// The same for all cells, so that their numbers stand below each other.
struct CellColumns {
  double name = 0;
  double level = widthOf(QStringLiteral("\u2212188"), text, true);
  double edge = widthOf(QStringLiteral("\u221288"), text);
};

CellColumns columnsOf(const std::vector<CellLine>& cells, double width) {
  CellColumns columns;
  for (const CellLine& cell : cells) {
    columns.name =
        std::max({columns.name, widthOf(shown(cell.name), text), widthOf(channelOf(cell), caption)});
    if (cell.age.fade != Fade::none)
      columns.edge = std::max(columns.edge, widthOf(shown(cell.age.text), caption));
  }
  columns.name = std::min(columns.name, (width - 2 * pageMargin) * 0.42) + 16;
  return columns;
}

QString cellWords(const CellLine& cell) {
  const QString level = cell.level.isReported() ? shown(cell.level.text) : QString();
  return shown(cell.name) + QStringLiteral(", ") + level + QStringLiteral(" ") + shown(cell.level.unit) +
         QStringLiteral(", ") + shown(cell.differenceText) + QStringLiteral(" ") + shown(cell.age.text);
}

Block cellBlock(const CellLine& cell, const CellColumns& columns, const FaceActions& actions) {
  const QString name = shown(cell.name);
  const QString below = channelOf(cell);
  const QString level = cell.level.isReported() ? shown(cell.level.text) : QString();
  const QString difference = shown(cell.differenceText);
  const QString age = cell.age.fade == Fade::none ? QString() : shown(cell.age.text);
  Block block;
  block.height = std::max(leastRow + 4, lineHeight(text) + lineHeight(caption) + 8);
  block.spoken = cellWords(cell);
  block.name = name + QStringLiteral(", ") + below;
  block.value = level + QStringLiteral(" ") + shown(cell.level.unit);
  if (!age.isEmpty()) block.value += QStringLiteral(", ") + age;
  if (actions.openCell) block.action = [open = actions.openCell, number = cell.number] { open(number); };
  block.paint = [=, line = cell.level.line, fade = cell.age.fade](const Canvas& canvas, const QRectF& area) {
    const QRectF row = area.adjusted(pageMargin, 4, -pageMargin, -4);
    const double upper = lineHeight(text);
    const QColor& colour = canvas.colours.of(fade);
    const QRectF first(row.left(), row.top(), row.width(), upper);
    const QRectF second(row.left(), first.bottom(), row.width(), row.bottom() - first.bottom());
    canvas.text({first.left(), first.top(), columns.name, upper}, name, {.size = text, .colour = &colour});
    canvas.text({second.left(), second.top(), columns.name, second.height()}, below,
                {.size = caption, .colour = &canvas.colours.secondary});
    const QRectF number(first.left() + columns.name, first.top(), columns.level, upper);
    canvas.text(
        number, level,
        {.size = text, .isBold = true, .colour = &colour, .alignment = Qt::AlignRight | Qt::AlignVCenter});
    const QRectF course(number.right() + 12, row.top() + 4,
                        row.right() - columns.edge - 12 - number.right() - 12, row.height() - 8);
    canvas.course(course, line, fade == Fade::none ? canvas.colours.accent : canvas.colours.stale, 1.5);
    canvas.text(first, difference,
                {.size = text, .colour = &colour, .alignment = Qt::AlignRight | Qt::AlignVCenter});
    canvas.text(second, age,
                {.size = caption,
                 .colour = &canvas.colours.secondary,
                 .alignment = Qt::AlignRight | Qt::AlignVCenter});
    canvas.rule(area.adjusted(pageMargin, 0, 0, 0));
  };
  return block;
}

// On one line, for a card.
Block shortCellBlock(const CellLine& cell, const CellColumns& columns) {
  const QString name = shown(cell.name);
  const QString level = cell.level.isReported() ? shown(cell.level.text) : QString();
  const bool isOld = cell.age.fade != Fade::none;
  const QString end = shown(isOld ? cell.age.text : cell.differenceText);
  Block block;
  block.height = std::max(30.0, lineHeight(text) + 6);
  block.spoken = cellWords(cell);
  block.paint = [=, line = cell.level.line, fade = cell.age.fade](const Canvas& canvas, const QRectF& area) {
    const QRectF row = area.adjusted(pageMargin, 0, -pageMargin, 0);
    const QColor& colour = canvas.colours.of(fade);
    const QRectF number(row.left() + columns.name, row.top(), columns.level, row.height());
    canvas.text({row.left(), row.top(), columns.name, row.height()}, name, {.size = text, .colour = &colour});
    canvas.text(number, level, {.size = text, .isBold = true, .colour = &colour, .alignment = atRight});
    const QRectF course(number.right() + 16, row.top() + 6,
                        row.right() - columns.edge - 16 - number.right() - 16, row.height() - 12);
    canvas.course(course, line, isOld ? canvas.colours.stale : canvas.colours.accent, 1.5);
    canvas.text(row, end, {.size = isOld ? caption : text, .colour = &colour, .alignment = atRight});
  };
  return block;
}

// The newest on one line, for a card.
Block shortEventBlock(const EventLine& event, double) {
  const QString time = shown(event.timeText);
  const QString words = shown(event.words);
  Block block;
  block.height = lineHeight(secondary) + 16;
  block.spoken = time + QStringLiteral(", ") + words;
  block.paint = [=](const Canvas& canvas, const QRectF& area) {
    const QRectF row = area.adjusted(pageMargin, 4, -pageMargin, 0);
    const double taken = widthOf(time, secondary) + 12;
    canvas.rule({area.left() + pageMargin, area.top(), area.width() - pageMargin, 1});
    canvas.text(row, time, {.size = secondary, .colour = &canvas.colours.secondary});
    canvas.text(row.adjusted(taken, 0, 0, 0), words, {.size = secondary});
  };
  return block;
}

std::string carrierText(const CarrierLine& carrier) {
  std::string words = carrier.bands;
  for (const std::string& part : {carrier.frequency, carrier.channelText})
    if (!part.empty()) words += (words.empty() ? "" : " \u00B7 ") + part;
  return words;
}

void addPins(Blocks& blocks, const Snapshot& snapshot, const FaceActions& actions, double width) {
  for (const PinLine& pin : snapshot.pins) {
    RowWords words{.name = pin.name,
                   .below = pin.cellText.empty() ? pin.place : pin.cellText,
                   .value = pin.value,
                   .valueBelow = pin.age.fade == Fade::none ? "" : pin.age.text,
                   .fade = pin.age.fade};
    Block block = rowBlock(words, width);
    if (actions.openRow)
      block.action = block.more = [open = actions.openRow, path = pin.path] { open(path); };
    blocks.push_back(std::move(block));
  }
}

void addAlarms(Blocks& blocks, const Snapshot& snapshot, const FaceActions& actions, double width) {
  for (const AlarmLine& alarm : snapshot.alarms) {
    if (!alarm.isRaised) continue;
    Block block = bannerBlock(alarm.words.empty() ? alarm.ruleText : alarm.words, width);
    block.action = actions.openAlarms;
    blocks.push_back(std::move(block));
  }
}

void addCells(Blocks& blocks, const Snapshot& snapshot, const FaceActions& actions, double width) {
  blocks.push_back(captionBlock("Cells, dBm", width, snapshot.cells.empty() ? "" : "to serving, dB"));
  if (snapshot.cells.empty()) blocks.push_back(emptyBlock(snapshot.cellsWhy, width));
  const CellColumns columns = columnsOf(snapshot.cells, width);
  for (const CellLine& cell : snapshot.cells) blocks.push_back(cellBlock(cell, columns, actions));
}

void addCarriers(Blocks& blocks, const Snapshot& snapshot, double width) {
  if (snapshot.carriers.size() < 2) return;
  blocks.push_back(captionBlock("Carriers", width));
  for (const CarrierLine& carrier : snapshot.carriers) {
    const std::string cells = std::to_string(carrier.cells) + (carrier.cells == 1 ? " cell" : " cells");
    const bool hasBest = carrier.best.isReported();
    blocks.push_back(
        rowBlock({.name = carrierText(carrier),
                  .below = carrier.isServing ? cells + ", serving" : cells,
                  .value = hasBest ? carrier.best.text + " " + std::string(carrier.best.unit) : "",
                  .valueBelow = carrier.bestName,
                  .fade = hasBest ? carrier.best.age.fade : Fade::none},
                 width));
  }
}

void addEvents(Blocks& blocks, const Snapshot& snapshot, const FaceActions& actions, double width) {
  blocks.push_back(captionBlock("Events", width));
  if (snapshot.events.empty()) blocks.push_back(emptyBlock(snapshot.eventsWhy, width));
  for (const EventLine& event : snapshot.events) {
    Block block = eventBlock(event, width);
    if (actions.openEvent) block.action = [open = actions.openEvent, number = event.number] { open(number); };
    blocks.push_back(std::move(block));
  }
  if (snapshot.eventCount <= snapshot.events.size() || !actions.openEvents) return;
  Block all = linkBlock("All " + std::to_string(snapshot.eventCount) + " events", width);
  all.action = actions.openEvents;
  blocks.push_back(std::move(all));
}

void addServing(Blocks& blocks, const ServingCell& serving, const FaceActions& actions, double width) {
  const double column = figureColumn(serving.levels);
  for (std::size_t place = 0; place < serving.levels.size(); ++place) {
    Block block = levelBlock(serving.levels[place], column, width);
    if (actions.openLevel && serving.levels[place].isReported())
      block.action = [open = actions.openLevel, place] { open(place); };
    blocks.push_back(std::move(block));
  }
}

}  // namespace

Blocks faceBlocks(const Snapshot& snapshot, const FaceActions& actions, double width) {
  Blocks blocks;
  addAlarms(blocks, snapshot, actions, width);
  blocks.push_back(headBlock(snapshot.serving, snapshot.link, width));
  addServing(blocks, snapshot.serving, actions, width);
  if (!snapshot.pins.empty()) blocks.push_back(captionBlock("Pins", width));
  addPins(blocks, snapshot, actions, width);
  if (snapshot.second) {
    blocks.push_back(captionBlock(snapshot.second->title, width));
    addServing(blocks, *snapshot.second, {}, width);
  }
  addCells(blocks, snapshot, actions, width);
  addCarriers(blocks, snapshot, width);
  addEvents(blocks, snapshot, actions, width);
  if (snapshot.link.messages == 0) return blocks;
  Block counters = linkBlock(snapshot.link.counters, width);
  counters.action = actions.openCoverage;
  blocks.push_back(std::move(counters));
  return blocks;
}

Blocks cardBlocks(const Snapshot& snapshot, double width, double height) {
  Blocks blocks;
  addAlarms(blocks, snapshot, {}, width);
  blocks.push_back(headBlock(snapshot.serving, snapshot.link, width));
  if (auto levels = levelTiles(snapshot.serving.levels, width)) blocks.push_back(std::move(*levels));
  std::optional<Block> last;
  if (!snapshot.events.empty()) last = shortEventBlock(snapshot.events.front(), width);
  double left = height - (last ? last->height : 0);
  const auto tooMuch =
      std::ranges::find_if(blocks, [&](const Block& block) { return (left -= block.height) < 0; });
  blocks.erase(tooMuch, blocks.end());
  const CellColumns columns = columnsOf(snapshot.cells, width);
  for (const CellLine& cell : snapshot.cells) {
    Block block = shortCellBlock(cell, columns);
    if ((left -= block.height) < 0) break;
    blocks.push_back(std::move(block));
  }
  if (last) blocks.push_back(std::move(*last));
  return blocks;
}

}  // namespace kelvasi
