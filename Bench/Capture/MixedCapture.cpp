// SPDX-License-Identifier: Apache-2.0
#include "Bench/Capture/MixedCapture.h"

#include <algorithm>
#include <stdexcept>

#include "Capture/PcapWriter.h"

namespace kelvasi::bench {

namespace {

using namespace std::chrono_literals;

std::string pathFor(const Technology& technology, std::size_t count) {
  std::string name(technology.name);
  std::ranges::replace(name, '/', '-');
  return std::string(KELVASI_BENCH_CAPTURES) + "/" + name + "-" + std::to_string(count) + ".pcap";
}

}  // namespace

std::string writeMixedCapture(const Technology& technology, std::size_t count) {
  const std::string path = pathFor(technology, count);
  PcapWriter writer(path, OutputFile::Existing::isReplaced);
  std::chrono::nanoseconds arrival = 1709647629s;
  for (const Bytes& message : mixtureOf(technology, count)) {
    if (!writer.write(message, arrival)) throw std::runtime_error(writer.error().value_or(path));
    arrival += 500us;
  }
  return path;
}

}  // namespace kelvasi::bench
