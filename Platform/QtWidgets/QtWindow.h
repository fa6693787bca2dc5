// SPDX-License-Identifier: Apache-2.0
// The viewer's window.
#pragma once

#include <memory>
#include <vector>

#include "Platform/QtWidgets/TopWidget.h"
#include "Platform/QtWidgets/WidgetView.h"
#include "Platform/UserInterface/Window.h"

namespace kelvasi {

class QtWindow : public Window, public HasWidget {
 public:
  QtWindow(const Rect& frame, bool fullScreen);
  ~QtWindow() override;

  void setFrame(const Rect& frame) override { widget_->resize(wholePoints(frame).size()); }
  Rect bounds() const override;
  // A subview always takes the whole window.
  void addSubview(View& view) override;
  void setRootViewController(NavigationStack& stack) override { root_ = &stack; }
  void makeKeyAndVisible() override;
  void orderOut() override { widget_->hide(); }
  TopWidget& widget() override { return *widget_; }

 private:
  std::unique_ptr<TopWidget> widget_;
  NavigationStack* root_ = nullptr;
  bool isFullScreen_;
};

}  // namespace kelvasi
