// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Cockpit/CockpitPages.h"

#include <QBuffer>
#include <QClipboard>
#include <QGuiApplication>
#include <algorithm>
#include <array>
#include <chrono>
#include <utility>

#include "Tools/Kelvasi/Cockpit/ChartPage.h"
#include "Tools/Kelvasi/Cockpit/CockpitPane.h"
#include "Tools/Kelvasi/Cockpit/CommonBlocks.h"

namespace kelvasi {

namespace {

using namespace cockpit;

constexpr std::size_t mostEvents = 500;

struct KeyWords {
  const char* keys;  // null for the name of a group
  const char* words;
};

constexpr std::array keyTable{
    KeyWords{nullptr, "Anywhere"},
    KeyWords{"O", "the cockpit, and back"},
    KeyWords{"/", "search all names and values"},
    KeyWords{"G", "chart"},
    KeyWords{"E", "events"},
    KeyWords{"A", "alarms"},
    KeyWords{"C", "coverage"},
    KeyWords{"M, two fingers", "mark this moment"},
    KeyWords{"?", "these keys"},
    KeyWords{"Esc, Backspace, Alt+Left", "back; also a swipe from the left edge"},
    KeyWords{nullptr, "Rows"},
    KeyWords{"Up, Down", "to the next row"},
    KeyWords{"Page Up, Page Down, Home, End", "further"},
    KeyWords{"Enter, tap", "open the row"},
    KeyWords{"Space, hold, right click", "all that is known of it"},
    KeyWords{"*", "pin it, or take its pin away"},
    KeyWords{"Left, Right", "move a long value sideways"},
    KeyWords{nullptr, "Chart"},
    KeyWords{"+, \u2212, wheel, two fingers", "a shorter or longer time"},
    KeyWords{"Left, Right, drag", "earlier or later"},
    KeyWords{"comma, point, tap", "read all values at one moment"},
    KeyWords{"<, >, hold, Shift+tap", "and at a second one"},
    KeyWords{"Home", "back to now"},
    KeyWords{"S", "save it as a picture or as values"},
    KeyWords{nullptr, "Window"},
    KeyWords{"Tab", "to the next part"},
    KeyWords{"Ctrl+S", "save a snapshot"},
    KeyWords{"F11", "fill the screen"},
    KeyWords{"Ctrl+W, Ctrl+Q", "close"},
};

std::string detailsOf(const CoverageLine& line) {
  std::string words = line.words;
  for (const std::string& part : {line.version, std::to_string(line.lastLength) + " bytes"})
    if (!part.empty()) words += ", " + part;
  return words;
}

Blocks coverageBlocks(const Coverage& coverage, double width) {
  Blocks blocks;
  blocks.push_back(wordsBlock(coverage.words, width));
  if (!coverage.lines.empty()) blocks.push_back(captionBlock("Not shown", width, "messages"));
  for (const CoverageLine& line : coverage.lines) {
    blocks.push_back(rowBlock({.name = line.code.empty() ? "No record" : line.code,
                               .below = detailsOf(line),
                               .value = countText(line.messages),
                               .valueBelow = line.age.text},
                              width));
    if (!line.sample.empty()) blocks.push_back(wordsBlock("begins " + line.sample, width));
  }
  if (coverage.beyond > 0)
    blocks.push_back(wordsBlock("And " + countText(coverage.beyond) + " of further codes.", width));
  return blocks;
}

Block actionBlock(const std::string& words, double width, std::function<void()> action) {
  Block block = linkBlock(words, width);
  block.action = std::move(action);
  return block;
}

std::span<const std::uint8_t> bytesOf(const QByteArray& bytes) {
  return {reinterpret_cast<const std::uint8_t*>(bytes.constData()), static_cast<std::size_t>(bytes.size())};
}

void copy(const std::string& text) {
  QGuiApplication::clipboard()->setText(QString::fromStdString(text));
}

}  // namespace

FaceActions CockpitPages::actionsOn(CockpitPane& in) {
  return {.openRow = [this, &in](const std::string& path) { openSheet(in, path); },
          .openLevel =
              [this, &in](std::size_t place) {
                const ServingCell serving = cockpit_.at(host_.now()).serving;
                if (place >= serving.levels.size()) return;
                openChart(in, cockpit_.chartLines(host_.now(), serving.levels[place].kind));
              },
          .openCell = [this, &in](std::uint32_t) { openChart(in, {}); },
          .openEvent =
              [this, &in](std::uint64_t number) {
                for (const EventLine& event : cockpit_.events(mostEvents))
                  if (event.number == number) openMoment(in, event.time);
              },
          .openEvents = [this, &in] { openEvents(in); },
          .openCoverage = [this, &in] { openCoverage(in); },
          .openAlarms = [this, &in] { openAlarms(in); }};
}

CockpitPage* CockpitPages::face(CockpitPane& in) {
  auto* const page = new BlockPage(BlockPage::tr("Cockpit"), &in, [this, &in](double width) {
    return faceBlocks(cockpit_.at(host_.now()), actionsOn(in), width);
  });
  page->view().setOnHold([&cockpit = cockpit_](bool isHeld) { cockpit.hold(isHeld); });
  return page;
}

CockpitPage* CockpitPages::chart(CockpitPane& in, std::vector<ChartLineKey> lines) {
  return makeChart(in, std::move(lines));
}

ChartPage* CockpitPages::makeChart(CockpitPane& in, std::vector<ChartLineKey> lines) {
  auto* const page =
      new ChartPage(&in, {cockpit_, chartTime_, [&host = host_] { return host.now(); }}, std::move(lines));
  page->setSave([this, &in, page] { openSaveChart(in, *page); });
  return page;
}

void CockpitPages::openSaveChart(CockpitPane& in, ChartPage& chart) {
  in.push(new BlockPage(BlockPage::tr("Save chart"), &in, [this, &in, &chart](double width) {
    Blocks blocks;
    blocks.push_back(actionBlock("As a picture (PNG)", width, [this, &in, &chart] {
      QByteArray bytes;
      QBuffer buffer(&bytes);
      chart.image().save(&buffer, "PNG");
      in.goBack();
      host_.keepFile(".png", bytesOf(bytes));
    }));
    blocks.push_back(actionBlock("As values (CSV)", width, [this, &in, &chart] {
      const std::string text = chart.csv();
      in.goBack();
      host_.keepFile(".csv", bytesOf(QByteArray::fromStdString(text)));
    }));
    return blocks;
  }));
}

void CockpitPages::openChart(CockpitPane& in, std::vector<ChartLineKey> lines) {
  in.push(chart(in, std::move(lines)));
}

// Two minutes around it, with the cursor on it.
void CockpitPages::openMoment(CockpitPane& in, Arrival moment) {
  auto* const page = makeChart(in, {});
  page->show(moment - std::chrono::minutes(1), std::min(host_.now(), moment + std::chrono::minutes(1)),
             moment);
  in.push(page);
}

void CockpitPages::openEvents(CockpitPane& in) {
  in.push(new BlockPage(BlockPage::tr("Events"), &in, [this, &in](double width) {
    Blocks blocks;
    for (const MarkLine& mark : cockpit_.at(host_.now()).marks) {
      blocks.push_back(
          rowBlock({.name = mark.note.empty() ? "Mark" : mark.note, .value = mark.timeText}, width));
      blocks.back().action = [this, &in, time = mark.time] { openMoment(in, time); };
      blocks.back().more = [this, &in, mark] { openNoteOf(in, mark.number, mark.note); };
    }
    if (!blocks.empty()) blocks.insert(blocks.begin(), captionBlock("Marks", width));
    if (!blocks.empty()) blocks.push_back(captionBlock("Events", width));
    for (const EventLine& event : cockpit_.events(mostEvents)) {
      blocks.push_back(eventBlock(event, width));
      blocks.back().action = [this, &in, time = event.time] { openMoment(in, time); };
    }
    if (cockpit_.eventCount() == 0) blocks.push_back(emptyBlock("Nothing has happened yet", width));
    return blocks;
  }));
}

void CockpitPages::openCoverage(CockpitPane& in) {
  in.push(new BlockPage(BlockPage::tr("Coverage"), &in, [this](double width) {
    return coverageBlocks(cockpit_.coverage(host_.now()), width);
  }));
}

void CockpitPages::openAlarms(CockpitPane& in) {
  in.push(new BlockPage(BlockPage::tr("Alarms"), &in, [this, &in](double width) {
    Blocks blocks;
    for (const AlarmLine& alarm : cockpit_.at(host_.now()).alarms) {
      Block block =
          rowBlock({.name = alarm.ruleText,
                    .below = alarm.words.empty() ? "not met yet" : alarm.words + ", " + alarm.timeText,
                    .value = alarm.isRaised ? "raised" : ""},
                   width);
      block.action = [this, &in, rule = alarm.rule] {
        cockpit_.removeAlarm(rule);
        in.refresh();
      };
      blocks.push_back(std::move(block));
    }
    blocks.push_back(wordsBlock(
        blocks.empty() ? "No alarms. Open a row with Space and choose \"Alarm\"." : "A tap removes an alarm.",
        width));
    return blocks;
  }));
}

void CockpitPages::openAlarmField(CockpitPane& in, const std::string& begin) {
  auto* page = new SearchPage(
      SearchPage::tr("Alarm"), SearchPage::tr("rsrp < -110 for 10s"), &in,
      [this, &in](const QString& text, double width) {
        Blocks blocks;
        blocks.push_back(wordsBlock(
            "A rule is a value, < or >, and a number, and for how long: rsrp < -110 for 10s.", width));
        blocks.push_back(actionBlock("Set this alarm", width, [this, &in, text] {
          const std::string wrong = cockpit_.addAlarm(text.toStdString());
          in.goBack();
          if (wrong.empty()) openAlarms(in);
        }));
        return blocks;
      });
  in.push(page);
  page->field().setText(QString::fromStdString(begin) + QStringLiteral(" < "));
}

void CockpitPages::openNote(CockpitPane& in) {
  openNoteOf(in, cockpit_.mark(host_.now()), {});
}

void CockpitPages::openNoteOf(CockpitPane& in, std::uint64_t mark, const std::string& note) {
  auto* page =
      new SearchPage(SearchPage::tr("Marked"), SearchPage::tr("A note, if you like"), &in,
                     [this, &in, mark](const QString& text, double width) {
                       Blocks blocks;
                       blocks.push_back(actionBlock(text.isEmpty() ? "Without a note" : "Keep this note",
                                                    width, [this, &in, mark, text] {
                                                      cockpit_.note(mark, text.toStdString());
                                                      in.goBack();
                                                    }));
                       return blocks;
                     });
  in.push(page);
  page->field().setText(QString::fromStdString(note));
}

void CockpitPages::togglePin(const std::string& path) {
  const std::string key = cockpit_.pinKey(path);
  if (key.empty()) {
    cockpit_.pin(path);
  } else {
    cockpit_.unpin(key);
  }
}

void CockpitPages::openSheet(CockpitPane& in, const std::string& path) {
  const auto sheet = cockpit_.sheet(path, host_.now());
  if (!sheet) return;
  in.push(new BlockPage(QString::fromStdString(sheet->name), &in,
                        [this, &in, path](double width) { return sheetBlocks(in, path, width); }));
}

Blocks CockpitPages::sheetBlocks(CockpitPane& in, const std::string& path, double width) {
  Blocks blocks;
  const auto sheet = cockpit_.sheet(path, host_.now());
  if (!sheet) return blocks;
  for (const auto& [caption, text] : sheet->lines())
    blocks.push_back(rowBlock({.name = caption, .value = text}, width));
  addSheetActions(in, *sheet, blocks, width);
  return blocks;
}

void CockpitPages::addSheetActions(CockpitPane& in, const RowSheet& sheet, Blocks& blocks, double width) {
  const std::string path = sheet.path;
  const bool isPinned = !cockpit_.pinKey(path).empty();
  blocks.push_back(actionBlock(isPinned ? "Unpin" : "Pin to the cockpit", width, [this, &in, path] {
    togglePin(path);
    in.refresh();
  }));
  blocks.push_back(actionBlock("Copy value", width, [value = sheet.value] { copy(value); }));
  blocks.push_back(actionBlock("Copy row", width, [row = sheet.name + "\t" + sheet.value] { copy(row); }));
  blocks.push_back(
      actionBlock("Show its pane", width, [this, node = sheet.nodePath] { host_.openPane(node); }));
  if (const auto line = sheet.canChart ? cockpit_.chartLine(path) : std::nullopt)
    blocks.push_back(actionBlock("Chart", width, [this, &in, line = *line] { openChart(in, {line}); }));
  if (sheet.ruleBegin.empty()) return;
  blocks.push_back(
      actionBlock("Alarm", width, [this, &in, begin = sheet.ruleBegin] { openAlarmField(in, begin); }));
}

Blocks CockpitPages::foundBlocks(CockpitPane& in, const QString& text, double width) {
  Blocks blocks;
  const SearchResult result = cockpit_.search(text.toStdString(), host_.now());
  if (!text.isEmpty()) blocks.push_back(captionBlock(result.words, width));
  for (const Found& found : result.rows) {
    Block block =
        rowBlock({.name = found.name,
                  .below = found.cellText.empty() ? found.place : found.place + ", " + found.cellText,
                  .value = found.value,
                  .valueBelow = found.age.fade == Fade::none ? "" : found.age.text,
                  .fade = found.age.fade},
                 width);
    block.action = [this, node = found.nodePath] { host_.openPane(node); };
    block.more = [this, &in, path = found.path] { openSheet(in, path); };
    blocks.push_back(std::move(block));
  }
  return blocks;
}

void CockpitPages::openSearch(CockpitPane& in) {
  in.push(new SearchPage(
      SearchPage::tr("Search"), SearchPage::tr("Name, place or value"), &in,
      [this, &in](const QString& text, double width) { return foundBlocks(in, text, width); }));
}

void CockpitPages::openKeys(CockpitPane& in) {
  in.push(new BlockPage(BlockPage::tr("Keys"), &in, [](double width) {
    Blocks blocks;
    for (const KeyWords& key : keyTable)
      blocks.push_back(key.keys ? rowBlock({.name = key.words, .value = key.keys}, width)
                                : captionBlock(key.words, width));
    return blocks;
  }));
}

}  // namespace kelvasi
