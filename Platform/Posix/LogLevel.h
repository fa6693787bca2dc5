// SPDX-License-Identifier: Apache-2.0
// Which lines of the system log are written.
#pragma once

#include <string>
#include <string_view>

#include "Platform/SystemLog.h"

namespace kelvasi {

class LogLevel {
 public:
  // Everything is written.
  LogLevel() : highest_(7) {}
  // From a syslog level's name, "emerg" to "debug", or number, 0 to 7. Any other text is everything and a
  // complaint.
  explicit LogLevel(std::string_view text);
  // From KELVASI_LOG_LEVEL; `unasked` where it is not set or empty.
  static LogLevel fromEnvironment(const LogLevel& unasked = LogLevel());

  // A priority's level is its lowest three bits; the rest is a facility.
  bool passes(LogPriority priority) const { return (static_cast<int>(priority) & 7) <= highest_; }
  // For the log's first line; empty where there is nothing to complain about.
  const std::string& complaint() const { return complaint_; }

 private:
  int highest_;
  std::string complaint_;
};

}  // namespace kelvasi
