// SPDX-License-Identifier: Apache-2.0
// What stands in a toolbar, left to right.
#pragma once

#include <functional>
#include <string>
#include <variant>
#include <vector>

#include "Platform/UserInterface/Font.h"
#include "Platform/UserInterface/Geometry.h"

namespace kelvasi {

// The small grey spinner.
struct ActivitySpinner {
  bool isAnimating = false;
  bool hidesWhenStopped = true;
};

// A text in the platform's dark text colour on a clear background.
struct ToolbarLabel {
  std::string text;
  Font font;
  Size size;
};

struct FlexibleSpace {};

// The platform's standard Save button.
struct SaveButton {
  std::function<void()> action;
};

using ToolbarItem = std::variant<ActivitySpinner, ToolbarLabel, FlexibleSpace, SaveButton>;
using ToolbarItems = std::vector<ToolbarItem>;

}  // namespace kelvasi
