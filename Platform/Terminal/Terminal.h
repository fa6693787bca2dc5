// SPDX-License-Identifier: Apache-2.0
// A terminal that shows a grid and tells keys.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "Platform/Terminal/Grid.h"
#include "Platform/Terminal/Key.h"

namespace kelvasi::terminal {

class Terminal {
 public:
  virtual ~Terminal() = default;

  virtual Size size() const = 0;
  virtual CharacterSet characters() const = 0;
  // Whether colours can tell things apart.
  virtual bool hasColours() const = 0;
  // Sends what is different from what it shows. The cursor stands at `cursor`, or is not seen.
  virtual void show(const Grid& grid, std::optional<Place> cursor) = 0;
  // The next key that waits; nothing when none does.
  virtual std::optional<Key> next() = 0;
  // False once the terminal has gone away.
  virtual bool isThere() const = 0;
  // Sends everything anew, at the next show().
  virtual void redraw() = 0;
  // Asks the terminal to put a text into its clipboard (OSC 52). False for more than `mostCopied` bytes.
  static constexpr std::size_t mostCopied = 50'000;
  virtual bool copy(std::string_view text) = 0;
};

}  // namespace kelvasi::terminal
