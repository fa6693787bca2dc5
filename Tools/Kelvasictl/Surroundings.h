// What a verb's generator stands on, and the options that choose it.
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Platform/Platform.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/PackageResources.h"
#include "Platform/Posix/PosixClock.h"
#include "Platform/SystemLog.h"
#include "Platform/TraceOutput.h"

namespace CLI {
class App;
}

namespace kelvasi {

struct SurroundingsOptions {
  std::optional<std::string> resources;
  bool logsToStderr = false;

  void addTo(CLI::App& verb);
};

// The system log is syslog, or the standard error, where the traces then go too; otherwise they go nowhere.
class Surroundings {
 public:
  // Throws ToolError when the resources are not a directory. Lasts to the end of the process: the last words
  // of an uncaught exception go to its log.
  explicit Surroundings(const SurroundingsOptions& options);

  Platform platform() { return {*log, *trace, plists, resources, clock}; }

  const std::unique_ptr<SystemLog> log;
  const std::unique_ptr<TraceOutput> trace;
  const LibplistSerialiser plists;
  const PackageResources resources;
  const PosixClock clock;
};

}  // namespace kelvasi
