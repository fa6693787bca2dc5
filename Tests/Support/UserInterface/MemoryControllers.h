// SPDX-License-Identifier: Apache-2.0
// The toolkit's halves of controllers, the navigation stack and the window, in memory.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "Platform/UserInterface/InterfaceBody.h"
#include "Platform/UserInterface/NavigationStack.h"
#include "Platform/UserInterface/Window.h"
#include "Tests/Support/UserInterface/MemoryTable.h"

namespace kelvasi::test {

using Journal = std::vector<std::string>;

template <typename Interface>
class MemoryControllerBody : public Interface {
 public:
  MemoryView<View>& view() override { return view_; }
  void setTitle(std::string_view itsTitle) override { title = itsTitle; }
  void setToolbarItems(ToolbarItems itsItems, bool animated) override {
    items = std::move(itsItems);
    itemsAnimated = animated;
    statuses.push_back(label().text);
  }
  void resignFirstResponder() override { ++resignations; }

  const ActivitySpinner& spinner() const { return std::get<ActivitySpinner>(items.at(0)); }
  const ToolbarLabel& label() const { return std::get<ToolbarLabel>(items.at(1)); }
  bool hasSaveButton() const { return std::holds_alternative<SaveButton>(items.back()); }
  void pressSave() const { std::get<SaveButton>(items.back()).action(); }

  std::string title;
  ToolbarItems items;
  bool itemsAnimated = false;
  std::vector<std::string> statuses;  // of every toolbar that was set
  int resignations = 0;

 private:
  MemoryView<View> view_;
};

class MemoryTableBody : public MemoryControllerBody<TableControllerBody> {
 public:
  MemoryTable& tableView() override { return table_; }

 private:
  MemoryTable table_;
};

// Has the parts of the save view, whatever its name.
class MemoryInterface : public MemoryControllerBody<InterfaceBody> {
 public:
  TableView* tableView(std::string_view name) override {
    return name == "saveContentTable" ? &table : nullptr;
  }
  TextField* textField(std::string_view name) override {
    return name == "saveDescription" ? &field : nullptr;
  }
  void setAction(std::string_view name, std::function<void()> action) override {
    actions[std::string(name)] = std::move(action);
  }
  void use(const std::string& action) const { actions.at(action)(); }

  MemoryTable table;
  MemoryTextField field;
  std::map<std::string, std::function<void()>> actions;
};

class MemoryStack : public NavigationStack {
 public:
  MemoryStack(std::unique_ptr<ViewController> root, Journal& journal)
      : NavigationStack(std::move(root)), journal_(journal) {}

  void setToolbarHidden(bool hidden, bool) override { isToolbarHidden = hidden; }
  MemoryView<View>& view() override { return view_; }

  bool isToolbarHidden = true;

 private:
  void showTop(Change change, bool animated) override {
    const char* const what = change == Change::none ? "show" : change == Change::pushed ? "push" : "pop";
    note(std::string(what) + " " + topViewController().title(), animated);
  }
  void showModal(ViewController&, bool animated) override { note("present", animated); }
  void hideModal(ViewController&, bool animated) override { note("dismiss", animated); }
  void note(const std::string& what, bool animated) {
    journal_.push_back(what + (animated ? " (animated)" : ""));
  }

  Journal& journal_;
  MemoryView<View> view_;
};

class MemoryWindow : public MemoryContainer<Window> {
 public:
  explicit MemoryWindow(Journal& journal) : journal_(journal) {}
  ~MemoryWindow() override { journal_.push_back("window destroyed"); }

  void addSubview(View& view) override {
    journal_.push_back("window gets a subview");
    MemoryContainer::addSubview(view);
  }
  void setRootViewController(NavigationStack& stack) override {
    journal_.push_back("window gets its root");
    root = &stack;
  }
  void makeKeyAndVisible() override {
    journal_.push_back("window visible");
    isVisible = true;
    if (root) root->willAppear();
  }
  void orderOut() override {
    journal_.push_back("window hidden");
    isVisible = false;
  }

  NavigationStack* root = nullptr;
  bool isVisible = false;

 private:
  Journal& journal_;
};

}  // namespace kelvasi::test
