// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Surroundings.h"

#include <filesystem>
#include <system_error>

#include "Platform/Posix/SystemLogs.h"
#include "Platform/Posix/TerminateHandler.h"
#include "Platform/Posix/TraceOutputs.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

class NoTrace : public TraceOutput {
 public:
  void writeLine(std::string_view) override {}
};

std::unique_ptr<TraceOutput> makeTrace(bool isStderr) {
  if (isStderr) return std::make_unique<StandardErrorTrace>();
  return std::make_unique<NoTrace>();
}

std::filesystem::path resourcesDirectory(const SurroundingsOptions& options) {
  const std::filesystem::path directory =
      options.resources ? std::filesystem::path(*options.resources) : PackageResources::standardDirectory();
  std::error_code error;
  if (std::filesystem::is_directory(directory, error)) return directory;
  if (!error) error = std::make_error_code(std::errc::not_a_directory);
  throw ToolError(directory.native() + ": " + error.message() +
                  "; --resources or KELVASI_RESOURCES names where the display templates are");
}

}  // namespace

void SurroundingsOptions::addTo(OptionSet verb) {
  verb.add("--resources", resources, "where the display templates are (also KELVASI_RESOURCES)").type("DIR");
  verb.addFlag("--log-stderr", logsToStderr,
               R"(system-log lines go to the standard error, as "<N>text", instead of to syslog)");
}

Surroundings::Surroundings(const SurroundingsOptions& options, const LogLevel& unasked)
    : log(makeSystemLog(options.logsToStderr, "kelvasictl", LogLevel::fromEnvironment(unasked))),
      trace(makeTrace(options.logsToStderr)),
      resources(resourcesDirectory(options)) {
  installTerminateHandler(*log, options.logsToStderr ? "" : "kelvasictl");
}

OfflineSurroundings::OfflineSurroundings(const SurroundingsOptions& options)
    : Surroundings(options, options.logsToStderr ? LogLevel() : LogLevel("err")), captureClock(clock) {}

}  // namespace kelvasi
