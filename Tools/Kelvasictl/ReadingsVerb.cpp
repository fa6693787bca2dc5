// SPDX-License-Identifier: Apache-2.0
// kelvasictl readings: every row that a message wrote or removed, a line each (Docs/readings.md).
#include <vector>

#include "Tools/Kelvasictl/InputOptions.h"
#include "Tools/Kelvasictl/LiveRun.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/ReadingsRun.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

constexpr auto footer =
    R"(Several captures are one run: each begins with the display that the one before it left, and all are of the first
one's technology. With --jobs each is a run of its own, and the output is that of each capture alone, one after the
other; CSV has one heading. With --live lines come four times a second.)";

struct ReadingsOptions {
  InputOptions input;
  ReadingWish wish;
};

CaptureInput::Choice choiceOf(const ReadingsOptions& options, std::vector<std::string> paths) {
  CaptureInput::Choice choice{.paths = std::move(paths), .technology = {}};
  if (!options.input.technology.empty()) choice.technology = options.input.technology;
  return choice;
}

int readOneRun(const ReadingsOptions& options, MessageTally& tally) {
  const OfflineSurroundings surroundings(options.input.live.surroundings);
  Progress progress(options.input.captures, Progress::Output::meanwhile);
  ReadingsRun run(options.wish, surroundings, choiceOf(options, options.input.captures));
  run.run({printOut, complain,
           [&](std::uint64_t messages, std::uint64_t bytes) { progress.add(messages, bytes); }});
  if (run.intake()) tally.add(*run.intake());
  return run.hasFault() ? exitFault : exitSuccess;
}

int readEachByItself(const ReadingsOptions& options, MessageTally& tally) {
  const OfflineSurroundings surroundings(options.input.live.surroundings);
  const std::vector<std::string>& captures = options.input.captures;
  std::vector<std::unique_ptr<ReadingsRun>> runs(captures.size());
  bool isWhole = true;
  const auto work = [&](std::size_t at, const CaptureOutput& output) {
    runs[at] = std::make_unique<ReadingsRun>(options.wish, surroundings, choiceOf(options, {captures[at]}));
    runs[at]->run(output);
  };
  const auto deliver = [&](std::size_t at) {
    if (runs[at]->intake()) tally.add(*runs[at]->intake());
    isWhole = isWhole && !runs[at]->hasFault();
    runs[at].reset();
  };
  workOnCaptures(captures, *options.input.jobs, {work, deliver});
  return isWhole ? exitSuccess : exitFault;
}

int listen(const ReadingsOptions& options, MessageTally& tally) {
  ReadingPrinter printer(options.wish, printOut);
  LiveRun run(options.input.live,
              {.begin = [&](std::string_view technology) { printer.setTechnology(technology); },
               .take = [&](const Readings& message, const Intake&) { printer.take(message); },
               .finish = [&](const LogGenerator& generator) { tally.add(generator.intake()); },
               .look = [&](Arrival, bool) { printer.flush(); }});
  run.run();
  printer.flush();
  return exitSuccess;
}

int run(const ReadingsOptions& options, MessageTally& tally) {
  printOut(options.wish.lines().heading());
  if (options.input.isLive) return listen(options, tally);
  return options.input.jobs ? readEachByItself(options, tally) : readOneRun(options, tally);
}

}  // namespace

Action declareReadings(OptionSet verb) {
  const auto options = std::make_shared<ReadingsOptions>();
  options->input.addTo(verb, "Several are one run, in order, unless --jobs is given");
  options->input.addJobsTo(verb,
                           "each capture a run of its own, so many side by side; the output in their order");
  options->wish.addTo(verb);
  verb.setFooter(footer);
  return [options](MessageTally& tally) { return run(*options, tally); };
}

}  // namespace kelvasi
