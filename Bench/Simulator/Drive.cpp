// SPDX-License-Identifier: Apache-2.0
#include "Bench/Simulator/Drive.h"

#include <algorithm>
#include <array>
#include <stdexcept>
#include <string_view>

#include "Bench/Support/Text.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Simulator/DrainedSource.h"
#include "Simulator/Scenario.h"
#include "Simulator/ScenarioList.h"

namespace kelvasi::bench {

void playDrive(const Technology& technology, std::size_t count,
               const std::function<bool(const Bytes& message, sim::WorldTime at)>& take) {
  constexpr std::uint64_t seed = 1;  // telvon-sim's own
  const LibplistSerialiser plists;
  const sim::ScenarioKind* kind = sim::findScenario(technology.id, {});
  if (!kind) throw std::invalid_argument("no drive of " + std::string(technology.name));
  sim::ScenarioSource source([&] { return kind->make(seed, plists); });
  sim::drain(source, {}, count,
             [&](const sim::Message& message, sim::WorldTime at) { return take(message.bytes, at); });
}

Messages driveOf(const Technology& technology, std::size_t count) {
  Messages messages;
  messages.reserve(count);
  playDrive(technology, count, [&](const Bytes& message, sim::WorldTime) {
    messages.push_back(message);
    return true;
  });
  return messages;
}

std::span<const std::uint8_t> propertyListIn(std::span<const std::uint8_t> message) {
  const std::string_view text(reinterpret_cast<const char*>(message.data()), message.size());
  const std::size_t begin = std::min(text.find("<?xml"), text.find("bplist00"));
  return begin == text.npos ? std::span<const std::uint8_t>() : message.subspan(begin);
}

std::string nameOfDrive(const Technology& technology, const Messages& messages) {
  const auto lists = static_cast<double>(
      std::ranges::count_if(messages, [](const Bytes& message) { return !propertyListIn(message).empty(); }));
  const double share = 100 * lists / static_cast<double>(messages.size());
  return std::string(technology.name) + " drive, " + fixed(share, 1) + " % property lists";
}

}  // namespace kelvasi::bench
