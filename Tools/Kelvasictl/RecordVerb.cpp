// SPDX-License-Identifier: Apache-2.0
// kelvasictl record: a live link to a capture.

#include "Capture/PcapWriter.h"
#include "LogGenerator/Arrival.h"
#include "Model/MoreLogCodes.h"
#include "Platform/Clock.h"
#include "Tools/Kelvasictl/LiveSession.h"
#include "Tools/Kelvasictl/LogCodeOptions.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"
#include "Tools/OlderFile.h"

namespace kelvasi {

namespace {

struct RecordOptions {
  std::string file;
  LogCodeOptions logCodes;
  bool force = false;
  LiveOptions live;
};

const std::string& writable(const RecordOptions& options) {
  if (const std::string refusal = refusalOf(options.file, options.force); !refusal.empty())
    throw ToolError(refusal);
  return options.file;
}

// Messages are written as they come and are not decoded, so one that a decoder dies of is kept too.
class RecordVerb {
 public:
  explicit RecordVerb(const RecordOptions& options)
      : options_(options),
        writer_(writable(options), existing(options.force)),
        session_(options.live, [] {}) {
    if (writer_.error()) throw ToolError(*writer_.error());
    session_.model().changeStartCommand([codes = options.logCodes.all()](PlistValue command) {
      return withLogCodes(std::move(command), codes);
    });
    session_.model().divertMessages([this](std::span<const std::uint8_t> message) { take(message); });
  }

  int run() {
    try {
      session_.run();
    } catch (const ToolError&) {
      writer_.close();
      tellCount();
      throw;
    }
    if (!writer_.close()) throw ToolError(*writer_.error());
    tellCount();
    return exitSuccess;
  }

 private:
  void take(std::span<const std::uint8_t> message) {
    if (!writer_.write(message, arrivalAt(session_.clock().now())))
      return session_.end(std::make_exception_ptr(ToolError(*writer_.error())));
    ++count_;
    if (message.size() > PcapWriter::largestPacket) tellCut(message.size());
  }

  // Only the first is worth a line of its own.
  void tellCut(std::size_t size) {
    if (++cutCount_ > 1) return;
    complain("message " + std::to_string(count_) + " has " + std::to_string(size) +
             " bytes; a capture takes " + std::to_string(PcapWriter::largestPacket) + ", the rest is lost");
  }

  void tellCount() const {
    const std::string cut = cutCount_ == 0 ? "" : ", " + std::to_string(cutCount_) + " of them cut";
    const std::string untouched = writer_.hasOlder() ? ", which stays as it was" : "";
    complain(std::to_string(count_) + " messages recorded in " + options_.file + cut + untouched);
  }

  const RecordOptions& options_;
  PcapWriter writer_;
  LiveSession session_;
  std::uint64_t count_ = 0;
  std::uint64_t cutCount_ = 0;
};

}  // namespace

Action declareRecord(OptionSet verb) {
  const auto options = std::make_shared<RecordOptions>();
  verb.add("FILE", options->file, "the pcap file, which is created; - is the standard output").required();
  options->logCodes.addTo(verb);
  verb.addFlag("--force", options->force, "replace a file that is there, once the first message has come");
  options->live.addTo(verb);
  // Nothing is decoded, so nothing can fail to be shown.
  return [options](MessageTally&) { return RecordVerb(*options).run(); };
}

}  // namespace kelvasi
