// SPDX-License-Identifier: Apache-2.0
// The viewer's colours, as palettes: every widget takes them from its own palette.
//   Base             rows                  AlternateBase  a row that is pressed or selected
//   Window           bars                  Light          the ground behind cards
//   Text, WindowText texts                 PlaceholderText  texts of less weight
//   Mid              hairlines             Dark           chevrons
//   Highlight        what can be pressed
#pragma once

#include <QPalette>

namespace kelvasi {

enum class ColourScheme { light, dark };

QPalette paletteOf(ColourScheme scheme);

}  // namespace kelvasi
