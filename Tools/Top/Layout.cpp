// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Layout.h"

#include <algorithm>
#include <array>

namespace kelvasi::top {

namespace {

// A part of a column: its rows at first, those it would have, and whether it has a title.
struct Part {
  Area* area;
  int least;
  int most;
  bool hasTitle;
};

int titleRows(const Part& part) {
  return part.hasTitle ? 1 : 0;
}

// Gives each part in the order of `order` its least, where that fits, then in turn what it would have.
template <std::size_t count>
void stack(const std::array<Part, count>& parts, const std::array<std::size_t, count>& order, Area room) {
  std::array<int, count> rows{};
  int left = room.rows;
  for (const std::size_t at : order) {
    const Part& part = parts[at];
    const int wanted = std::min(part.least, part.most);
    const int given = std::min(wanted, left - titleRows(part));
    if (wanted <= 0 || given <= 0) continue;
    rows[at] = given;
    left -= given + titleRows(part);
  }
  for (const std::size_t at : order) {
    const int more = rows[at] > 0 ? std::clamp(parts[at].most - rows[at], 0, left) : 0;
    rows[at] += more;
    left -= more;
  }
  int row = room.row;
  for (std::size_t at = 0; at < count; ++at) {
    if (rows[at] == 0) continue;
    row += titleRows(parts[at]);
    *parts[at].area = {room.column, row, room.columns, rows[at]};
    row += rows[at];
  }
}

constexpr int all = 10'000;

void layOutOne(Layout& layout, const Wishes& wishes, Area room) {
  const int leastPanes = room.rows < 20 ? 5 : 7;
  const std::array parts{
      Part{&layout.head, 2, wishes.head, false},
      Part{&layout.alarms, 1, wishes.alarms, false},
      Part{&layout.levels, 3, wishes.levels, false},
      Part{&layout.second, 2, wishes.second, true},
      Part{&layout.pins, 4, wishes.pins, true},
      Part{&layout.cells, 4, wishes.cells, true},
      Part{&layout.carriers, 0, wishes.carriers, true},
      Part{&layout.events, 2, std::min(wishes.events, 3), true},
      Part{&layout.panes, leastPanes, std::max(wishes.panes, leastPanes), true},
  };
  // From the last one needed to have a whole screen backwards: head, levels and panes are there on the
  // smallest.
  stack(parts, std::array<std::size_t, 9>{0, 2, 8, 1, 4, 5, 7, 3, 6}, room);
  if (layout.panes.rows > 0) layout.panes.rows = room.row + room.rows - layout.panes.row;
}

void layOutCockpit(Layout& layout, const Wishes& wishes, Area room, bool hasEvents) {
  const std::array parts{
      Part{&layout.head, 2, wishes.head, false},
      Part{&layout.alarms, 1, wishes.alarms, false},
      Part{&layout.levels, 4, wishes.levels, false},
      Part{&layout.second, 3, wishes.second, true},
      Part{&layout.pins, 6, wishes.pins, true},
      Part{&layout.cells, 8, wishes.cells, true},
      Part{&layout.carriers, 2, wishes.carriers, true},
      Part{&layout.events, hasEvents ? 3 : 0, hasEvents ? all : 0, true},
  };
  stack(parts, std::array<std::size_t, 8>{0, 2, 1, 4, 5, 3, 6, 7}, room);
}

}  // namespace

Layout layOut(terminal::Size size, const Wishes& wishes) {
  Layout layout;
  const int foot = size.rows > 1 ? 1 : 0;
  const int timeline = size.rows >= 12 ? wishes.timeline : 0;
  Area room{0, 0, size.columns, size.rows - foot - timeline};
  layout.foot = {0, size.rows - foot, size.columns, foot};
  layout.timeline = {0, room.rows, size.columns, timeline};
  layout.body = room;
  if (size.columns < twoColumns) {
    layOutOne(layout, wishes, room);
    return layout;
  }
  const bool isWide = size.columns >= threeColumns;
  const int paneColumns = isWide ? 50 : size.columns * 2 / 5;
  layout.panes = {0, 1, paneColumns, room.rows - 1};
  layout.divider = paneColumns + 1;
  room.column = paneColumns + 3;
  room.columns = isWide ? 62 : size.columns - room.column;
  layOutCockpit(layout, wishes, room, !isWide);
  if (!isWide) return layout;
  layout.divider2 = room.column + room.columns + 1;
  const int column = layout.divider2 + 2;
  const int columns = size.columns - column;
  const int chart = std::min(room.rows / 2, 24);
  layout.chart = {column, 1, columns, chart - 1};
  layout.events = {column, chart + 1, columns, room.rows - chart - 1};
  return layout;
}

}  // namespace kelvasi::top
