// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Scroll.h"

namespace kelvasi::top {

namespace {

std::size_t less(std::size_t number, std::size_t by) {
  return number > by ? number - by : 0;
}

}  // namespace

bool Scroll::take(const terminal::Key& key, std::size_t count, std::size_t room) {
  using Kind = terminal::Key::Kind;
  const std::size_t page = std::max<std::size_t>(room, 2) - 1;
  constexpr std::size_t turn = 3;
  switch (key.kind) {
    case Kind::up:
      selected = less(selected, 1);
      break;
    case Kind::down:
      selected += 1;
      break;
    case Kind::pageUp:
      selected = less(selected, page);
      break;
    case Kind::pageDown:
      selected += page;
      break;
    case Kind::wheelUp:
      selected = less(selected, turn);
      break;
    case Kind::wheelDown:
      selected += turn;
      break;
    case Kind::home:
      selected = 0;
      break;
    case Kind::end:
      selected = less(count, 1);
      break;
    default:
      return false;
  }
  fit(count, room);
  return true;
}

std::string Scroll::words(std::size_t count, std::size_t room) const {
  if (count <= room || room == 0) return {};
  return std::to_string(first + 1) + "-" + std::to_string(std::min(first + room, count)) + " of " +
         std::to_string(count);
}

}  // namespace kelvasi::top
