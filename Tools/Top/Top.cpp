// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Top.h"

#include <utility>

#include "Tools/Top/FaceLines.h"
#include "Tools/Top/Pages.h"
#include "Tools/Top/TimelineDrawing.h"

namespace kelvasi::top {

namespace {

using Kind = Key::Kind;

constexpr int messageTime = 5;  // seconds
constexpr auto leap = std::chrono::seconds(10);

}  // namespace

Top::Top(Scene& itsScene, cockpit::TextStyle style, Deeds deeds)
    : scene_(itsScene), style_(std::move(style)), deeds_(std::move(deeds)) {}

void Top::openPane(const std::string& nodePath) {
  toClose_ = pages_.size();
  panes_.openPath(nodePath);
}

void Top::say(std::string words) {
  message_ = std::move(words);
  messageSeconds_ = messageTime;
}

void Top::copy(std::string_view text) {
  say(deeds_.copy(text) ? "Copied, where the terminal allows it" : "Too long to copy");
}

void Top::save(const PlistValue& contents, const std::string& description) {
  say(deeds_.save(contents, description));
}

void Top::pass() {
  if (messageSeconds_ > 0 && --messageSeconds_ == 0) message_.clear();
}

bool Top::take(const Key& key) {
  message_.clear();
  if (key.kind == Kind::redraw) {
    deeds_.redraw();
    return true;
  }
  if (!pages_.empty() && takeOnPage(key)) return true;
  if (key.is(U'q') || key.is(U'Q')) return false;
  if (key.kind == Kind::press) return takePress(key);
  if (!takeCommand(key) && pages_.empty()) takeInPanes(key);
  return true;
}

// Places of the mouse are the page's own there.
bool Top::takeOnPage(const Key& key) {
  Key own = key;
  own.place.column -= pageArea_.column;
  own.place.row -= pageArea_.row;
  const bool isOutside = key.kind == Kind::press && !pageArea_.contains(key.place);
  const bool isTaken = !isOutside && pages_.back()->take(own);
  if (!isTaken && (key.kind == Kind::escape || key.kind == Kind::backspace)) close();
  const bool isDone = isTaken || toClose_ > 0;
  leave();
  return isDone;
}

// The pages that were left, now that none of them is at work.
void Top::leave() {
  pages_.resize(pages_.size() - std::min(toClose_, pages_.size()));
  toClose_ = 0;
}

bool Top::takeInPanes(const Key& key) {
  const NodeRef row = panes_.selected();
  const bool isLeaf = row && row->value();
  constexpr int slide = 8;
  switch (key.kind) {
    case Kind::enter:
      return panes_.open() || (isLeaf && (open(makeValuePage(*this, row, panes_.selectedPath())), true));
    case Kind::right:
      if (isLeaf) panes_.slide(slide);
      return isLeaf || panes_.open();
    case Kind::left:
      return panes_.slide(-slide) || panes_.back();
    case Kind::escape:
    case Kind::backspace:
      return panes_.back();
    default:
      return panes_.scroll().take(key, panes_.rows().size(), static_cast<std::size_t>(layout_.panes.rows));
  }
}

bool Top::takeCommand(const Key& key) {
  if (key.kind != Kind::character) return false;
  const NodeRef row = panes_.selected();
  switch (key.character) {
    case U'/':
      return open(makeSearchPage(*this)), true;
    case U'?':
    case U'h':
      return open(makeHelpPage(*this)), true;
    case U'e':
    case U'E':
      return open(makeEventsPage(*this)), true;
    case U'l':
    case U'L':
      return open(makeCellsPage(*this)), true;
    case U's':
    case U'S':
      return openSave(), true;
    case U'g':
    case U'G':
      return chartRow(), true;
    case U'm':
    case U'M':
      return mark(), true;
    case U'*':
      return pinRow(), true;
    case U'y':
      if (row) open(makeValuePage(*this, row, panes_.selectedPath()));
      return true;
    case U'c':
      if (row) copy(row->value() ? *row->value() : row->displayName());
      return true;
    case U'p':
    case U'P':
    case U' ':
      return scene_.pause(), true;
    case U'[':
    case U']':
      if (!scene_.step(key.character == U'[' ? -1 : 1))
        say(key.character == U'[' ? "Nothing before this" : "Nothing after this");
      return true;
    case U'{':
    case U'}':
      return scene_.move(key.character == U'{' ? -leap : leap), true;
    case U'<':
      return scene_.goTo(Arrival::min()), true;
    case U'>':
      return scene_.goTo(Arrival::max()), true;
    default:
      return false;
  }
}

bool Top::takePress(const Key& key) {
  if (layout_.timeline.contains(key.place)) {
    if (const auto timeline = scene_.timeline(1))
      scene_.goTo(momentAt(*timeline, key.place.column, layout_.timeline.columns));
    return true;
  }
  if (!pages_.empty()) return true;
  if (layout_.chart.contains(key.place)) open(makeChartPage(*this, {}));
  if (layout_.levels.contains(key.place)) open(makeChartPage(*this, {}));
  if (layout_.cells.contains(key.place)) open(makeCellsPage(*this));
  if (layout_.events.contains(key.place)) open(makeEventsPage(*this));
  if (!layout_.panes.contains(key.place)) return true;
  const std::size_t pressed =
      panes_.scroll().first + static_cast<std::size_t>(key.place.row - layout_.panes.row);
  if (pressed >= panes_.rows().size()) return true;
  panes_.scroll().selected = pressed;
  panes_.open();
  return true;
}

void Top::pinRow() {
  const auto path = scene_.cockpit().rowPath(panes_.selectedPath());
  if (!path) return say("Only a row with a value can be pinned");
  const std::string key = scene_.cockpit().pinKey(*path);
  if (!key.empty()) {
    scene_.cockpit().unpin(key);
    return say("Its pin is taken away");
  }
  say(scene_.cockpit().pin(*path) ? "Pinned to the cockpit" : "There are too many pins");
}

void Top::chartRow() {
  const auto path = scene_.cockpit().rowPath(panes_.selectedPath());
  open(makeChartPage(*this, path ? scene_.cockpit().chartLine(*path) : std::nullopt));
}

void Top::openSave() {
  if (std::string why = scene_.whyNoSave(); !why.empty()) return say(std::move(why));
  open(makeSavePage(*this));
}

void Top::mark() {
  open(makeNotePage(*this, scene_.cockpit().mark(scene_.moment())));
}

}  // namespace kelvasi::top
