// SPDX-License-Identifier: Apache-2.0
// Surveys captures or a live link for the verbs that tell what was in them.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "Survey/Survey.h"
#include "Tools/Kelvasictl/InputOptions.h"
#include "Tools/Kelvasictl/RecordOutput.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

struct SurveyOptions : InputOptions {
  FormatOption format;

  void addTo(OptionSet verb);
  Option addJobsTo(OptionSet verb);
};

// One capture, or a live link as long as its technology is the same. It lasts for a call.
struct Surveyed {
  std::string technology;  // its short name
  const LogGenerator& generator;
  const survey::Survey& survey;
};

survey::SurveySetUp withoutSeries();

// What a verb does with a survey. With several jobs setUp and what it sets up are called in threads, each
// capture in one.
struct SurveyUse {
  using Print = RecordOutput::Print;

  // Sets up the survey of a capture. Unless told otherwise it gathers no series. What is printed while it
  // goes on comes in the order of the captures.
  std::function<survey::SurveySetUp(const std::string& technology, Print print)> setUp =
      [](const std::string&, const Print&) { return withoutSeries(); };
  // After each capture, in their order, in the caller's thread.
  std::function<void(const Surveyed& surveyed)> take;
  bool printsMeanwhile = false;
  // Now and then while a live link is surveyed.
  std::function<void()> tick = [] {};
};

// Returns the exit status: that of a fault when something could not be read. Throws ToolError.
int runSurvey(const SurveyOptions& options, const SurveyUse& use);

// A verb that has the options of a survey and no others.
Action declareSurvey(OptionSet verb, const std::string& footer,
                     int (*run)(const SurveyOptions& options, MessageTally& tally));

}  // namespace kelvasi
