// SPDX-License-Identifier: Apache-2.0
// What the command line and the environment say.
#pragma once

#include <optional>
#include <string>

#include "Platform/QtWidgets/Palettes.h"
#include "Tools/OptionSet.h"

namespace kelvasi {

struct ViewerOptions {
  bool fullScreen = false;
  bool logsToStderr = false;
  bool isInTerminal = false;  // instead of a window
  std::optional<ColourScheme> colourScheme;
  bool followsDesktop = false;  // its colours, whatever was remembered
  std::optional<double> textScale;
  std::string memory;  // the name of a file for what is remembered; empty for the usual one
  std::string script;  // the name of a file; "-" for the standard input, empty for none
};

void declareOptions(OptionSet app, ViewerOptions& options);

// Whether a display is named, or Qt is told to do without one (QT_QPA_PLATFORM).
bool hasDisplay();

// Where what is remembered of the window is kept: `stated`, else window.ini where snapshots go by default.
// Empty for nowhere.
std::string memoryFile(const std::string& stated);

}  // namespace kelvasi
