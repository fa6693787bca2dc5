// SPDX-License-Identifier: Apache-2.0
// What can be placed on the screen, and what can hold it.
#pragma once

#include "Platform/UserInterface/Geometry.h"

namespace kelvasi {

// Destroying a view takes it out of its container.
class View {
 public:
  View() = default;
  virtual ~View() = default;
  View(const View&) = delete;
  View& operator=(const View&) = delete;

  // Where the view stands in its container.
  virtual void setFrame(const Rect& frame) = 0;
  // The view's own area, in the coordinates in which its subviews stand.
  virtual Rect bounds() const = 0;
};

class Container : public View {
 public:
  // Shows `view` inside this one. Does not own it.
  virtual void addSubview(View& view) = 0;
};

// Scrolls sideways when its content is wider than its frame.
class ScrollView : public Container {
 public:
  virtual void setContentSize(Size size) = 0;
};

}  // namespace kelvasi
