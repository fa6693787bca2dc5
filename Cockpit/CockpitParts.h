// SPDX-License-Identifier: Apache-2.0
// What a cockpit is made of. For its own sources.
#pragma once

#include "Cockpit/Cells/CellOrder.h"
#include "Cockpit/Cockpit.h"
#include "Cockpit/Events/AlarmBook.h"
#include "Cockpit/Events/CoverageBook.h"
#include "Cockpit/Events/Marks.h"
#include "Cockpit/Link/LinkWatch.h"
#include "Cockpit/Serving/SideNotes.h"
#include "Cockpit/View.h"

namespace kelvasi::cockpit {

struct Cockpit::Parts {
  explicit Parts(CockpitSetUp chosen);

  View view() const {
    return {survey, rows, rowSeries, notes, setUp.thresholds, setUp.operators, setUp.style};
  }
  // Adds the row's value to its series, where no cell's series follows it.
  void keep(const BookedRow& row, Arrival time);
  std::vector<survey::AlarmRule> rules() const;

  CockpitSetUp setUp;
  std::uint64_t eventsSeen = 0;
  AlarmBook alarms;
  survey::Survey survey;
  survey::SeriesStore rowSeries;
  RowBook rows;
  SideNotes notes;
  LinkWatch link;
  CoverageBook coverage;
  CellOrder order;
  Pins pins;
  Marks marks;

 private:
  survey::SurveySetUp surveySetUp();
};

}  // namespace kelvasi::cockpit
