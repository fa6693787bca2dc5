// SPDX-License-Identifier: Apache-2.0
// The one window, and the screen it fills.
#pragma once

#include "Platform/UserInterface/Geometry.h"
#include "Platform/UserInterface/View.h"

namespace kelvasi {

class NavigationStack;

class Screen {
 public:
  virtual ~Screen() = default;
  virtual Rect bounds() const = 0;
  // The bounds less the status bar.
  virtual Rect applicationFrame() const = 0;
};

// Destroying a window closes it; its stack and subviews live on unseen.
class Window : public Container {
 public:
  // The stack that the window tells of its appearance. Does not own it.
  virtual void setRootViewController(NavigationStack& stack) = 0;
  virtual void makeKeyAndVisible() = 0;
  // Hides the window.
  virtual void orderOut() = 0;
};

}  // namespace kelvasi
