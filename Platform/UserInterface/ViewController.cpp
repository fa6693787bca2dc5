// SPDX-License-Identifier: Apache-2.0
#include "Platform/UserInterface/ViewController.h"

#include <utility>

namespace kelvasi {

std::size_t TableViewDataSource::numberOfSectionsInTableView(TableView&) {
  return 1;
}

ViewController::ViewController(std::unique_ptr<ControllerBody> body) : body_(std::move(body)) {}

void ViewController::loadViewIfNeeded() {
  if (!std::exchange(isLoaded_, true)) viewDidLoad();
}

void ViewController::setTitle(std::string_view title) {
  title_ = title;
  body_->setTitle(title);
}

TableViewController::TableViewController(std::unique_ptr<TableControllerBody> body)
    : ViewController(std::move(body)),
      tableView_(static_cast<TableControllerBody&>(ViewController::body()).tableView()) {
  tableView_.setDataSource(this);
}

TableViewController::~TableViewController() {
  tableView_.setDataSource(nullptr);
}

void TableViewController::viewWillAppear(bool animated) {
  if (const auto selected = tableView_.indexPathForSelectedRow())
    tableView_.deselectRowAtIndexPath(*selected, animated);
}

}  // namespace kelvasi
