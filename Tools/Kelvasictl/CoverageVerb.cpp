// SPDX-License-Identifier: Apache-2.0
// kelvasictl coverage: what became of the messages of captures or of a live link.
#include "Tools/Kelvasictl/CoverageRecords.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/SurveyRun.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

constexpr auto footer =
    R"(A record for each log code and each way in which its messages ended, the most frequent first: shown, not asked for
(no decoder wants the code; "nearest" is the known code beside it), too short, not understood, section missing (from
the template), unknown log type, not a record, property list refused. With it come first and last arrival, the last
length and the last version byte, where the record has one, and the first bytes of the first such message.)";

int run(const SurveyOptions& options, MessageTally& tally) {
  Coverage coverage;
  const auto take = [&](const Surveyed& surveyed) {
    const Intake& intake = surveyed.generator.intake();
    coverage.add(surveyed.technology, intake, logCodesAsked(surveyed.generator));
    tally.add(intake);
  };
  const int status = runSurvey(options, {.take = take});
  RecordOutput output(options.format.format(), coverageColumns(), printOut);
  output.begin();
  for (const Json& record : coverage.records()) output.print(record);
  return status;
}

}  // namespace

Action declareCoverage(OptionSet verb) {
  return declareSurvey(verb, footer, run);
}

}  // namespace kelvasi
