// SPDX-License-Identifier: Apache-2.0
// Gathers what a report shows from the surveys of a drive's captures.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "Radio/Operators.h"
#include "Report/Report.h"
#include "Survey/Survey.h"
#include "Tools/Kelvasictl/CoverageRecords.h"
#include "Tools/Kelvasictl/SurveyRun.h"

namespace kelvasi {

class DriveReport {
 public:
  // To be given to runSurvey(); this outlives it.
  SurveyUse use();

  report::Report report(const std::vector<std::string>& captures, const Operators& operators) const;

 private:
  using Pick = std::vector<std::string> (*)(const survey::Event& event);

  void take(const Surveyed& surveyed);
  void addSummary(report::Report& page, const std::vector<std::string>& captures) const;
  void addLevels(report::Report& page) const;
  report::Chart chartOf(const Quantity& quantity) const;
  report::Histogram histogramOf(const Quantity& quantity) const;
  report::Table cellTable(const Operators& operators) const;
  report::Table eventTable(survey::EventKind kind, report::Table table, Pick pick) const;
  report::Table gapTable(survey::EventKind begin, survey::EventKind end, report::Table table) const;
  report::Table coverageTable() const;
  bool serves(const survey::SeenCell& cell, double time) const;

  survey::Survey whole_;
  std::vector<survey::Event> events_;
  Coverage coverage_;
  std::vector<std::string> technologies_;
  std::uint64_t messages_ = 0;
  std::uint64_t shown_ = 0;
  Arrival first_ = Arrival::max();
  Arrival last_{0};
};

}  // namespace kelvasi
