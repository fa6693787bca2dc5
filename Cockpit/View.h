// SPDX-License-Identifier: Apache-2.0
// What is looked at, and how texts are made of it. For the cockpit's own parts.
#pragma once

#include "Cockpit/Levels/Thresholds.h"
#include "Cockpit/Rows/RowBook.h"
#include "Cockpit/Serving/SideNotes.h"
#include "Cockpit/Words/TextStyle.h"
#include "Radio/Operators.h"
#include "Survey/Survey.h"

namespace kelvasi::cockpit {

struct View {
  const survey::Survey& survey;
  const RowBook& rows;
  const survey::SeriesStore&
      rowSeries;  // of rows that are of no cell, the row's id in place of a cell's number
  const SideNotes& notes;
  const Thresholds& thresholds;
  const Operators& operators;
  const TextStyle& style;
};

}  // namespace kelvasi::cockpit
