// SPDX-License-Identifier: Apache-2.0
#include "Tools/TelvonSim/WrittenDrive.h"

#include "Capture/PcapWriter.h"
#include "Simulator/DrainedSource.h"
#include "Simulator/RecordStamp.h"
#include "Tools/OlderFile.h"

namespace kelvasi {

std::string writeCapture(sim::MessageSource& source, const SimulatorOptions& options) {
  if (std::string refusal = refusalOf(options.write, options.isForced); !refusal.empty()) return refusal;
  PcapWriter capture(options.write, existing(options.isForced));
  if (capture.error()) return *capture.error();
  const auto begin = sim::worldEpoch + options.startAt;
  sim::drain(source, options.faults, options.messages, [&](const sim::Message& message, sim::WorldTime at) {
    return capture.write(message.bytes, begin + at);
  });
  capture.close();
  return capture.error().value_or("");
}

}  // namespace kelvasi
