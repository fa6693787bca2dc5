// SPDX-License-Identifier: Apache-2.0
// kelvasictl readings: every row that a message wrote or removed, a line each (Docs/readings.md).
#include <CLI/CLI.hpp>
#include <vector>

#include "Capture/CaptureInput.h"
#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/Decode.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/Progress.h"
#include "Tools/Kelvasictl/ReadingChanges.h"
#include "Tools/Kelvasictl/ReadingChoice.h"
#include "Tools/Kelvasictl/ReadingLines.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/Kelvasictl/TechnologyOption.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

struct ReadingsOptions {
  std::string technology;
  std::string format = "ndjson";
  bool onlyChanges = false;
  ReadingChoice choice;
  std::vector<std::string> captures;
  SurroundingsOptions surroundings;
};

class ReadingsVerb {
 public:
  explicit ReadingsVerb(const ReadingsOptions& options)
      : options_(options),
        surroundings_(options.surroundings),
        lines_(options.format == "csv" ? ReadingLines::Format::csv : ReadingLines::Format::ndjson) {}

  int run(MessageTally& tally) {
    Progress progress(options_.captures, Progress::Output::meanwhile);
    CaptureInput input(choice(), surroundings_.plists, complain,
                       [&](std::uint64_t messages, std::uint64_t bytes) { progress.add(messages, bytes); });
    output_ = lines_.heading();
    while (const auto message = input.next()) {
      if (!decode_) {
        input.keepTechnology(message->technology);
        start(message->technology);
      }
      decode_->take(*message);
      print();
    }
    printOut(output_);
    if (decode_) tally.add(decode_->intake());
    return input.hasFault() ? exitFault : exitSuccess;
  }

 private:
  CaptureInput::Choice choice() const {
    CaptureInput::Choice choice{.paths = options_.captures, .technology = {}};
    if (!options_.technology.empty()) choice.technology = options_.technology;
    return choice;
  }

  void start(std::string_view technology) {
    technology_ = shortTechnologyName(technology);
    auto generator = LogGenerator::generatorFromTechnology(technology, surroundings_.platform());
    if (!generator) throw ToolError("there is no generator for " + technology_);
    generator->gatherInto(&readings_);
    decode_.emplace(std::move(generator), surroundings_.captureClock, Decode::TickHandler());
  }

  // The readings of the last message.
  void print() {
    if (readings_.all().empty() || !options_.choice.takesMessageAt(readings_.arrival())) return;
    lines_.startMessage(readings_, technology_);
    if (options_.onlyChanges) {
      printChanges();
    } else {
      for (const Reading& reading : readings_.all()) printOne(reading);
    }
    constexpr std::size_t room = std::size_t{1} << 16;
    if (output_.size() < room) return;
    printOut(output_);
    output_.clear();
  }

  void printOne(const Reading& reading) {
    path_.clear();
    appendPath(path_, reading);
    if (options_.choice.takes(reading, path_)) lines_.append(output_, reading, path_, textOf(reading));
  }

  void printChanges() {
    std::vector<ReadingText> message;
    for (const Reading& reading : readings_.all()) {
      std::string path = pathOf(reading);
      if (options_.choice.takes(reading, path))
        message.push_back({&reading, std::move(path), textOf(reading)});
    }
    for (const ReadingText& change : changes_.of(std::move(message)))
      lines_.append(output_, *change.reading, change.path, change.text);
  }

  const ReadingsOptions& options_;
  OfflineSurroundings surroundings_;
  ReadingLines lines_;
  ReadingChanges changes_;
  Readings readings_;
  std::optional<Decode> decode_;
  std::string technology_;
  std::string path_;
  std::string output_;
};

}  // namespace

Action declareReadings(CLI::App& verb) {
  const auto options = std::make_shared<ReadingsOptions>();
  addTechnology(verb, options->technology);
  verb.add_option("--format", options->format, "ndjson (the default) or csv")
      ->type_name("FORMAT")
      ->check(CLI::IsMember({"ndjson", "csv"}));
  options->choice.addTo(verb);
  verb.add_flag("--changes", options->onlyChanges, "no line for a row that is written again as it stands");
  verb.add_option("CAPTURE", options->captures,
                  "pcap, pcapng or DLF files or snapshots, in order; - is the standard input")
      ->required();
  options->surroundings.addTo(verb);
  return [options](MessageTally& tally) { return ReadingsVerb(*options).run(tally); };
}

}  // namespace kelvasi
