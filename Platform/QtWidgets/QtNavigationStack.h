// SPDX-License-Identifier: Apache-2.0
// The stack of panes with the bars above and below it, and the view that may lie over it.
#pragma once

#include <QString>
#include <memory>
#include <optional>

#include "Platform/QtWidgets/WidgetView.h"
#include "Platform/UserInterface/NavigationStack.h"

namespace kelvasi {

class Layer;
class NavigationBar;
class Page;
class StackWidget;

class QtNavigationStack : public NavigationStack {
 public:
  QtNavigationStack(std::unique_ptr<ViewController> root, bool animates);
  ~QtNavigationStack() override;

  void setToolbarHidden(bool hidden, bool animated) override;
  View& view() override { return view_; }

 private:
  void showTop(Change change, bool animated) override;
  void showModal(ViewController& controller, bool animated) override;
  void hideModal(ViewController& controller, bool animated) override;
  void swapPage(Change change);
  void showBars();
  // The title of the pane below, which may be empty; none at the root.
  std::optional<QString> backTitle() const;

  bool animates_;
  std::unique_ptr<StackWidget> widget_;
  WidgetView view_;
  Page* shown_ = nullptr;
  std::unique_ptr<Layer> modalLayer_;
};

}  // namespace kelvasi
