// SPDX-License-Identifier: Apache-2.0
// The panes: the branches that are open, one upon the other, each a list of its children, as in the window.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Model/KelvasiModelNode.h"
#include "Tools/Top/Scroll.h"
#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

// Of two nodes with one path the one that was built later, as the model finds it. Null where there is none.
NodeRef nodeAtPath(const NodeRef& root, std::string_view path);

class Panes {
 public:
  Panes() { levels_.push_back({.path = "/", .node = nullptr}); }

  // The panes show this tree from now on. A pane whose branch is gone goes, with those above it.
  void reload(const NodeRef& root);

  std::string title() const;
  const NodeList& rows() const;
  // From the root's child on, "UMTS / UMTS Set".
  std::string way() const;
  std::size_t depth() const { return levels_.size(); }
  Scroll& scroll() { return levels_.back().scroll; }
  const Scroll& scroll() const { return levels_.back().scroll; }

  // The node under the selection, and its path; null and empty where there are no rows.
  NodeRef selected() const;
  std::string selectedPath() const;

  // Opens the selected row; false where it is no branch.
  bool open();
  // False at the root.
  bool back();
  // Opens the panes that lead to a node and selects it, as far as there is a way.
  void openPath(std::string_view nodePath);
  // Moves a long value of the selected row; false where it is at its beginning already.
  bool slide(int columns);

  // The rows in sight, `room` at most.
  Lines lines(int columns, int room, const Look& look, bool hasFocus) const;

 private:
  struct Level {
    std::string path;
    NodeRef node;
    Scroll scroll = {};
  };

  TextLine rowLine(const KelvasiModelNode& node, int columns, const Look& look, bool isSelected) const;

  NodeRef root_;
  std::vector<Level> levels_;
  int slid_ = 0;
};

}  // namespace kelvasi::top
