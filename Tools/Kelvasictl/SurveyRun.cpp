// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/SurveyRun.h"

#include <CLI/CLI.hpp>

#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/CaptureSurvey.h"
#include "Tools/Kelvasictl/LiveSurvey.h"
#include "Tools/Kelvasictl/Progress.h"
#include "Tools/Kelvasictl/Spool.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/WorkInOrder.h"

namespace kelvasi {

namespace {

// A capture's survey and what it has to say, until it is its turn.
struct Piece {
  std::unique_ptr<CaptureSurvey> survey;
  Spool printed;
  std::vector<std::string> complaints;
};

// What several captures say at once has to wait.
SurveyOutput outputOf(Piece& piece, unsigned jobs, Progress& progress) {
  const auto advance = [&progress](std::uint64_t messages, std::uint64_t bytes) {
    progress.add(messages, bytes);
  };
  if (jobs <= 1) return {printOut, complain, advance};
  return {[&piece](std::string_view text) { piece.printed.add(text); },
          [&piece](std::string_view line) { piece.complaints.emplace_back(line); }, advance};
}

int surveyCaptures(const SurveyOptions& options, const SurveyUse& use) {
  OfflineSurroundings surroundings(options.live.surroundings);
  Progress progress(options.captures,
                    use.printsMeanwhile ? Progress::Output::meanwhile : Progress::Output::atTheEnd);
  std::vector<Piece> pieces(options.captures.size());
  bool isWhole = true;
  const auto work = [&](std::size_t at) {
    Piece& piece = pieces[at];
    piece.survey = std::make_unique<CaptureSurvey>(surroundings, options.captures[at], options.technology);
    piece.survey->run(use, outputOf(piece, options.jobs, progress));
  };
  const auto deliver = [&](std::size_t at) {
    Piece& piece = pieces[at];
    piece.printed.giveTo(printOut);
    for (const std::string& line : piece.complaints) complain(line);
    isWhole = isWhole && !piece.survey->hasFault();
    piece.survey->giveTo(use);
    piece = Piece();
  };
  workInOrder(pieces.size(), options.jobs, work, deliver);
  return isWhole ? exitSuccess : exitFault;
}

std::string readTechnology(std::string& text) {
  const auto id = technologyId(text);
  if (!id) return "there is no technology \"" + text + "\"";
  text = *id;
  return {};
}

}  // namespace

void SurveyOptions::addTo(CLI::App& verb) {
  verb.add_option(
      "CAPTURE", captures,
      "pcap, pcapng or DLF files or snapshots, gzip'd or zstd'd too; - is the standard input. Each is "
      "surveyed by itself");
  verb.add_option(
          "--technology", technology,
          "IFX, Orvane_GSM, Orvane_CDMA, Orvane_LTE or Orvane_UTRAN2; otherwise found from the messages")
      ->type_name("TECH")
      ->transform(CLI::Validator(readTechnology, ""));
  verb.add_flag("--live", isLive, "survey the link to a telephony daemon instead of captures");
  format.addTo(verb);
  live.addTo(verb);
  verb.callback([this] {
    if (isLive && !captures.empty()) throw CLI::ValidationError("--live", "takes no CAPTURE");
    if (isLive && !technology.empty())
      throw CLI::ValidationError("--technology", "is told by the daemon with --live");
    if (!isLive && captures.empty()) throw CLI::RequiredError("CAPTURE or --live");
    if (!isLive && live.seconds) throw CLI::ValidationError("--seconds", "needs --live");
  });
}

void SurveyOptions::addJobsTo(CLI::App& verb) {
  verb.add_option("--jobs", jobs, "so many captures side by side; the output stays in their order")
      ->type_name("N")
      ->check(CLI::Validator(
          [](const std::string& text) {
            const bool isNumber = !text.empty() && text.size() <= 3 &&
                                  text.find_first_not_of("0123456789") == std::string::npos &&
                                  std::stoi(text) > 0;
            return isNumber ? std::string() : "\"" + text + "\" is no number of jobs from 1 to 999";
          },
          ""));
}

int runSurvey(const SurveyOptions& options, const SurveyUse& use) {
  if (!options.isLive) return surveyCaptures(options, use);
  LiveSurvey(options.live, use).run();
  return exitSuccess;
}

}  // namespace kelvasi
