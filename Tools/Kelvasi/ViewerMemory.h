// SPDX-License-Identifier: Apache-2.0
// What the viewer remembers from run to run, in an INI file: the window's size and whether it fills the
// screen, the panes that were open, the appearance that was asked for, and the cockpit's pins and alarms.
#pragma once

#include <QSize>
#include <optional>
#include <string>
#include <vector>

#include "Platform/QtWidgets/Palettes.h"

namespace kelvasi {

struct ViewerMemory {
  std::optional<QSize> windowSize;
  bool fillsScreen = false;
  std::vector<std::string> branches;  // names, from the root's child on
  std::optional<ColourScheme> colourScheme;
  std::vector<std::string> pins;
  std::vector<std::string> alarms;  // rules
};

// What the file does not hold, or holds in a form that makes no sense, is as it is in a new memory.
ViewerMemory readMemory(const std::string& file);
// Where the file cannot be written nothing is remembered.
void writeMemory(const std::string& file, const ViewerMemory& memory);

}  // namespace kelvasi
