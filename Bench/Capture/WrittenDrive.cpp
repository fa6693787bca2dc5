// SPDX-License-Identifier: Apache-2.0
#include "Bench/Capture/WrittenDrive.h"

#include <algorithm>
#include <stdexcept>

#include "Bench/Simulator/Drive.h"
#include "Capture/PcapWriter.h"
#include "Simulator/RecordStamp.h"

namespace kelvasi::bench {

namespace {

std::string pathFor(const Technology& technology, std::size_t count) {
  std::string name(technology.name);
  std::ranges::replace(name, '/', '-');
  return std::string(KELVASI_BENCH_CAPTURES) + "/" + name + "-" + std::to_string(count) + ".pcap";
}

}  // namespace

std::string writeDrive(const Technology& technology, std::size_t count) {
  const std::string path = pathFor(technology, count);
  PcapWriter writer(path, OutputFile::Existing::isReplaced);
  playDrive(technology, count, [&](const Bytes& message, sim::WorldTime at) {
    return writer.write(message, sim::worldEpoch + at);
  });
  if (writer.error()) throw std::runtime_error(*writer.error());
  return path;
}

}  // namespace kelvasi::bench
