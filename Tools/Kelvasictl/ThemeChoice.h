// SPDX-License-Identifier: Apache-2.0
// Which colours `top` has.
#pragma once

#include <string>

#include "Platform/Terminal/Theme.h"

namespace kelvasi {

// "dark", "light", or the name of a file. Empty: terminal.theme in the user's settings, where it is there;
// else light where COLORFGBG says that the ground is, and dark. Throws ToolError with file and line of what
// makes no sense.
terminal::Theme chosenTheme(const std::string& choice);

}  // namespace kelvasi
