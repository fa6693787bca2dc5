// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasi/Options.h"

#include <cstdlib>

#include "Platform/Posix/PrivateFiles.h"
#include "Tools/LogDirectory.h"

namespace kelvasi {

namespace {

std::string environment(const char* name) {
  const char* const value = std::getenv(name);
  return value ? value : "";
}

}  // namespace

void declareOptions(OptionSet app, ViewerOptions& options) {
  app.addFlag("--fullscreen", options.fullScreen, "fill the screen; a window of 390 by 844 points otherwise");
  app.addFlag("--terminal", options.isInTerminal,
              "run in the terminal, as `kelvasictl top` does; so it is without a display");
  app.addFlag("--log-stderr", options.logsToStderr,
              R"(system-log lines go to the standard error, as "<N>text", instead of to syslog)");
  app.addReader<std::string>(
         "--appearance",
         [&options](const std::string& name) {
           options.followsDesktop = name == "desktop";
           if (name == "dark") options.colourScheme = ColourScheme::dark;
           if (name == "light") options.colourScheme = ColourScheme::light;
         },
         "remembered for the next start; the desktop's unless stated")
      .type("SCHEME")
      .oneOfInAnyCase({"dark", "light", "desktop"});
  app.add("--text-scale", options.textScale,
          "how large texts are, 1 for as usual; the desktop's text size unless stated")
      .type("FACTOR")
      .between(0.5, 3, "from 0.5 to 3");
  app.add("--memory", options.memory,
          "remember window, panes and appearance in this file; a script remembers nothing without it")
      .type("FILE");
  app.add("--script", options.script,
          "lead the window through the commands of a file (Docs/viewer-script.md); - is the standard input")
      .type("FILE");
}

bool hasDisplay() {
  const auto isSet = [](const char* name) { return !environment(name).empty(); };
  return isSet("QT_QPA_PLATFORM") || isSet("WAYLAND_DISPLAY") || isSet("DISPLAY");
}

std::string memoryFile(const std::string& stated) {
  const auto directory = stateDirectory();
  if (!stated.empty() || !directory) return stated;
  makeFolders(*directory);  // without it nothing is remembered
  return *directory / "window.ini";
}

}  // namespace kelvasi
