// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/SurveyRun.h"

#include "Tools/Kelvasictl/CaptureSurvey.h"
#include "Tools/Kelvasictl/LiveSurvey.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

int surveyCaptures(const SurveyOptions& options, const SurveyUse& use) {
  OfflineSurroundings surroundings(options.live.surroundings);
  std::vector<std::unique_ptr<CaptureSurvey>> surveys(options.captures.size());
  bool isWhole = true;
  const auto work = [&](std::size_t at, const CaptureOutput& output) {
    surveys[at] = std::make_unique<CaptureSurvey>(surroundings, options.captures[at], options.technology);
    surveys[at]->run(use, output);
  };
  const auto deliver = [&](std::size_t at) {
    isWhole = isWhole && !surveys[at]->hasFault();
    surveys[at]->giveTo(use);
    surveys[at].reset();
  };
  const auto progress = use.printsMeanwhile ? Progress::Output::meanwhile : Progress::Output::atTheEnd;
  workOnCaptures(options.captures, options.jobs.value_or(1), {work, deliver, progress});
  return isWhole ? exitSuccess : exitFault;
}

}  // namespace

void SurveyOptions::addTo(OptionSet verb) {
  InputOptions::addTo(verb, "Each is surveyed by itself");
  format.addTo(verb);
}

Option SurveyOptions::addJobsTo(OptionSet verb) {
  return InputOptions::addJobsTo(verb, "so many captures side by side; the output stays in their order");
}

survey::SurveySetUp withoutSeries() {
  survey::SurveySetUp result;
  result.keepsSeries = false;
  return result;
}

int runSurvey(const SurveyOptions& options, const SurveyUse& use) {
  if (!options.isLive) return surveyCaptures(options, use);
  LiveSurvey(options.live, use).run();
  return exitSuccess;
}

Action declareSurvey(OptionSet verb, const std::string& footer,
                     int (*run)(const SurveyOptions& options, MessageTally& tally)) {
  const auto options = std::make_shared<SurveyOptions>();
  options->addTo(verb);
  options->addJobsTo(verb);
  verb.setFooter(footer);
  return [options, run](MessageTally& tally) { return run(*options, tally); };
}

}  // namespace kelvasi
