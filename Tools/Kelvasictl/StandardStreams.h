// SPDX-License-Identifier: Apache-2.0
// The standard streams of a tool whose standard output carries its result.
#pragma once

#include <string_view>

namespace kelvasi {

// To be called first. A standard stream that the tool was started without is occupied, so that no file takes
// its number; using it fails. Writing into a pipe that nobody reads, or past the size that a file may have,
// fails too, instead of ending the process.
void secureStandardStreams();

// Hands `text` to the system. Throws ToolError when that fails.
void printOut(std::string_view text);

// One line on the standard error, after the tool's name.
void complain(std::string_view text);

}  // namespace kelvasi
