// SPDX-License-Identifier: Apache-2.0
#include "Tools/LogDirectory.h"

#include <cstdlib>
#include <stdexcept>

#include "Platform/Posix/PrivateFiles.h"

namespace kelvasi {

namespace {

std::string environment(const char* name) {
  const char* const value = std::getenv(name);
  return value ? value : "";
}

}  // namespace

std::optional<std::filesystem::path> stateDirectory() {
  const std::string state = environment("XDG_STATE_HOME");
  const std::string home = environment("HOME");
  if (!state.empty()) return std::filesystem::path(state) / "kelvasi";
  if (!home.empty()) return std::filesystem::path(home) / ".local/state/kelvasi";
  return std::nullopt;
}

std::string makeLogDirectory() {
  const std::string configured = environment("KELVASI_LOG_DIRECTORY");
  if (!configured.empty()) return configured;
  const auto directory = stateDirectory();
  if (!directory)
    throw std::runtime_error(
        "nowhere to save snapshots: none of KELVASI_LOG_DIRECTORY, XDG_STATE_HOME and HOME is set");
  makeFolders(*directory);  // a failure is told when a snapshot is saved
  return *directory;
}

}  // namespace kelvasi
