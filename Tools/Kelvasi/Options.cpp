// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Options.h"

#include <CLI/CLI.hpp>
#include <cstdlib>
#include <filesystem>
#include <stdexcept>

#include "Platform/Posix/PrivateFiles.h"

namespace kelvasi {

namespace {

std::string environment(const char* name) {
  const char* const value = std::getenv(name);
  return value ? value : "";
}

}  // namespace

void declareOptions(CLI::App& app, ViewerOptions& options) {
  app.add_flag("--fullscreen", options.fullScreen,
               "fill the screen; a window of 390 by 844 points otherwise");
  app.add_flag("--log-stderr", options.logsToStderr,
               R"(system-log lines go to the standard error, as "<N>text", instead of to syslog)");
  app.add_option_function<std::string>(
         "--appearance",
         [&options](const std::string& name) {
           options.colourScheme = name == "dark" ? ColourScheme::dark : ColourScheme::light;
         },
         "the desktop's otherwise")
      ->type_name("SCHEME")
      ->transform(CLI::IsMember({"dark", "light"}, CLI::ignore_case));
  app.add_option(
         "--script", options.script,
         "lead the window through the commands of a file (Docs/viewer-script.md); - is the standard input")
      ->type_name("FILE");
}

bool hasDisplay() {
  const auto isSet = [](const char* name) { return !environment(name).empty(); };
  return isSet("QT_QPA_PLATFORM") || isSet("WAYLAND_DISPLAY") || isSet("DISPLAY");
}

std::string makeLogDirectory() {
  const std::string configured = environment("KELVASI_LOG_DIRECTORY");
  if (!configured.empty()) return configured;
  const std::string state = environment("XDG_STATE_HOME");
  const std::string home = environment("HOME");
  if (state.empty() && home.empty())
    throw std::runtime_error(
        "nowhere to save snapshots: none of KELVASI_LOG_DIRECTORY, XDG_STATE_HOME and HOME is set");
  const std::filesystem::path directory = state.empty() ? std::filesystem::path(home) / ".local/state/kelvasi"
                                                        : std::filesystem::path(state) / "kelvasi";
  makeFolders(directory);  // a failure is told when a snapshot is saved
  return directory;
}

}  // namespace kelvasi
