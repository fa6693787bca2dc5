// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Panes.h"

#include <algorithm>
#include <utility>

namespace kelvasi::top {

namespace {

constexpr int everything = 1'000'000;
constexpr int gap = 2;  // between a name and its value

// A branch is built after its children, and they in their order.
NodeRef findUnder(const NodeRef& node, const std::string& itsPath, std::string_view path) {
  if (itsPath == path) return node;
  if (!node->childNodes()) return nullptr;
  const NodeList& children = *node->childNodes();
  for (auto child = children.rbegin(); child != children.rend(); ++child) {
    if (auto found = findUnder(*child, pathByAppending(itsPath, (*child)->displayName()), path)) return found;
  }
  return nullptr;
}

// A row that is the node, or leads to it.
std::optional<std::size_t> rowTowards(const NodeList& rows, const std::string& path,
                                      std::string_view nodePath) {
  for (std::size_t row = 0; row < rows.size(); ++row) {
    const std::string own = pathByAppending(path, rows[row]->displayName());
    const bool isBefore =
        nodePath.size() > own.size() && nodePath.starts_with(own) && nodePath[own.size()] == '/';
    if (nodePath == own || isBefore) return row;
  }
  return std::nullopt;
}

}  // namespace

NodeRef nodeAtPath(const NodeRef& root, std::string_view path) {
  return root ? findUnder(root, "/", path) : nullptr;
}

void Panes::reload(const NodeRef& root) {
  if (root == root_) return;
  root_ = root;
  levels_.front().node = root;
  for (std::size_t level = 1; level < levels_.size(); ++level) {
    levels_[level].node = nodeAtPath(root, levels_[level].path);
    if (!levels_[level].node) return levels_.resize(level);
  }
}

std::string Panes::title() const {
  return levels_.back().node ? levels_.back().node->displayName() : "Kelvasi";
}

const NodeList& Panes::rows() const {
  static const NodeList none;
  const NodeRef& node = levels_.back().node;
  return node && node->childNodes() ? *node->childNodes() : none;
}

std::string Panes::way() const {
  std::string way;
  for (std::size_t level = 1; level < levels_.size(); ++level)
    way += (way.empty() ? "" : " / ") + (levels_[level].node ? levels_[level].node->displayName() : "");
  return way.empty() ? title() : way;
}

NodeRef Panes::selected() const {
  const std::size_t row = scroll().selected;
  return row < rows().size() ? rows()[row] : nullptr;
}

std::string Panes::selectedPath() const {
  const NodeRef node = selected();
  return node ? pathByAppending(levels_.back().path, node->displayName()) : "";
}

bool Panes::open() {
  const NodeRef node = selected();
  if (!node || !node->childNodes()) return false;
  levels_.push_back({.path = selectedPath(), .node = node});
  slid_ = 0;
  return true;
}

bool Panes::back() {
  if (levels_.size() == 1) return false;
  levels_.pop_back();
  slid_ = 0;
  return true;
}

void Panes::openPath(std::string_view nodePath) {
  levels_.resize(1);
  slid_ = 0;
  do {
    const auto row = rowTowards(rows(), levels_.back().path, nodePath);
    if (!row) return;
    scroll().selected = *row;
  } while (selectedPath() != nodePath && open());
}

bool Panes::slide(int columns) {
  const int before = std::exchange(slid_, std::max(0, slid_ + columns));
  return slid_ != before;
}

TextLine Panes::rowLine(const KelvasiModelNode& node, int columns, const Look& look, bool isSelected) const {
  TextLine line;
  line.isSelected = isSelected;
  if (node.childNodes()) {
    line.left = {{node.displayName(), {.isBold = true}}};
    line.right = {{"\u203A", {.role = Role::secondary}}};
    return line;
  }
  line.left = {{node.displayName(), {.role = Role::secondary}}};
  const std::string& value = *node.value();
  const int room = columns - terminal::widthOf(node.displayName(), look.set) - gap;
  const int need = terminal::widthOf(value, look.set);
  if (need <= room) {
    line.right = {{value}};
  } else if (isSelected && slid_ > 0) {
    line.left = {
        {windowOf(node.displayName() + "  " + value, std::min(slid_, need + gap), everything, look)}};
  } else {
    line.left.push_back({"  " + value, {}});
  }
  return line;
}

Lines Panes::lines(int columns, int room, const Look& look, bool hasFocus) const {
  Lines lines;
  const NodeList& all = rows();
  const std::size_t end = std::min(all.size(), scroll().first + static_cast<std::size_t>(std::max(room, 0)));
  for (std::size_t row = scroll().first; row < end; ++row)
    lines.push_back(rowLine(*all[row], columns, look, hasFocus && row == scroll().selected));
  if (all.empty()) lines.push_back({.left = {{"Nothing received yet", {.role = Role::stale}}}});
  return lines;
}

}  // namespace kelvasi::top
