// SPDX-License-Identifier: Apache-2.0
// Points and rectangles of the screen, in points (logical pixels); y grows downwards.
#pragma once

namespace kelvasi {

struct Size {
  double width = 0;
  double height = 0;
  bool operator==(const Size&) const = default;
};

struct Rect {
  double x = 0;
  double y = 0;
  double width = 0;
  double height = 0;
  bool operator==(const Rect&) const = default;
};

}  // namespace kelvasi
