// SPDX-License-Identifier: Apache-2.0
// A start command that asks for more than the display shows.
#pragma once

#include <span>

#include "LogGenerator/LogCode.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

// The command with these codes added to its lists, none of them twice. A command that names no code asks for
// everything already and comes back as it is.
PlistValue withLogCodes(PlistValue command, std::span<const LogCode> logCodes);

}  // namespace kelvasi
