// SPDX-License-Identifier: Apache-2.0
// The standard streams of a tool whose standard output carries its result.
#pragma once

#include <string_view>

namespace kelvasi {

// Hands `text` to the system. Throws OutputClosed when nobody reads it any more, ToolError when it fails.
void printOut(std::string_view text);

// One line on the standard error, after the tool's name.
void complain(std::string_view text);

}  // namespace kelvasi
