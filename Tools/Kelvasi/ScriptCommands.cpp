// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/ScriptCommands.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <algorithm>
#include <array>
#include <cstdio>
#include <string_view>
#include <vector>

#include "Platform/QtWidgets/CellWidget.h"
#include "Platform/QtWidgets/TableWidget.h"
#include "Tools/Kelvasi/ShownWindow.h"

namespace kelvasi {

namespace {

StepResult notYet() {
  return {};
}

StepResult done() {
  return {.isDone = true};
}

StepResult doneIf(bool isDone) {
  return {.isDone = isDone};
}

StepResult doneOr(bool isDone, const QString& failure) {
  return {.isDone = isDone, .failure = isDone ? std::string() : failure.toStdString()};
}

ScriptStep showState(const QString&) {
  return [] {
    std::puts(QJsonDocument(shownState()).toJson(QJsonDocument::Compact).constData());
    std::fflush(stdout);
    return done();
  };
}

ScriptStep awaitStatus(const QString& text) {
  return [text] { return doneIf(shownStatus().contains(text)); };
}

ScriptStep awaitTitle(const QString& text) {
  return [text] { return doneIf(shownState()["title"] == text); };
}

ScriptStep awaitUpdate(const QString&) {
  return [before = QString()]() mutable {
    const QString now = shownStatus();
    if (before.isNull()) before = now;
    return doneIf(now != before);
  };
}

// Waits for the row, so that a script may begin before there is anything to see.
ScriptStep openNamed(const QString& name) {
  return [name] {
    if (!goToRow(name)) return notYet();
    openRow();
    return done();
  };
}

// The first branch of the pane, as soon as there is one, and that one's, until there are only values.
ScriptStep openDeepest(const QString&) {
  return [depth = 0]() mutable {
    for (const CellWidget* const cell : shownTable()->cellsInSight()) {
      if (!cell->opens()) continue;
      shownTable()->open(cell->row());
      ++depth;
      return notYet();
    }
    return doneIf(depth > 0);
  };
}

// Opens pane after pane, the first branch first, until one shows a value that is wider than the window; then
// scrolls it a little way and takes its picture.
class WideValueSearch {
 public:
  explicit WideValueSearch(const QString& path) : path_(path) {}

  StepResult operator()() {
    if (showsWideValue()) {
      scrollWideValue();
      return doneOr(savePicture(path_), "cannot write " + path_);
    }
    if (shownTable()->rows() == 0 && tried_.size() == 1) return notYet();
    if (openNextBranch()) return notYet();
    tried_.pop_back();
    if (tried_.empty()) return giveUp();
    press(Qt::Key_Escape);
    return notYet();
  }

 private:
  static StepResult giveUp() {
    std::fputs("kelvasi: no value is wider than the window, so there is no picture of one\n", stderr);
    return done();
  }
  bool openNextBranch() {
    TableWidget& table = *shownTable();
    for (const CellWidget* const cell : table.cellsInSight()) {
      const std::size_t row = cell->row();
      if (row < tried_.back() || !cell->opens()) continue;
      tried_.back() = row + 1;
      tried_.push_back(0);
      table.open(row);
      return true;
    }
    return false;
  }

  QString path_;
  std::vector<std::size_t> tried_{0};  // how many rows of each open pane have been looked into
};

ScriptStep takePictureOfWideValue(const QString& path) {
  return WideValueSearch(path);
}

ScriptStep goBack(const QString&) {
  return [] {
    press(Qt::Key_Escape);
    return done();
  };
}

ScriptStep goToRoot(const QString&) {
  return [] {
    if (isAtRoot()) return done();
    press(Qt::Key_Escape);
    return notYet();
  };
}

ScriptStep pressKeys(const QString& keys) {
  return [sequence = QKeySequence(keys), keys] {
    const bool isKnown = !sequence.isEmpty() && sequence[0].key() != Qt::Key_unknown;
    if (isKnown) press(sequence);
    return doneOr(isKnown, "there is no key " + keys);
  };
}

ScriptStep typeText(const QString& text) {
  return [text] {
    type(text);
    return done();
  };
}

ScriptStep clickTimes(const QString& text, int times) {
  return [text, times] { return doneOr(click(text, times), "there is no button " + text); };
}

ScriptStep clickButton(const QString& text) {
  return clickTimes(text, 1);
}

ScriptStep clickButtonTwice(const QString& text) {
  return clickTimes(text, 2);
}

ScriptStep takePicture(const QString& path) {
  return [path] { return doneOr(savePicture(path), "cannot write " + path); };
}

struct Command {
  std::string_view name;
  ScriptStep (*step)(const QString& argument);
};

constexpr std::array commands{
    Command{"state", showState},
    Command{"await-status", awaitStatus},
    Command{"await-title", awaitTitle},
    Command{"await-update", awaitUpdate},
    Command{"open", openNamed},
    Command{"open-deepest", openDeepest},
    Command{"back", goBack},
    Command{"root", goToRoot},
    Command{"press", pressKeys},
    Command{"type", typeText},
    Command{"click", clickButton},
    Command{"click-twice", clickButtonTwice},
    Command{"picture", takePicture},
    Command{"picture-wide-value", takePictureOfWideValue},
};

}  // namespace

ScriptStep scriptStep(const QString& line) {
  const std::string name = line.section(QLatin1Char(' '), 0, 0).toStdString();
  const auto command = std::ranges::find(commands, name, &Command::name);
  if (command == commands.end()) return nullptr;
  return command->step(line.section(QLatin1Char(' '), 1));
}

}  // namespace kelvasi
