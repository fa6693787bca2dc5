// SPDX-License-Identifier: Apache-2.0
// Help, events, cells, and all of one row.
#include <array>
#include <utility>

#include "Tools/Top/FaceLines.h"
#include "Tools/Top/Pages.h"

namespace kelvasi::top {

namespace {

constexpr std::size_t mostEvents = 500;
constexpr Style secondary{.role = Role::secondary};

struct KeyWords {
  const char* keys;
  const char* words;
};

constexpr std::array keyTable{
    KeyWords{"Up Down PgUp PgDn Home End", "move among rows"},
    KeyWords{"Enter, Right", "open the row"},
    KeyWords{"Esc, Backspace, Left", "back"},
    KeyWords{"Left Right", "move a long value sideways"},
    KeyWords{"y", "a row's whole value, and all that is known of it"},
    KeyWords{"c", "copy the row's value, where the terminal takes it (OSC 52)"},
    KeyWords{"/", "search all names and values"},
    KeyWords{"*", "pin the row to the cockpit, or take its pin away"},
    KeyWords{"G", "chart: of the row, or of the cells"},
    KeyWords{"E", "events"},
    KeyWords{"L", "cells and carriers"},
    KeyWords{"M", "mark this moment; a note can follow"},
    KeyWords{"P, Space", "hold the display still and go on; play a drive"},
    KeyWords{"[ ]", "the state, or in a drive the event, before and after"},
    KeyWords{"{ }", "ten seconds back and on"},
    KeyWords{"< >", "to the beginning and the end"},
    KeyWords{"S", "save a snapshot with a description"},
    KeyWords{"Ctrl+L", "draw everything anew"},
    KeyWords{"?", "these keys"},
    KeyWords{"q", "quit"},
};

class HelpPage : public ListPage {
 public:
  std::string title() const override { return "Keys"; }

 protected:
  Lines rows(int columns, const Look& look) override {
    const int column = std::min(28, columns * 7 / 10);
    Lines lines;
    for (const KeyWords& key : keyTable) {
      const auto words = wrapped(key.words, columns - column, look);
      for (const std::string& part : words)
        lines.push_back(
            {.left = {{padRight(&part == &words.front() ? key.keys : "", column, look), secondary}, {part}}});
    }
    return lines;
  }
};

class EventsPage : public ListPage {
 public:
  explicit EventsPage(Host& host) : host_(host) {}
  std::string title() const override { return "Events"; }
  std::string keys() const override { return "Enter its moment  Esc back"; }

 protected:
  Lines rows(int, const Look&) override {
    events_ = host_.scene().events(mostEvents);
    return eventLines(events_, "Nothing has happened yet");
  }
  void choose(std::size_t row) override {
    if (row >= events_.size()) return;
    const Arrival moment = events_[row].time;
    host_.close();
    host_.scene().goTo(moment);
  }

 private:
  Host& host_;
  std::vector<cockpit::EventLine> events_;
};

class CellsPage : public ListPage {
 public:
  explicit CellsPage(Host& host) : host_(host) {}
  std::string title() const override { return "Cells and carriers"; }

 protected:
  Lines rows(int columns, const Look& look) override {
    const cockpit::Snapshot face = host_.scene().face();
    Lines lines = cellLines(face, columns, look);
    for (TextLine& line : carrierLines(face)) lines.push_back(std::move(line));
    return lines;
  }

 private:
  Host& host_;
};

class ValuePage : public ListPage {
 public:
  ValuePage(Host& host, NodeRef row, std::string nodePath)
      : host_(host), row_(std::move(row)), nodePath_(std::move(nodePath)) {}
  std::string title() const override { return row_->displayName(); }
  std::string keys() const override { return "c copy  Esc back"; }
  bool take(const Key& key) override {
    if (!key.is(U'c')) return ListPage::take(key);
    host_.copy(value());
    return true;
  }

 protected:
  Lines rows(int columns, const Look& look) override {
    Lines lines;
    add(lines, "Value", value(), columns, look);
    auto& cockpit = host_.scene().cockpit();
    const auto path = cockpit.rowPath(nodePath_);
    const auto sheet = path ? cockpit.sheet(*path, host_.scene().moment()) : std::nullopt;
    if (!sheet) return lines;
    for (const auto& [caption, text] : sheet->lines())
      if (caption != "Value") add(lines, caption, text, columns, look);
    return lines;
  }

 private:
  std::string value() const { return row_->value() ? *row_->value() : ""; }

  static void add(Lines& lines, const std::string& caption, const std::string& text, int columns,
                  const Look& look) {
    constexpr int column = 14;
    const auto parts = wrapped(text, std::max(columns - column, 8), look);
    for (const std::string& part : parts)
      lines.push_back(
          {.left = {{padRight(&part == &parts.front() ? caption : "", column, look), secondary}, {part}}});
  }

  Host& host_;
  NodeRef row_;
  std::string nodePath_;
};

}  // namespace

std::unique_ptr<Page> makeHelpPage(Host&) {
  return std::make_unique<HelpPage>();
}

std::unique_ptr<Page> makeEventsPage(Host& host) {
  return std::make_unique<EventsPage>(host);
}

std::unique_ptr<Page> makeCellsPage(Host& host) {
  return std::make_unique<CellsPage>(host);
}

std::unique_ptr<Page> makeValuePage(Host& host, NodeRef row, const std::string& nodePath) {
  return std::make_unique<ValuePage>(host, std::move(row), nodePath);
}

}  // namespace kelvasi::top
