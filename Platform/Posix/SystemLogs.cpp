// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/SystemLogs.h"

#include <syslog.h>
#include <unistd.h>

#include <algorithm>
#include <limits>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

namespace {

std::string_view withoutItsEnd(std::string_view text) {
  if (text.ends_with('\n')) text.remove_suffix(1);
  return text;
}

void complain(SystemLog& log, const LogLevel& level) {
  if (!level.complaint().empty()) log.write(LogPriority::warning, level.complaint());
}

}  // namespace

SyslogSystemLog::SyslogSystemLog(std::string identity, LogLevel level)
    : identity_(std::move(identity)), level_(std::move(level)) {
  ::openlog(identity_.c_str(), LOG_PID, LOG_USER);
  complain(*this, level_);
}

SyslogSystemLog::~SyslogSystemLog() {
  ::closelog();
}

void SyslogSystemLog::write(LogPriority priority, std::string_view text) {
  if (!wants(priority)) return;
  constexpr std::size_t most = std::numeric_limits<int>::max();
  const std::string_view line = withoutItsEnd(text);
  ::syslog(static_cast<int>(priority), "%.*s", static_cast<int>(std::min(line.size(), most)), line.data());
}

StderrSystemLog::StderrSystemLog(LogLevel level) : level_(std::move(level)) {
  complain(*this, level_);
}

void StderrSystemLog::write(LogPriority priority, std::string_view text) {
  if (!wants(priority)) return;
  std::string line = "<" + std::to_string(static_cast<int>(priority)) + ">";
  line += withoutItsEnd(text);
  line += '\n';
  // There is nowhere left to report a failure to.
  writeAll(STDERR_FILENO, {reinterpret_cast<const std::uint8_t*>(line.data()), line.size()});
}

std::unique_ptr<SystemLog> makeSystemLog(bool isStderr, const std::string& program, LogLevel level) {
  if (isStderr) return std::make_unique<StderrSystemLog>(std::move(level));
  return std::make_unique<SyslogSystemLog>(program, std::move(level));
}

}  // namespace kelvasi
