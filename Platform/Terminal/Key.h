// SPDX-License-Identifier: Apache-2.0
// What a user does at a terminal.
#pragma once

#include <cstdint>

#include "Platform/Terminal/Grid.h"

namespace kelvasi::terminal {

struct Key {
  enum class Kind : std::uint8_t {
    character,
    up,
    down,
    left,
    right,
    pageUp,
    pageDown,
    home,
    end,
    enter,
    escape,
    backspace,
    remove,
    tab,
    backTab,
    redraw,  // Ctrl+L
    press,   // of the mouse's first button
    wheelUp,
    wheelDown,
  };

  Kind kind = Kind::character;
  char32_t character = 0;
  Place place = {};  // of the mouse

  bool is(char32_t wanted) const { return kind == Kind::character && character == wanted; }
};

}  // namespace kelvasi::terminal
