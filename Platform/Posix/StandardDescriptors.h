// SPDX-License-Identifier: Apache-2.0
// The standard input, output and error of a program whose standard output carries its result.
#pragma once

#include <string>

namespace kelvasi {

// To be called first. A standard stream that the program was started without is occupied, so that no file
// takes its number; using it fails. Writing into a pipe that nobody reads, or past the size that a file may
// have, fails too, instead of ending the process.
void secureStandardDescriptors();

// From now on what goes to the standard output goes into this file, which is there: a pipe for one, whose
// reader is waited for. False, with errno set, when it cannot be.
bool redirectStandardOutput(const std::string& path);

}  // namespace kelvasi
