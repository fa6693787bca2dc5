// SPDX-License-Identifier: Apache-2.0
// The system log: syslog(3), or the standard error for whoever watches the program run. Both write a text as
// it is: a line feed inside it stays, so a text with several lines, as a printed dictionary has, reads as it
// was composed. Only strings of received property lists can bring line feeds from outside.
#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "Platform/Posix/LogLevel.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

// Safe to use from several threads. One at a time: the connection to syslog is the process's.
class SyslogSystemLog final : public SystemLog {
 public:
  explicit SyslogSystemLog(std::string identity = "kelvasi", LogLevel level = LogLevel::fromEnvironment());
  ~SyslogSystemLog() override;
  SyslogSystemLog(const SyslogSystemLog&) = delete;
  SyslogSystemLog& operator=(const SyslogSystemLog&) = delete;

  bool wants(LogPriority priority) const override { return level_.passes(priority); }
  // The text goes as far as its first NUL.
  void write(LogPriority priority, std::string_view text) override;

 private:
  std::string identity_;  // syslog keeps a pointer to it
  LogLevel level_;
};

// Lines "<N>text", N the priority's number, each in one write. Safe to use from several threads.
class StderrSystemLog final : public SystemLog {
 public:
  explicit StderrSystemLog(LogLevel level = LogLevel::fromEnvironment());

  bool wants(LogPriority priority) const override { return level_.passes(priority); }
  void write(LogPriority priority, std::string_view text) override;

 private:
  LogLevel level_;
};

// Syslog's, under the program's name, or the standard error's.
std::unique_ptr<SystemLog> makeSystemLog(bool isStderr, const std::string& program,
                                         LogLevel level = LogLevel::fromEnvironment());

}  // namespace kelvasi
