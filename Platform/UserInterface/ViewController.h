// SPDX-License-Identifier: Apache-2.0
// The base of the application's screens: a toolkit's half, and notices that a subclass may take.
#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "Platform/UserInterface/TableView.h"
#include "Platform/UserInterface/ToolbarItem.h"

namespace kelvasi {

class NavigationStack;

// The toolkit's half of a view controller.
class ControllerBody {
 public:
  virtual ~ControllerBody() = default;

  virtual View& view() = 0;
  virtual void setTitle(std::string_view title) = 0;
  virtual void setToolbarItems(ToolbarItems items, bool animated) = 0;
  // Gives up the keyboard, whichever part of the screenful has it.
  virtual void resignFirstResponder() = 0;
};

class ViewController {
 public:
  explicit ViewController(std::unique_ptr<ControllerBody> body);
  virtual ~ViewController() = default;
  ViewController(const ViewController&) = delete;
  ViewController& operator=(const ViewController&) = delete;

  // Notices, from the navigation stack. The base versions do nothing.
  virtual void viewDidLoad() {}
  virtual void viewWillAppear(bool /*animated*/) {}
  virtual void viewWillDisappear(bool /*animated*/) {}
  virtual void viewDidUnload() {}
  virtual void didReceiveMemoryWarning() {}

  // Null while the controller is in no stack. Set by the stack.
  NavigationStack* navigationController() const { return navigationController_; }
  void setNavigationController(NavigationStack* stack) { navigationController_ = stack; }

  // viewDidLoad(), once.
  void loadViewIfNeeded();

  const std::string& title() const { return title_; }
  void setTitle(std::string_view title);
  void setToolbarItems(ToolbarItems items, bool animated) {
    body_->setToolbarItems(std::move(items), animated);
  }
  void resignFirstResponder() { body_->resignFirstResponder(); }
  View& view() const { return body_->view(); }
  ControllerBody& body() const { return *body_; }

 private:
  std::unique_ptr<ControllerBody> body_;
  std::string title_;
  NavigationStack* navigationController_ = nullptr;
  bool isLoaded_ = false;
};

class TableControllerBody : public ControllerBody {
 public:
  virtual TableView& tableView() = 0;
};

// A screenful that is one table, which it fills itself.
class TableViewController : public ViewController, protected TableViewDataSource {
 public:
  explicit TableViewController(std::unique_ptr<TableControllerBody> body);
  ~TableViewController() override;

  // Takes the mark off the row that was opened.
  void viewWillAppear(bool animated) override;

  TableView& tableView() const { return tableView_; }

 private:
  TableView& tableView_;  // lives in the body
};

}  // namespace kelvasi
