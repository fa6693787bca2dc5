// SPDX-License-Identifier: Apache-2.0
// kelvasictl decode: captures in, the display out.
#include <array>
#include <filesystem>
#include <system_error>
#include <vector>

#include "Capture/CaptureInput.h"
#include "Model/SnapshotFile.h"
#include "Platform/Posix/Files.h"
#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/Decode.h"
#include "Tools/Kelvasictl/DisplayJson.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/Progress.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/Surroundings.h"
#include "Tools/Kelvasictl/TechnologyOption.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/TreeText.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

struct DecodeOptions {
  std::string technology;
  std::string format = "json";
  bool everyTick = false;
  bool startCommand = false;
  std::string dlf;
  std::string snapshot;
  std::string description;
  std::vector<std::string> captures;
  SurroundingsOptions surroundings;
};

std::string inXml(const PlistValue& value, const PlistSerialiser& plists) {
  if (value.isAbsent()) throw ToolError("there is no display to write as a property list");
  const auto xml = plists.serialiseXml(value);
  if (!xml) throw ToolError("the display cannot be written as a property list");
  return std::string(xml->begin(), xml->end());
}

struct Format {
  const char* name;
  std::string (*text)(const PlistValue& display, const PlistSerialiser& plists);
};
constexpr std::array formats{
    Format{"json", [](const PlistValue& display, const PlistSerialiser&) { return displayJson(display); }},
    Format{"tree", [](const PlistValue& display, const PlistSerialiser&) { return treeText(display); }},
    Format{"plist", inXml},
};

CaptureInput::Choice inputOf(const DecodeOptions& options) {
  CaptureInput::Choice choice{.paths = options.captures, .technology = {}};
  if (!options.technology.empty()) choice.technology = options.technology;
  return choice;
}

class DecodeVerb {
 public:
  explicit DecodeVerb(const DecodeOptions& options)
      : options_(options), surroundings_(options.surroundings) {}

  int run(MessageTally& tally) {
    if (options_.startCommand) {
      printOut(inXml(generatorFor(options_.technology)->getStartCommand(), surroundings_.plists));
      return exitSuccess;
    }
    if (!options_.technology.empty()) start(options_.technology);
    const bool isWhole = decodeCaptures();
    if (decode_) {
      decode_->finish();
      tally.add(decode_->intake());
    }
    const PlistValue display = decode_ ? decode_->display() : PlistValue();
    // Of a capture that could not be read, what was decoded before the fault and nothing else.
    if (!options_.everyTick && (isWhole || !display.isAbsent())) printDisplay(display);
    save(decode_ ? decode_->saveContents() : PlistValue());
    return isWhole ? exitSuccess : exitFault;
  }

 private:
  std::unique_ptr<LogGenerator> generatorFor(std::string_view technology) {
    auto generator = LogGenerator::generatorFromTechnology(technology, surroundings_.platform());
    if (!generator)
      throw ToolError("there is no generator for " + std::string(shortTechnologyName(technology)));
    return generator;
  }

  void start(std::string_view technology) {
    decode_.emplace(generatorFor(technology), surroundings_.captureClock, tickHandler());
  }

  // One display has one technology, that of the first message unless it is given.
  bool decodeCaptures() {
    Progress progress(options_.captures,
                      options_.everyTick ? Progress::Output::meanwhile : Progress::Output::atTheEnd);
    CaptureInput input(inputOf(options_), surroundings_.plists, complain,
                       [&](std::uint64_t messages, std::uint64_t bytes) { progress.add(messages, bytes); });
    while (const auto message = input.next()) {
      if (!decode_) {
        input.keepTechnology(message->technology);
        start(message->technology);
      }
      decode_->take(*message);
    }
    return !input.hasFault();
  }

  Decode::TickHandler tickHandler() const {
    if (!options_.everyTick) return {};
    return [](TickSchedule::Time time, const PlistValue& display) {
      printOut(tickJson(std::chrono::duration<double>(time).count(), display));
    };
  }

  void printDisplay(const PlistValue& display) const {
    for (const Format& format : formats) {
      if (options_.format == format.name) printOut(format.text(display, surroundings_.plists));
    }
  }

  void save(const PlistValue& saveContents) const {
    if (!options_.dlf.empty()) replace(options_.dlf, dlfIn(saveContents));
    if (options_.snapshot.empty()) return;
    const auto snapshot =
        snapshotDictionary(surroundings_.captureClock.now(), saveContents, options_.description);
    const auto xml = surroundings_.plists.serialiseXml(snapshot);
    if (!xml) throw ToolError(options_.snapshot + ": what is to be saved is no property list");
    replace(options_.snapshot, *xml);
  }

  const Bytes& dlfIn(const PlistValue& saveContents) const {
    const PlistArray* entries = saveContents.array();
    const PlistValue last = entries && !entries->empty() ? entries->at(entries->size() - 1) : PlistValue();
    const PlistValue* dlf = last.dictionary() ? last.dictionary()->find("DLF") : nullptr;
    if (!dlf || !dlf->data()) throw ToolError(options_.dlf + ": there is no DLF file to write");
    return *dlf->data();
  }

  static void replace(const std::string& path, const Bytes& bytes) {
    if (const FileError error = replaceFile(path, bytes)) throw ToolError(*error);
  }

  const DecodeOptions& options_;
  OfflineSurroundings surroundings_;
  std::optional<Decode> decode_;
};

// By whatever names; pipes and devices are not compared.
bool isSameFile(const std::string& capture, const std::string& output) {
  std::error_code error;
  return std::filesystem::equivalent(capture == "-" ? "/dev/stdin" : capture, output, error);
}

void refuseInput(const DecodeOptions& options, const char* option, const std::string& output) {
  for (const std::string& capture : options.captures) {
    if (isSameFile(capture, output)) throw WrongUsage(option, output + " is an input too");
  }
}

// A variable of a shell script that was never set is no wish for no file.
std::string named(const std::string& file) {
  return file.empty() ? "the file's name is empty" : "";
}

void addOptions(OptionSet verb, DecodeOptions& options) {
  addTechnology(verb, options.technology);
  verb.add("--format", options.format, "json (the default), tree (path TAB value), or plist")
      .type("FORMAT")
      .oneOf({"json", "tree", "plist"});
  verb.addFlag("--every-tick", options.everyTick,
               R"(a JSON line {"time": ..., "display": ...} for each display tick)");
  verb.add("--dlf", options.dlf, "also write the DLF file that a snapshot would hold")
      .type("FILE")
      .check(named);
  verb.add("--snapshot", options.snapshot, "also write a snapshot").type("FILE").check(named);
  verb.add("--description", options.description, "the snapshot's description").type("TEXT");
  verb.addFlag("--start-command", options.startCommand,
               "print the command that starts the stream, as a property list, and end");
  verb.add("CAPTURE", options.captures,
           "pcap, pcapng or DLF files or snapshots, in order; - is the standard input");
  options.surroundings.addTo(verb);
}

}  // namespace

Action declareDecode(OptionSet verb) {
  const auto options = std::make_shared<DecodeOptions>();
  addOptions(verb, *options);
  verb.setCheck([options] {
    if (!options->startCommand && options->captures.empty()) throw WrongUsage::missing("CAPTURE");
    if (options->startCommand && options->technology.empty())
      throw WrongUsage("--start-command", "needs --technology");
    if (options->everyTick && options->format != "json") throw WrongUsage("--every-tick", "gives JSON only");
    refuseInput(*options, "--dlf", options->dlf);
    refuseInput(*options, "--snapshot", options->snapshot);
  });
  return [options](MessageTally& tally) { return DecodeVerb(*options).run(tally); };
}

}  // namespace kelvasi
