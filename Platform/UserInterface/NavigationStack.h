// SPDX-License-Identifier: Apache-2.0
// A stack of screenfuls of which the top one is seen, and the one view that may lie over it. The order of the
// notices is the same for every toolkit; a toolkit only draws the changes.
#pragma once

#include <memory>
#include <vector>

#include "Platform/UserInterface/ViewController.h"

namespace kelvasi {

class NavigationStackDelegate {
 public:
  // Before a controller is shown, the root at the stack's own first showing included.
  virtual void navigationControllerWillShowViewControllerAnimated(NavigationStack& navigationController,
                                                                  ViewController& viewController,
                                                                  bool animated) = 0;

 protected:
  ~NavigationStackDelegate() = default;
};

class NavigationStack {
 public:
  using Controllers = std::vector<std::unique_ptr<ViewController>>;

  virtual ~NavigationStack() = default;
  NavigationStack(const NavigationStack&) = delete;
  NavigationStack& operator=(const NavigationStack&) = delete;

  // Root first; never empty.
  const Controllers& viewControllers() const { return controllers_; }
  ViewController& topViewController() const { return *controllers_.back(); }
  // Null for none; the delegate outlives the stack or takes itself off.
  void setDelegate(NavigationStackDelegate* delegate) { delegate_ = delegate; }

  void pushViewController(std::unique_ptr<ViewController> controller, bool animated);
  // Destroys every controller above `controller`, which is one of the stack's.
  void popToViewController(ViewController& controller, bool animated);
  // What the back button does: nothing at the root.
  void popViewController(bool animated);

  // Lays a controller over the stack; at most one at a time, which outlives its dismissal.
  void presentModalViewController(ViewController& controller, bool animated);
  void dismissModalViewController(bool animated);
  ViewController* modalViewController() const { return modal_; }

  // The stack is about to be seen for the first time: the window says so.
  void willAppear();

  virtual void setToolbarHidden(bool hidden, bool animated) = 0;
  virtual View& view() = 0;

 protected:
  enum class Change { none, pushed, popped };

  explicit NavigationStack(std::unique_ptr<ViewController> root);

  // Draws the top controller instead of the one that was on top, which is alive during the call.
  virtual void showTop(Change change, bool animated) = 0;
  // Draws a controller over the stack, or takes it away.
  virtual void showModal(ViewController& controller, bool animated) = 0;
  virtual void hideModal(ViewController& controller, bool animated) = 0;

 private:
  void prepareTop(bool animated);

  Controllers controllers_;
  NavigationStackDelegate* delegate_ = nullptr;
  ViewController* modal_ = nullptr;
};

}  // namespace kelvasi
