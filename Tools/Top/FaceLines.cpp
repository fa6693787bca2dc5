// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/FaceLines.h"

#include <algorithm>

#include "Tools/Top/Signs.h"

namespace kelvasi::top {

namespace {

using namespace cockpit;

constexpr Style bold{.isBold = true};
constexpr Style secondary{.role = Role::secondary};
constexpr Style stale{.role = Role::stale};
constexpr int wide = 60;  // columns from which words are not shortened

// The seconds of a minute go evenly into these, so that every column of a course holds as many.
int courseColumns(int room) {
  for (const int columns : {30, 20, 15, 12, 10, 6})
    if (columns <= room) return columns;
  return 0;
}

struct LevelColumns {
  int name = 0;
  int value = 0;
  int unit = 0;
};

LevelColumns columnsOf(const std::vector<Level>& levels, const Look& look) {
  LevelColumns columns;
  for (const Level& level : levels) {
    columns.name = std::max(columns.name, terminal::widthOf(level.name, look.set));
    if (!level.isReported()) continue;
    columns.value = std::max(columns.value, terminal::widthOf(level.text, look.set));
    columns.unit = std::max(columns.unit, terminal::widthOf(level.unit, look.set));
  }
  columns.value = std::max(columns.value, 5);
  return columns;
}

TextLine missingLine(const Level& level, const LevelColumns& columns, const Look& look) {
  return {
      .left = {{padRight(std::string(level.name), columns.name + 2, look), secondary}, {level.text, stale}}};
}

TextLine levelLine(const Level& level, const LevelColumns& columns, int width, const Look& look) {
  if (!level.isReported()) return missingLine(level, columns, look);
  const Style style{.role = roleOf(level.age.fade), .isBold = level.age.fade == Fade::none};
  const int verdict = 14;  // "  ▲ very poor ↘"
  const int used = columns.name + 2 + columns.value + 1 + columns.unit + 2 + verdict + 2;
  TextLine line;
  line.left = {{padRight(std::string(level.name), columns.name + 2, look), secondary},
               {padLeft(level.text, columns.value, look), style},
               {" " + padRight(std::string(level.unit), columns.unit, look) + " ", secondary}};
  const bool isOld = level.age.fade != Fade::none;
  const int course = courseColumns(width - used);
  if (course > 0)
    line.left.push_back({courseOf(level.line, course) + "  ", isOld ? stale : Style{.role = Role::accent}});
  line.left.push_back(signOf(level.verdict));
  if (isOld) line.left.back().style = stale;
  line.left.push_back(
      {" " + padRight(std::string(level.verdictWord), 9, look) + " ", isOld ? stale : Style{}});
  if (isOld) {
    line.left.push_back({level.age.text, stale});
  } else {
    line.left.push_back({arrowOf(level.trend), secondary});
  }
  return line;
}

bool isMatter(LinkState state) {
  return state != LinkState::live && state != LinkState::late && state != LinkState::file &&
         state != LinkState::held;
}

struct CellColumns {
  int name = 0;
  int channel = 0;
  int level = 4;
  int difference = 3;
  int age = 0;
};

CellColumns columnsOf(const std::vector<CellLine>& cells, const Look& look) {
  CellColumns columns;
  const auto widen = [&](int& column, const std::string& text) {
    column = std::max(column, terminal::widthOf(text, look.set));
  };
  for (const CellLine& cell : cells) {
    widen(columns.name, cell.name);
    widen(columns.channel, cell.channel);
    widen(columns.level, cell.level.text);
    widen(columns.difference, cell.differenceText);
    if (cell.age.fade != Fade::none) widen(columns.age, cell.age.text);
  }
  columns.age = std::max(columns.age, 4);
  return columns;
}

TextLine cellLine(const CellLine& cell, const CellColumns& columns, int width, const Look& look) {
  const Style style{.role = roleOf(cell.age.fade)};
  const bool isLive = cell.age.fade == Fade::none;
  const int used =
      columns.name + 2 + columns.channel + 2 + columns.level + 2 + 2 + columns.difference + 2 + columns.age;
  const int course = courseColumns(std::min(width - used, 20));
  TextLine line;
  line.left = {
      {padRight(cell.name, columns.name + 2, look), style},
      {padLeft(cell.channel, columns.channel, look) + "  ", secondary},
      {padLeft(cell.level.text, columns.level, look) + "  ", {.role = style.role, .isBold = isLive}}};
  if (course > 0)
    line.left.push_back(
        {courseOf(cell.level.line, course) + "  ", {.role = isLive ? Role::accent : Role::stale}});
  line.left.push_back({padLeft(cell.differenceText, columns.difference, look) + "  ", style});
  if (!isLive) line.left.push_back({cell.age.text, stale});
  return line;
}

std::string carrierText(const CarrierLine& carrier) {
  std::string words = carrier.technology;
  for (const std::string& part : {carrier.bands, carrier.frequency, carrier.channelText})
    if (!part.empty()) words += (words.empty() ? "" : "  ") + part;
  return words;
}

}  // namespace

Lines headLines(const Snapshot& face, int columns, const Look& look) {
  const ServingCell& serving = face.serving;
  const Link& link = face.link;
  Lines lines(2);
  lines[0].left = {{serving.isKnown           ? serving.title
                    : link.technology.empty() ? "Kelvasi"
                                              : link.technology,
                    bold}};
  lines[0].right = {signOf(link.state), {" " + (columns >= wide ? link.words : link.shortly), bold}};
  lines[1].left = {{serving.isKnown ? serving.subtitle : serving.why, secondary}};
  if (serving.isKnown && serving.age.fade != Fade::none) lines[1].right = {{serving.age.text, stale}};
  if (isMatter(link.state) && link.messages > 0)
    for (const std::string& words : wrapped(link.sentence, columns, look))
      lines.push_back({.left = {{words, {.role = Role::poor}}}});
  return lines;
}

Lines levelLines(const ServingCell& serving, int columns, const Look& look) {
  const LevelColumns shared = columnsOf(serving.levels, look);
  Lines lines;
  for (const Level& level : serving.levels) lines.push_back(levelLine(level, shared, columns, look));
  return lines;
}

Lines pinLines(const Snapshot& face, const Look&) {
  Lines lines;
  for (const PinLine& pin : face.pins) {
    const std::string& of = pin.cellText.empty() ? pin.place : pin.cellText;
    TextLine line;
    line.left = {{pin.name}, {"  " + of, secondary}};
    line.right = {{pin.value, {.role = roleOf(pin.age.fade), .isBold = pin.age.fade == Fade::none}}};
    if (pin.age.fade != Fade::none) line.right.push_back({"  " + pin.age.text, stale});
    lines.push_back(std::move(line));
  }
  return lines;
}

Lines cellLines(const Snapshot& face, int columns, const Look& look) {
  Lines lines;
  const CellColumns shared = columnsOf(face.cells, look);
  for (const CellLine& cell : face.cells) lines.push_back(cellLine(cell, shared, columns, look));
  if (lines.empty()) lines.push_back({.left = {{face.cellsWhy, stale}}});
  return lines;
}

Lines carrierLines(const Snapshot& face) {
  Lines lines;
  if (face.carriers.size() < 2) return lines;
  for (const CarrierLine& carrier : face.carriers) {
    const std::string cells = std::to_string(carrier.cells) + (carrier.cells == 1 ? " cell" : " cells");
    TextLine line;
    line.left = {{carrierText(carrier)}, {"  " + cells + (carrier.isServing ? ", serving" : ""), secondary}};
    if (carrier.best.isReported())
      line.right = {{carrier.bestName + "  ", secondary},
                    {carrier.best.text + " " + std::string(carrier.best.unit),
                     {.role = roleOf(carrier.best.age.fade)}}};
    lines.push_back(std::move(line));
  }
  return lines;
}

Lines alarmLines(const Snapshot& face) {
  Lines lines;
  for (const AlarmLine& alarm : face.alarms) {
    if (!alarm.isRaised) continue;
    lines.push_back({.left = {{"! ", {.role = Role::poor, .isBold = true}},
                              {alarm.words.empty() ? alarm.ruleText : alarm.words, {.role = Role::poor}}},
                     .right = {{alarm.timeText, secondary}}});
  }
  return lines;
}

TextLine eventLine(const EventLine& event) {
  return {.left = {{event.timeText + " ", secondary}, {event.words}}};
}

Lines eventLines(std::span<const EventLine> events, const std::string& why) {
  Lines lines;
  for (const EventLine& event : events) lines.push_back(eventLine(event));
  if (lines.empty()) lines.push_back({.left = {{why, stale}}});
  return lines;
}

}  // namespace kelvasi::top
