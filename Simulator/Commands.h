// SPDX-License-Identifier: Apache-2.0
// The commands of an application, and the daemon's answers to them.
#pragma once

#include <optional>
#include <span>
#include <string_view>

#include "Platform/PlistSerialiser.h"
#include "Platform/TelephonyDaemon.h"
#include "Simulator/Faults.h"
#include "Simulator/Subscription.h"

namespace kelvasi::sim {

struct Command {
  enum class Kind { unknown, getTechnology, start, stop };

  Kind kind = Kind::unknown;
  Subscription subscription = {};  // of a start command
};

Command parseCommand(const PlistSerialiser& plists, std::span<const std::uint8_t> bytes);

// The reply's data; nothing for a reply without.
std::optional<Bytes> technologyAnswer(const PlistSerialiser& plists, std::string_view technology,
                                      const Faults& faults);

// The answer that a requested fault puts in place of a channel named `portName`; nothing when no fault does.
std::optional<LogChannelAnswer> faultyChannelAnswer(std::string_view portName, const Faults& faults);

}  // namespace kelvasi::sim
