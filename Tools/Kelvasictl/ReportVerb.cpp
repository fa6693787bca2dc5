// SPDX-License-Identifier: Apache-2.0
// kelvasictl report: a drive on one page.
#include <memory>

#include "Platform/Posix/Files.h"
#include "Tools/Kelvasictl/DriveReport.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"
#include "Tools/OperatorFile.h"

namespace kelvasi {

namespace {

constexpr auto footer =
    R"(One HTML file without anything from elsewhere, for any browser and for paper: summary, levels over time of the eight
cells that were heard most, how often which levels of the serving cell were, cells, cell changes, rejects, times
without service or messages, and coverage of decoding. It names cells; redact the captures first to hand it over.)";

struct ReportOptions : SurveyOptions {
  std::string output;
};

int run(const ReportOptions& options, MessageTally& tally) {
  DriveReport drive;
  SurveyUse use = drive.use();
  use.take = [&tally, take = use.take](const Surveyed& surveyed) {
    take(surveyed);
    tally.add(surveyed.generator.intake());
  };
  const int status = runSurvey(options, use);
  const LoadedOperators names = loadOperators();
  for (const std::string& line : names.complaints) complain(line);
  const std::string html = report::htmlOf(drive.report(options.captures, names.operators));
  if (options.output == "-") {
    printOut(html);
  } else if (const FileError error = replaceFile(options.output, Bytes(html.begin(), html.end()))) {
    throw ToolError(*error);
  }
  return status;
}

}  // namespace

Action declareReport(OptionSet verb) {
  const auto options = std::make_shared<ReportOptions>();
  options->InputOptions::addTo(verb, "All of them are one drive");
  verb.add("-o,--output", options->output, "the HTML file; - is the standard output").type("FILE").required();
  verb.setFooter(footer);
  return [options](MessageTally& tally) { return run(*options, tally); };
}

}  // namespace kelvasi
