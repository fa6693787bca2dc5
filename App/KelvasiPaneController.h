// SPDX-License-Identifier: Apache-2.0
// One screen of the viewer: the children of a branch of the display tree, a row each.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "App/SaveShell.h"
#include "Model/KelvasiModelNode.h"
#include "Platform/UserInterface/UserInterface.h"

namespace kelvasi {

class KelvasiPaneController : public TableViewController {
 public:
  // `node` may be null. Loading, with an empty status.
  KelvasiPaneController(UserInterface& ui, SaveShell& shell, NodeRef node, std::string path);

  // Makes the toolbar anew: spinner, status and, where the shell allows it, the Save button.
  void createToolbarItems();
  void viewWillAppear(bool animated) override;
  // Nothing stands for no status.
  void setStatus(std::optional<std::string_view> status, bool isLoading);
  // Shows another state of the branch; null when there is none.
  void reloadWithNode(NodeRef node);
  // As a tap on its row does, without animation. False when there is no such branch.
  bool openBranchNamed(std::string_view name);
  // The same for a row. False for a leaf.
  bool openRow(std::size_t row);
  // The row that is the node of this path, or leads to it.
  std::optional<std::size_t> rowTowards(std::string_view nodePath) const;
  std::string pathOfRow(std::size_t row) const;
  const std::string& path() const { return keyPath_; }
  void viewWillDisappear(bool animated) override;

  // For the table.
  std::size_t tableViewNumberOfRowsInSection(TableView& tableView, std::size_t section) override;
  std::unique_ptr<TableViewCell> tableViewCellForRowAtIndexPath(TableView& tableView,
                                                                const IndexPath& indexPath) override;
  void tableViewDidSelectRowAtIndexPath(TableView& tableView,
                                        const std::optional<IndexPath>& indexPath) override;

 private:
  void showTitle();
  const KelvasiModelNode& childAt(const IndexPath& indexPath) const;
  void openBranch(const NodeRef& child, bool animated);

  UserInterface& ui_;
  SaveShell& shell_;
  NodeRef nodes_;  // the one branch that is shown
  std::string keyPath_;
  std::string status_;
  bool isLoading_ = true;
};

}  // namespace kelvasi
