// SPDX-License-Identifier: Apache-2.0
// A toolkit without a display, for tests of the application: it records what it was told.
#pragma once

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "Platform/UserInterface/UserInterface.h"
#include "Tests/Support/UserInterface/MemoryControllers.h"

namespace kelvasi::test {

class MemoryUserInterface : public UserInterface {
 public:
  struct Alert {
    std::string title, message, button;
    bool operator==(const Alert&) const = default;
  };
  struct MemoryScreen : Screen {
    Rect bounds() const override { return whole; }
    Rect applicationFrame() const override { return {0, 20, whole.width, whole.height - 20}; }
    Rect whole{0, 0, 320, 480};
  };

  const Screen& mainScreen() const override { return screen; }
  // As the test set it for the text; else 8 points a character, 9 in bold, and 18 high.
  Size sizeOfText(std::string_view text, const Font& font) const override {
    const auto set = sizes.find({std::string(text), font.isBold});
    if (set != sizes.end()) return set->second;
    return {static_cast<double>(text.size()) * (font.isBold ? 9 : 8), 18};
  }

  std::unique_ptr<Window> makeWindow(const Rect& frame) override {
    auto made = std::make_unique<MemoryWindow>(journal);
    made->setFrame(frame);
    window = made.get();
    return made;
  }
  std::unique_ptr<NavigationStack> makeNavigationStack(std::unique_ptr<ViewController> root) override {
    auto made = std::make_unique<MemoryStack>(std::move(root), journal);
    stack = made.get();
    return made;
  }
  std::unique_ptr<TableControllerBody> makeTableControllerBody() override {
    return std::make_unique<MemoryTableBody>();
  }
  std::unique_ptr<InterfaceBody> loadInterface(std::string_view name) override {
    if (name != resource) return nullptr;
    auto made = std::make_unique<MemoryInterface>();
    interface = made.get();
    return made;
  }
  std::unique_ptr<Label> makeLabel() override { return std::make_unique<MemoryLabel>(); }
  std::unique_ptr<ScrollView> makeScrollView() override { return std::make_unique<MemoryScrollView>(); }
  void showAlert(std::string_view title, std::string_view message, std::string_view button) override {
    alerts.push_back({std::string(title), std::string(message), std::string(button)});
  }
  void showFileNotice(std::string_view message, std::string_view path) override {
    notices.push_back({std::string(message), std::string(path)});
  }

  // The toolkit's half of the pane at a place of the stack, and of the top one.
  MemoryTableBody& pane(std::size_t place) const {
    return static_cast<MemoryTableBody&>(stack->viewControllers().at(place)->body());
  }
  MemoryTableBody& topPane() const { return pane(stack->viewControllers().size() - 1); }

  MemoryScreen screen;
  std::map<std::pair<std::string, bool>, Size> sizes;  // of a text, bold or not
  std::string resource = "KelvasiSaveViewController";
  std::vector<Alert> alerts;
  std::vector<std::pair<std::string, std::string>> notices;  // message and path
  Journal journal;

  // The newest of each.
  MemoryWindow* window = nullptr;
  MemoryStack* stack = nullptr;
  MemoryInterface* interface = nullptr;
};

}  // namespace kelvasi::test
