// SPDX-License-Identifier: Apache-2.0
// Log records as they arrive in the messages of the log channel.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "LogGenerator/LogCode.h"
#include "LogGenerator/RecordView.h"

namespace kelvasi {

struct FramedRecord {
  RecordView record;  // without the two-byte prefix; lasts as long as the message
  std::uint8_t logType = 0;
  LogCode logCode = 0;  // the effective one

  // A baseband record or one that the telephony daemon supplies.
  bool hasKnownType() const { return logType == 1 || logType == 0xFF; }
};

// Nothing when the message is shorter than a record header. The length is taken before the prefix is removed.
std::optional<FramedRecord> frameRecord(std::span<const std::uint8_t> message);

}  // namespace kelvasi
