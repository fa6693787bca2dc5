// SPDX-License-Identifier: Apache-2.0
// What takes the place of cockpit and panes for a while: events, cells, a chart, a search, help.
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "Platform/Terminal/Key.h"
#include "Tools/Top/Scene.h"
#include "Tools/Top/Scroll.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

using terminal::Key;

class Page;

// What pages ask of the screen.
class Host {
 public:
  virtual Scene& scene() = 0;
  virtual void open(std::unique_ptr<Page> page) = 0;
  // Leaves the page on top. It lives until its key is taken.
  virtual void close() = 0;
  // Leaves all pages and shows the pane of a row, with the row selected.
  virtual void openPane(const std::string& nodePath) = 0;
  // A word on what was done, for a few seconds.
  virtual void say(std::string words) = 0;
  virtual void copy(std::string_view text) = 0;
  // Writes a snapshot of what was listed; says where it is, or that it failed.
  virtual void save(const PlistValue& contents, const std::string& description) = 0;

 protected:
  ~Host() = default;
};

class Page {
 public:
  virtual ~Page() = default;

  virtual std::string title() const = 0;
  // At the right of the title: where in a list it stands.
  virtual std::string position() const { return {}; }
  // All lines that are seen.
  virtual Lines lines(int columns, int rows, const Look& look) = 0;
  // Whether the key was for the page.
  virtual bool take(const Key& key) = 0;
  // Where the cursor stands, within the page; nothing: nowhere.
  virtual std::optional<terminal::Place> cursor(const Look&) const { return std::nullopt; }
  // For the line of keys.
  virtual std::string keys() const { return "Esc back"; }
};

// A page of rows, one of which is selected.
class ListPage : public Page {
 public:
  std::string position() const override { return scroll_.words(count_, room_); }
  Lines lines(int columns, int rows, const Look& look) override;
  bool take(const Key& key) override;

 protected:
  // Made anew for every look.
  virtual Lines rows(int columns, const Look& look) = 0;
  // Stand above the rows and do not scroll.
  virtual Lines head(int, const Look&) { return {}; }
  virtual void choose(std::size_t) {}
  Scroll& scroll() { return scroll_; }
  std::size_t count() const { return count_; }

 private:
  Scroll scroll_;
  std::size_t count_ = 0;
  std::size_t room_ = 0;
  int above_ = 0;  // lines of the head
};

}  // namespace kelvasi::top
