// SPDX-License-Identifier: Apache-2.0
// Where on a screen everything stands, by the room that there is.
//   up to 99 columns     cockpit, cells, events and panes below each other
//   from 100             panes on the left, the rest on the right
//   from 160             panes, cockpit, and chart and events beside each other
#pragma once

#include "Tools/Top/TextLine.h"

namespace kelvasi::top {

// How many rows each part would fill, were there room.
struct Wishes {
  int head = 2;
  int levels = 3;
  int second = 0;  // the other air interface's
  int alarms = 0;
  int pins = 0;
  int cells = 1;
  int carriers = 0;
  int events = 1;
  int panes = 1;
  int timeline = 0;
};

// Areas of no rows are not shown. Titles stand in a row above their area: `hasTitle` parts are one row
// higher.
struct Layout {
  Area head;
  Area alarms;
  Area levels;
  Area second;
  Area pins;
  Area cells;
  Area carriers;
  Area events;
  Area chart;
  Area panes;
  Area timeline;
  Area foot;          // one row
  Area body;          // all between head and foot, for pages
  int divider = -1;   // a column between panes and the rest; -1: none
  int divider2 = -1;  // and between that and charts
};

inline constexpr int twoColumns = 100;
inline constexpr int threeColumns = 160;

Layout layOut(terminal::Size size, const Wishes& wishes);

}  // namespace kelvasi::top
