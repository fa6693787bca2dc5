// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Commands.h"

namespace kelvasi::sim {

namespace {

constexpr std::string_view technologyKey = "GetTechnology";
constexpr std::string_view stateKey = "SetState";
constexpr std::string_view streamingState = "Streaming";
constexpr std::string_view missingTechnology = "kTelvonLogChannelTechnology_Missing";
constexpr std::int32_t errorDomain = 1;

std::optional<Bytes> serialised(const PlistSerialiser& plists, std::string_view key, std::string_view value) {
  return plists.serialiseXml(PlistDictionary::make({{std::string(key), value}}));
}

}  // namespace

Command parseCommand(const PlistSerialiser& plists, std::span<const std::uint8_t> bytes) {
  const auto parsed = plists.parse(bytes);
  const PlistDictionary* command = parsed ? parsed->dictionary() : nullptr;
  if (!command) return {};
  if (command->find(technologyKey)) return {.kind = Command::Kind::getTechnology};
  const PlistValue state = command->get(stateKey);
  if (!state.string()) return {};
  if (*state.string() != streamingState) return {.kind = Command::Kind::stop};
  return {.kind = Command::Kind::start, .subscription = Subscription::fromStartCommand(*command)};
}

std::optional<Bytes> technologyAnswer(const PlistSerialiser& plists, std::string_view technology,
                                      const Faults& faults) {
  if (faults.has(Fault::noAnswer)) return std::nullopt;
  if (faults.has(Fault::answerGarbage)) return Bytes{0xDE, 0xAD, 0xBE, 0xEF};
  if (faults.has(Fault::answerWithoutKey)) return serialised(plists, "Technology", technology);
  if (faults.has(Fault::unknownTechnology)) return serialised(plists, technologyKey, missingTechnology);
  return serialised(plists, technologyKey, technology);
}

std::optional<LogChannelAnswer> faultyChannelAnswer(std::string_view portName, const Faults& faults) {
  if (const auto code = faults.value(Fault::errorPair))
    return LogChannelAnswer{.error = {errorDomain, static_cast<std::int32_t>(*code)},
                            .portName = std::nullopt};
  if (faults.has(Fault::nullPort)) return LogChannelAnswer{.error = {}, .portName = std::nullopt};
  if (faults.has(Fault::emptyPort)) return LogChannelAnswer{.error = {}, .portName = ""};
  if (faults.has(Fault::deadPort)) return LogChannelAnswer{.error = {}, .portName = std::string(portName)};
  return std::nullopt;
}

}  // namespace kelvasi::sim
