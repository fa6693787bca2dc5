// SPDX-License-Identifier: Apache-2.0
// The system log. A line is asked for its priority before it is formatted, so a masked trace costs one test.
#pragma once

#include <cstdarg>
#include <string_view>

namespace kelvasi {

// Priority numbers of syslog (RFC 5424, section 6.2.1).
enum class LogPriority : int {
  emergency = 0,
  critical = 2,
  error = 3,
  warning = 4,
  notice = 5,
  info = 6,
  debug = 7,
  dlf = 16,  // what the DLF writer logs at: emergency level with a facility bit set
};

class SystemLog {
 public:
  virtual ~SystemLog() = default;

  // Whether a line of this priority is written at all.
  virtual bool wants(LogPriority priority) const = 0;
  // Writes one line; a line feed at its end counts as its end.
  virtual void write(LogPriority priority, std::string_view text) = 0;

  // Formats as printf does and writes, when the line is wanted.
  void print(LogPriority priority, const char* format, ...) __attribute__((format(printf, 3, 4)));
};

}  // namespace kelvasi
