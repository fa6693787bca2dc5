#include "Tools/TelvonSim/WrittenDrive.h"

#include <filesystem>

#include "Capture/PcapWriter.h"
#include "Simulator/DrainedSource.h"
#include "Simulator/RecordStamp.h"

namespace kelvasi {

std::string writeCapture(sim::MessageSource& source, const Options& options) {
  std::error_code unknown;
  if (!options.isForced && std::filesystem::exists(options.write, unknown))
    return options.write + ": there is such a file already; --force overwrites it";
  PcapWriter capture(options.write);
  if (capture.error()) return *capture.error();
  const auto begin = sim::worldEpoch + options.startAt;
  sim::drain(source, options.faults, options.messages, [&](const sim::Message& message, sim::WorldTime at) {
    return capture.write(message.bytes, begin + at);
  });
  return capture.error().value_or("");
}

}  // namespace kelvasi
