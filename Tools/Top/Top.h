// SPDX-License-Identifier: Apache-2.0
// The screen of kelvasictl top: draws a scene and takes keys. It reads no clock and knows no terminal.
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "Platform/Terminal/Grid.h"
#include "Tools/Top/Layout.h"
#include "Tools/Top/Page.h"
#include "Tools/Top/Panes.h"

namespace kelvasi::top {

// What is done beyond the screen.
struct Deeds {
  std::function<bool(std::string_view text)> copy;  // false: too long
  // What became of it, in words.
  std::function<std::string(const PlistValue& contents, const std::string& description)> save;
  std::function<void()> redraw;
};

struct Drawing {
  terminal::Grid grid;
  std::optional<terminal::Place> cursor;
};

class Top : public Host {
 public:
  Top(Scene& scene, cockpit::TextStyle style, Deeds deeds);

  Drawing draw(terminal::Size size, const Look& look);
  // False when the user wants to quit.
  bool take(const Key& key);
  // A second has passed.
  void pass();

  const Panes& panes() const { return panes_; }

 private:
  Scene& scene() override { return scene_; }
  void open(std::unique_ptr<Page> page) override { pages_.push_back(std::move(page)); }
  void close() override { toClose_ += pages_.size() > toClose_ ? 1 : 0; }
  void openPane(const std::string& nodePath) override;
  void say(std::string words) override;
  void copy(std::string_view text) override;
  void save(const PlistValue& contents, const std::string& description) override;

  void drawMain(terminal::Grid& grid, const cockpit::Snapshot& face, const Look& look);
  void drawSide(terminal::Grid& grid, const Look& look);
  void drawPage(Drawing& drawing, const cockpit::Snapshot& face, const Look& look);
  void drawTimeline(terminal::Grid& grid, const Look& look);
  void drawFoot(terminal::Grid& grid, const Look& look);
  void drawTitled(terminal::Grid& grid, const Area& area, const std::string& title, const Lines& lines,
                  const Look& look, std::string position = {});

  bool takeOnPage(const Key& key);
  bool takeInPanes(const Key& key);
  bool takeCommand(const Key& key);
  bool takePress(const Key& key);
  void leave();
  void pinRow();
  void chartRow();
  void mark();
  void openSave();

  Scene& scene_;
  cockpit::TextStyle style_;
  Deeds deeds_;
  Panes panes_;
  std::vector<std::unique_ptr<Page>> pages_;
  std::size_t toClose_ = 0;
  Layout layout_;
  Area pageArea_;
  cockpit::Chart chart_;  // beside the cockpit
  std::string message_;
  int messageSeconds_ = 0;
};

}  // namespace kelvasi::top
