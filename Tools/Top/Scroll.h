// SPDX-License-Identifier: Apache-2.0
// Where a list longer than its room stands.
#pragma once

#include <algorithm>
#include <cstddef>
#include <string>

#include "Platform/Terminal/Key.h"

namespace kelvasi::top {

struct Scroll {
  std::size_t selected = 0;
  std::size_t first = 0;  // of the rows that are seen

  // Keeps the selection within `count`, and it within sight of `room` rows.
  void fit(std::size_t count, std::size_t room) {
    selected = count == 0 ? 0 : std::min(selected, count - 1);
    first = std::min(first, count > room ? count - room : 0);
    if (selected < first) first = selected;
    if (room > 0 && selected >= first + room) first = selected + 1 - room;
  }
  // Whether the key was one that moves.
  bool take(const terminal::Key& key, std::size_t count, std::size_t room);
  // "5-12 of 31"; empty where all is in sight.
  std::string words(std::size_t count, std::size_t room) const;
};

}  // namespace kelvasi::top
