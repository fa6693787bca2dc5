// SPDX-License-Identifier: Apache-2.0
#include "App/KelvasiPaneController.h"

#include <algorithm>
#include <utility>

#include "App/KelvasiCell.h"

namespace kelvasi {

namespace {

constexpr const char* cellIdentifier = "KelvasiPaneControllerCell";
constexpr double statusFontSize = 14.0;

void showBranch(KelvasiCell& cell, const KelvasiModelNode& child) {
  cell.setKey(child.displayName());
  cell.body().setAccessory(CellAccessory::disclosureIndicator);
  cell.setValue("");
  cell.setLayoutKey();
}

void showLeaf(KelvasiCell& cell, const KelvasiModelNode& child) {
  cell.setKey(child.displayName());
  cell.body().setAccessory(CellAccessory::none);
  cell.setValue(*child.value());
  cell.setLayout();
}

}  // namespace

KelvasiPaneController::KelvasiPaneController(UserInterface& ui, SaveShell& shell, NodeRef node,
                                             std::string path)
    : TableViewController(ui.makeTableControllerBody()),
      ui_(ui),
      shell_(shell),
      nodes_(std::move(node)),
      keyPath_(std::move(path)) {}

void KelvasiPaneController::createToolbarItems() {
  const Font font = Font::system(statusFontSize);
  ToolbarItems items{
      ActivitySpinner{.isAnimating = isLoading_, .hidesWhenStopped = true},
      ToolbarLabel{.text = status_, .font = font, .size = ui_.sizeOfText(status_, font)},
      FlexibleSpace{},
  };
  if (shell_.allowSaveButton()) items.push_back(SaveButton{[&shell = shell_] { shell.showSaveView(); }});
  setToolbarItems(std::move(items), true);
}

void KelvasiPaneController::viewWillAppear(bool animated) {
  TableViewController::viewWillAppear(animated);
  showTitle();
  if (navigationController()) navigationController()->setToolbarHidden(false, animated);
  createToolbarItems();
}

void KelvasiPaneController::viewWillDisappear(bool) {
  resignFirstResponder();
}

void KelvasiPaneController::setStatus(std::optional<std::string_view> status, bool isLoading) {
  status_ = status.value_or("");
  isLoading_ = isLoading;
  createToolbarItems();
}

void KelvasiPaneController::reloadWithNode(NodeRef node) {
  nodes_ = std::move(node);
  showTitle();
  tableView().reloadData();
  createToolbarItems();
}

void KelvasiPaneController::showTitle() {
  setTitle(nodes_ ? nodes_->displayName() : "Kelvasi");
}

std::size_t KelvasiPaneController::tableViewNumberOfRowsInSection(TableView&, std::size_t) {
  return nodes_ && nodes_->childNodes() ? nodes_->childNodes()->size() : 0;
}

const KelvasiModelNode& KelvasiPaneController::childAt(const IndexPath& indexPath) const {
  return *nodes_->childNodes()->at(indexPath.row);
}

// Both kinds of cell share one identifier; a cell that is used again keeps its kind.
std::unique_ptr<TableViewCell> KelvasiPaneController::tableViewCellForRowAtIndexPath(
    TableView& tableView, const IndexPath& indexPath) {
  const KelvasiModelNode& child = childAt(indexPath);
  auto reused = tableView.dequeueReusableCellWithIdentifier(cellIdentifier);
  // NOLINTNEXTLINE(cppcoreguidelines-pro-type-static-cast-downcast): the table holds only cells made here
  std::unique_ptr<KelvasiCell> cell(static_cast<KelvasiCell*>(reused.release()));
  constexpr CellStyle style = CellStyle::twoLabelValue;
  if (child.childNodes()) {
    if (!cell)
      cell = std::make_unique<KelvasiCell>(ui_, tableView, KelvasiCell::StyleKey{style}, cellIdentifier);
    showBranch(*cell, child);
  } else {
    if (!cell) cell = std::make_unique<KelvasiCell>(ui_, tableView, style, cellIdentifier);
    showLeaf(*cell, child);
  }
  return cell;
}

void KelvasiPaneController::tableViewDidSelectRowAtIndexPath(TableView& tableView,
                                                             const std::optional<IndexPath>& indexPath) {
  if (!indexPath) return;
  if (!childAt(*indexPath).childNodes()) return tableView.deselectRowAtIndexPath(*indexPath, false);
  openBranch(nodes_->childNodes()->at(indexPath->row), true);
}

bool KelvasiPaneController::openBranchNamed(std::string_view name) {
  if (!nodes_ || !nodes_->childNodes()) return false;
  const NodeList& children = *nodes_->childNodes();
  const auto child = std::ranges::find_if(
      children, [name](const NodeRef& node) { return node->childNodes() && node->displayName() == name; });
  if (child != children.end()) openBranch(*child, false);
  return child != children.end();
}

bool KelvasiPaneController::openRow(std::size_t row) {
  const NodeRef child = nodes_->childNodes()->at(row);
  if (child->childNodes()) openBranch(child, false);
  return child->childNodes() != nullptr;
}

std::string KelvasiPaneController::pathOfRow(std::size_t row) const {
  return pathByAppending(keyPath_, childAt({0, row}).displayName());
}

std::optional<std::size_t> KelvasiPaneController::rowTowards(std::string_view nodePath) const {
  if (!nodes_ || !nodes_->childNodes()) return std::nullopt;
  for (std::size_t row = 0; row < nodes_->childNodes()->size(); ++row) {
    const std::string path = pathOfRow(row);
    const bool isBefore =
        nodePath.size() > path.size() && nodePath.starts_with(path) && nodePath[path.size()] == '/';
    if (nodePath == path || isBefore) return row;
  }
  return std::nullopt;
}

void KelvasiPaneController::openBranch(const NodeRef& child, bool animated) {
  auto pane = std::make_unique<KelvasiPaneController>(ui_, shell_, child,
                                                      pathByAppending(keyPath_, child->displayName()));
  pane->setStatus(status_, isLoading_);
  navigationController()->pushViewController(std::move(pane), animated);
}

}  // namespace kelvasi
