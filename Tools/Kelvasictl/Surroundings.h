// SPDX-License-Identifier: Apache-2.0
// What a verb's generator stands on, and the options that choose it.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Platform/Platform.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/LogLevel.h"
#include "Platform/Posix/PackageResources.h"
#include "Platform/Posix/PosixClock.h"
#include "Platform/PushedClock.h"
#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"
#include "Tools/OptionSet.h"

namespace kelvasi {

struct SurroundingsOptions {
  std::optional<std::string> resources;
  bool logsToStderr = false;

  void addTo(OptionSet verb);
};

// The system log is syslog, or the standard error, where the traces then go too; otherwise they go nowhere.
class Surroundings {
 public:
  // Throws ToolError when the resources are not a directory. Lasts to the end of the process: the last words
  // of an uncaught exception go to its log.
  // KELVASI_LOG_LEVEL says what is logged, and `unasked` where it does not.
  explicit Surroundings(const SurroundingsOptions& options, const LogLevel& unasked = LogLevel());

  Platform platform() const { return platformWith(clock); }
  Platform platformWith(const Clock& other) const { return {*log, *trace, plists, resources, other}; }

  const std::unique_ptr<SystemLog> log;
  const std::unique_ptr<TraceOutput> trace;
  const LibplistSerialiser plists;
  const PackageResources resources;
  const PosixClock clock;
};

// Of a verb that is not live: the clock is the capture's, and of the thousands of traces of a drive, which
// say nothing of this machine, none goes to syslog unless that is asked for.
class OfflineSurroundings : public Surroundings {
 public:
  explicit OfflineSurroundings(const SurroundingsOptions& options);

  Platform platform() const { return platformWith(captureClock); }

  PushedClock captureClock;
};

}  // namespace kelvasi
