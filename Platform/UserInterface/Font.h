// SPDX-License-Identifier: Apache-2.0
// A font as the application names it.
#pragma once

#include <string>

namespace kelvasi {

struct Font {
  std::string family;  // empty for the system's font
  double size = 0;     // in points, that is logical pixels
  bool isBold = false;
  bool operator==(const Font&) const = default;

  static Font system(double size) { return {.family = {}, .size = size, .isBold = false}; }
  static Font boldSystem(double size) { return {.family = {}, .size = size, .isBold = true}; }
};

}  // namespace kelvasi
