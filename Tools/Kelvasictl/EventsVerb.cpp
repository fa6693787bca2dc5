// SPDX-License-Identifier: Apache-2.0
// kelvasictl events: what happened in captures or on a live link.
#include "Tools/Kelvasictl/EventRecords.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/SurveyRun.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

constexpr auto footer =
    R"(Events: cell_change and rat_change with from and to; state_change of MM, GMM, RR, RRC, registration, 1x and EV-DO;
reject with its cause; service_lost and service_back, by the kind of service that the records say, or where they say
none, by 15 s without a word of a serving cell; link_lost and link_back, by 15 s without a message; unknown_record,
for each log code that no decoder understands, when it is first seen. What is no change has its reason: of a reject
the cause, of an unknown record, whose code is in "to", what became of it.)";

int run(const SurveyOptions& options, MessageTally& tally) {
  const RecordOutput::Format format = options.format.format();
  RecordOutput(format, eventColumns(), printOut).begin();
  const auto setUp = [&](const std::string& technology, const SurveyUse::Print& print) {
    survey::SurveySetUp result = withoutSeries();
    result.events = 0;
    result.onEvent = [technology, output = RecordOutput(format, eventColumns(), print)](
                         const survey::Event& event) mutable {
      output.print(eventRecord(event, technology));
    };
    return result;
  };
  const auto take = [&](const Surveyed& surveyed) { tally.add(surveyed.generator.intake()); };
  return runSurvey(options, {.setUp = setUp, .take = take, .printsMeanwhile = true});
}

}  // namespace

Action declareEvents(OptionSet verb) {
  return declareSurvey(verb, footer, run);
}

}  // namespace kelvasi
