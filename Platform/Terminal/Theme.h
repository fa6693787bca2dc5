// SPDX-License-Identifier: Apache-2.0
// The colours of a terminal by role, and what becomes of them where it has fewer.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "Platform/Terminal/Grid.h"

namespace kelvasi::terminal {

// 0xRRGGBB; nothing: the terminal's own.
using Colour = std::optional<std::uint32_t>;

struct Theme {
  std::array<Colour, roles> colours;
  Colour ground;  // behind everything

  const Colour& of(Role role) const { return colours[static_cast<std::size_t>(role)]; }

  // A line of a theme file, "good #3FB5A3" or "text default"; what stands behind " #" or a line that begins
  // with "#" is a remark. Returns what is wrong with it, and changes nothing then; empty when it was taken.
  std::string change(std::string_view line);
};

// For terminals with a dark and with a light ground. Texts reach a contrast of 4.5 to 1 on black and on
// white.
const Theme& darkTheme();
const Theme& lightTheme();

// The nearest of the 256 colours of xterm's cube and greys, 16 to 255.
int nearestOf256(std::uint32_t colour);
// One of the eight colours of ECMA-48 that says the same; -1 for the terminal's own.
int nearestOf8(Role role);

}  // namespace kelvasi::terminal
