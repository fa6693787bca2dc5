// SPDX-License-Identifier: Apache-2.0
// What the simulated daemon sends: log messages, each with what is needed to tell who wants it.
#pragma once

#include <chrono>
#include <optional>
#include <vector>

#include "LogGenerator/LogCode.h"
#include "Platform/MessagePort.h"
#include "Plist/PlistValue.h"

namespace kelvasi::sim {

// Time in the simulated world, since it began.
using WorldTime = std::chrono::microseconds;

struct Message {
  Bytes bytes;
  std::optional<LogCode> logCode;  // the effective one; nothing when the bytes are no log record
  MessageId id = 0;
};

using Messages = std::vector<Message>;

// A log message with id 0; its log code is that of the record's header.
Message logMessage(Bytes bytes);

}  // namespace kelvasi::sim
