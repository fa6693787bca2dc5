// SPDX-License-Identifier: Apache-2.0
// What the command line and the environment say.
#pragma once

#include <optional>
#include <string>

#include "Platform/QtWidgets/Palettes.h"

namespace kelvasi {

struct Options {
  bool fullScreen = false;
  bool logsToStderr = false;
  std::optional<ColourScheme> colourScheme;
  std::string script;  // the name of a file; "-" for the standard input, empty for none
};

struct CommandLine {
  std::optional<Options> options;  // none: end with `exitStatus`
  int exitStatus = 0;
};

// Explains itself on the standard streams where it is asked to or cannot make sense of the arguments.
CommandLine parseCommandLine(int argumentCount, const char* const* arguments);

// Whether a display is named, or Qt is told to do without one (QT_QPA_PLATFORM).
bool hasDisplay();

// Where snapshots go: $KELVASI_LOG_DIRECTORY; else kelvasi in $XDG_STATE_HOME or ~/.local/state, which is
// made. Throws std::runtime_error when none of the variables says where.
std::string makeLogDirectory();

}  // namespace kelvasi
