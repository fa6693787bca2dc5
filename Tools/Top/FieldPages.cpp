// SPDX-License-Identifier: Apache-2.0
// The pages in which something is typed: search, save, a note.
#include <utility>

#include "Tools/Top/LineField.h"
#include "Tools/Top/Pages.h"
#include "Tools/Top/Panes.h"
#include "Tools/Top/Signs.h"

namespace kelvasi::top {

namespace {

constexpr Style secondary{.role = Role::secondary};

// A line to type in, and rows below it.
class FieldPage : public ListPage {
 public:
  FieldPage(Host& host, std::string prompt) : host_(host), prompt_(std::move(prompt)) {}

  bool take(const Key& key) override {
    if (key.kind == Key::Kind::enter || !field_.take(key)) return ListPage::take(key);
    scroll() = {};
    return true;
  }
  std::optional<terminal::Place> cursor(const Look& look) const override {
    const int before = terminal::widthOf(prompt_, look.set);
    return terminal::Place{before + field_.cursor(columns_ - before, look), 0};
  }

 protected:
  Lines head(int columns, const Look& look) override {
    columns_ = columns;
    const int room = std::max(columns - terminal::widthOf(prompt_, look.set), 0);
    return {{.left = {{prompt_, secondary}, {field_.seen(room, look), {.isBold = true}}}}};
  }
  Host& host() const { return host_; }
  const LineField& field() const { return field_; }

 private:
  Host& host_;
  std::string prompt_;
  LineField field_;
  int columns_ = 0;
};

class SearchPage : public FieldPage {
 public:
  explicit SearchPage(Host& host) : FieldPage(host, "/ ") {}
  std::string title() const override { return words_.empty() ? "Search names, places and values" : words_; }
  std::string keys() const override { return "Enter its pane  Esc back"; }

 protected:
  // Values are those of the moment that is shown, where its display has the row.
  Lines rows(int, const Look&) override {
    Scene& scene = host().scene();
    auto result = scene.cockpit().search(field().text(), scene.moment());
    found_ = std::move(result.rows);
    words_ = field().text().empty() ? "" : result.words;
    const NodeRef root = scene.root();
    Lines lines;
    for (const cockpit::Found& found : found_) {
      const NodeRef node = nodeAtPath(root, found.nodePath);
      TextLine line;
      line.left = {{found.name}, {"  " + (found.cellText.empty() ? found.place : found.cellText), secondary}};
      line.right = {{node && node->value() ? *node->value() : found.value, {.role = roleOf(found.age.fade)}}};
      if (found.age.fade != cockpit::Fade::none)
        line.right.push_back({"  " + found.age.text, {.role = Role::stale}});
      lines.push_back(std::move(line));
    }
    return lines;
  }
  void choose(std::size_t row) override {
    if (row < found_.size()) host().openPane(found_[row].nodePath);
  }

 private:
  std::vector<cockpit::Found> found_;
  std::string words_;
};

std::string descriptionOf(const PlistValue& entry) {
  const PlistValue text = entry.dictionary() ? entry.dictionary()->get("Description") : PlistValue();
  return text.string() ? *text.string() : "";
}

class SavePage : public FieldPage {
 public:
  explicit SavePage(Host& host) : FieldPage(host, "Description: "), contents_(host.scene().saveContents()) {}
  std::string title() const override { return "Save a snapshot"; }
  std::string keys() const override { return "Enter save  Esc cancel"; }
  bool take(const Key& key) override {
    if (key.kind != Key::Kind::enter) return FieldPage::take(key);
    host().save(contents_, field().text());
    host().close();
    return true;
  }

 protected:
  Lines rows(int, const Look&) override {
    Lines lines;
    if (contents_.array())
      for (const PlistValue& entry : *contents_.array()) lines.push_back({.left = {{descriptionOf(entry)}}});
    if (lines.empty()) lines.push_back({.left = {{"Nothing received yet", {.role = Role::stale}}}});
    return lines;
  }

 private:
  PlistValue contents_;
};

class NotePage : public FieldPage {
 public:
  NotePage(Host& host, std::uint64_t mark) : FieldPage(host, "Note: "), mark_(mark) {}
  std::string title() const override { return "Marked"; }
  std::string keys() const override { return "Enter keep  Esc without a note"; }
  bool take(const Key& key) override {
    if (key.kind != Key::Kind::enter) return FieldPage::take(key);
    host().scene().cockpit().note(mark_, field().text());
    host().close();
    return true;
  }

 protected:
  Lines rows(int, const Look&) override {
    Lines lines;
    const auto& marks = host().scene().cockpit().marks();
    for (auto mark = marks.rbegin(); mark != marks.rend(); ++mark)
      lines.push_back(
          {.left = {{mark->timeText + " ", secondary}, {mark->note.empty() ? "Mark" : mark->note}}});
    return lines;
  }

 private:
  std::uint64_t mark_;
};

}  // namespace

std::unique_ptr<Page> makeSearchPage(Host& host) {
  return std::make_unique<SearchPage>(host);
}

std::unique_ptr<Page> makeSavePage(Host& host) {
  return std::make_unique<SavePage>(host);
}

std::unique_ptr<Page> makeNotePage(Host& host, std::uint64_t mark) {
  return std::make_unique<NotePage>(host, mark);
}

}  // namespace kelvasi::top
